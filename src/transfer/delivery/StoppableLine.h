#pragma once

#include "platform/Platform.h"
#include "platform/line/Internet.h"

namespace lumora {

// While this lives, clicks run inside the calls of the line, so that one of them may stop the sending.
class StoppableLine {
public:
    explicit StoppableLine(const Platform& platform)
        : m_internet(platform.internet)
        , m_before(m_internet.pumpWhileWaiting(&platform.pump)) {}
    ~StoppableLine() { m_internet.pumpWhileWaiting(m_before); }
    StoppableLine(const StoppableLine&) = delete;
    StoppableLine& operator=(const StoppableLine&) = delete;

private:
    Internet& m_internet;
    EventPump* m_before; // pump of the outer call, set again at the end
};

} // namespace lumora
