#pragma once

#include <QString>

namespace lumora {

// One line on standard error, for those who look after the station: what a customer needs no words for.
void writeWarning(const QString& text);

} // namespace lumora
