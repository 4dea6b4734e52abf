#pragma once

namespace lumora {

// Before the application is made: it needs no screen, and is silent about the folder in which screens are looked for.
void goWithoutScreen();

} // namespace lumora
