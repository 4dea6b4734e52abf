#pragma once

#include <string_view>

// The process that decodes one file of a stranger. DoorDecoder starts it as: PROGRAM --child SECONDS BYTES PARENT, the
// last its own process id, with the source and the target as open files. It tells its end by its DoorStatus; whatever
// it says is not believed without a look.
namespace lumora {

inline constexpr std::string_view doorChildOption = "--child";
// In its place: makes the draft alone, or the small picture of a list.
inline constexpr std::string_view doorDraftOption = "--draft";
inline constexpr std::string_view doorListOption = "--list";
inline constexpr int doorSourceNumber = 3;
inline constexpr int doorTargetNumber = 4;

// The whole main() of the child; arguments as of main().
[[noreturn]] void runDoorChild(int argc, char** argv);

// Sets the limits that the arguments tell; false where that can't be done.
bool limitDoorChild(int argc, char** argv);

} // namespace lumora
