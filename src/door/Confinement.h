#pragma once

#include <QtGlobal>

namespace lumora {

// The sanitizers map terabytes for their own use, and try memory with a pipe.
#if defined(__SANITIZE_ADDRESS__)
inline constexpr bool memoryIsLimited = false;
#elif defined(__has_feature)
inline constexpr bool memoryIsLimited = !__has_feature(address_sanitizer);
#else
inline constexpr bool memoryIsLimited = true;
#endif

struct DoorLimits {
    int seconds = 30;
    qint64 memory = qint64(1) << 30;
};

// Limits of this process: processor seconds and memory, no files of dumps; it ends with the parent, the process that
// started it, and this fails where the parent has ended already.
bool setLimits(const DoorLimits& limits, int parent);

// From here on this process may compute, take memory within its limit, begin threads, read and write what is open, and
// end. Any other call of the system kills it, but clone3, which fails as on an older system: no file is opened, no
// line, no program begun.
bool enterSandbox();

} // namespace lumora
