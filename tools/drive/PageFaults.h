#pragma once

#include <QStringList>

namespace lumora {

class Program;

// All that a person could stumble over in what the window shows now; each line names the control.
QStringList pageFaults(Program& program);

} // namespace lumora
