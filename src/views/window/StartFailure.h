#pragma once

#include <QString>

namespace lumora {

// A window of its own that tells why the program can't start, until the person closes it. Without a screen it does
// nothing.
void showStartFailure(const QString& text);

} // namespace lumora
