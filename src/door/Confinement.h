#pragma once

#include <QtGlobal>

namespace lumora {

struct DoorLimits {
    int seconds = 30;
    qint64 memory = qint64(1) << 30;
};

// Limits of this process: processor seconds and memory, no files of dumps; it ends with the one that started it.
bool limitMyself(const DoorLimits& limits);

// From here on this process may compute, take memory within its limit, begin threads, read and write what is open, and
// end. Any other call of the system kills it: no file is opened, no line, no program begun.
bool confineMyself();

} // namespace lumora
