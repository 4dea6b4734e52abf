#pragma once

#include "common/Result.h"
#include "door/Confinement.h"

#include <string_view>

// The process that decodes one file of a stranger. DoorDecoder starts it as: PROGRAM --child SECONDS BYTES, with the
// source and the target as open files. It tells its end by its status; whatever it says is not believed without a look.
namespace lumora {

inline constexpr std::string_view doorChildOption = "--child";
inline constexpr int doorSourceNumber = 3;
inline constexpr int doorTargetNumber = 4;

enum class DoorStatus {
    Done = 0,
    ProfileIgnored = 10,
    TooLarge = 11,
    Unsupported = 12,
    Damaged = 13,
    NotConfined = 14
};

// The whole main() of the child; arguments as of main(). Gives its status.
int runDoorChild(int argc, char** argv);

// Sets the limits that the arguments tell; false where that can't be done.
bool limitDoorChild(int argc, char** argv);

} // namespace lumora
