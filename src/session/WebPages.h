#pragma once

#include <QString>

namespace lumora {

struct Platform;
struct SessionState;

// The pages of the lab's site. With Careful, and on a kiosk, a message tells the customer what to do where none opens;
// as built in, the button then does nothing.
class WebPages {
public:
    WebPages(const SessionState& state, const Platform& platform)
        : m_state(state)
        , m_platform(platform) {}

    void open(const QString& url) const;

private:
    void tellNotOpened(const QString& url) const;

    const SessionState& m_state;
    const Platform& m_platform;
};

} // namespace lumora
