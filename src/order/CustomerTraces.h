#pragma once

#include "common/Result.h"

namespace lumora {

struct Platform;
struct SessionState;

// What a customer leaves on a kiosk beside the order itself: the session, the scratch files of the workspace,
// remembered details, the clipboard.
class CustomerTraces {
public:
    CustomerTraces(SessionState& state, const Platform& platform)
        : m_state(state)
        , m_platform(platform) {}

    // Only while no page works on the session. What an order needs that was not finished stays: it lies in the order's
    // folder and, for its pictures, in zmany\door. Files stay too while another program runs in the data folder. The
    // failure is the first of all that could not be removed; the rest is gone.
    Result<void> clear() const;

private:
    void clearSession() const;
    Result<void> clearFiles() const;

    SessionState& m_state;
    const Platform& m_platform;
};

} // namespace lumora
