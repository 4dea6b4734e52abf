#pragma once

#include <QString>

namespace lumora {

struct Platform;
struct SessionState;

// What the lab lets its customers read: texts on this machine, which open inside the program, else pages of its site.
// With Careful, and on a kiosk, a message tells the customer what to do where no browser opens; as built in, the button
// then does nothing.
class LabPages {
public:
    LabPages(const SessionState& state, const Platform& platform)
        : m_state(state)
        , m_platform(platform) {}

    void openTerms() const;
    void openPriceList() const;
    void openSite() const;
    // False when the lab has no help of its own.
    bool openHelp() const;

private:
    void showText(const QString& file, const QString& title) const;
    void openAddress(const QString& url) const;
    void tellNotOpened(const QString& url) const;

    const SessionState& m_state;
    const Platform& m_platform;
};

} // namespace lumora
