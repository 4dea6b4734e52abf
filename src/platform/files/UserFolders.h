#pragma once

#include "platform/files/HostPath.h"

namespace lumora {

// A base folder of the user by the desktop's rules (XDG Base Directory): what the variable names, or else the folder
// below the home folder. A variable counts only when it holds a whole path.
HostPath userFolder(const char* variable, const char* belowHome);

} // namespace lumora
