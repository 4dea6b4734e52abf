#pragma once

#include <QString>
#include <QStringList>

namespace lumora {

class Program;

// All that a person could stumble over in what the window shows now; each line names the control. Words of data, which
// customers have typed or their files are called, may stand in any language.
QStringList pageFaults(Program& program, const QString& data = {});

} // namespace lumora
