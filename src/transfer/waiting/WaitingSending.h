#pragma once

#include "order/WaitingOrders.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Ticker.h"

#include <chrono>
#include <optional>

namespace lumora {

class SendingPage;
struct Deployment;

// Sends the orders that wait, one at a time, while nobody is at the start page, where the lab has [Kiosk] Waiting. The
// pages of sending do it as they always do, in a chain and a session of their own that no window shows, and whose
// questions are answered with no. A press, or another page in front, cuts the line at once, but for a report.
class WaitingSending : public QObject {
    Q_OBJECT
public:
    // Without a press for so long, the start page is left alone, and a sending page that has nothing more to do is
    // left for it.
    static constexpr std::chrono::seconds aloneAfter{5};
    static constexpr std::chrono::minutes leftAfter{3};

    // chain: the pages that the customer sees.
    WaitingSending(SessionState& state, const Platform& platform, PageChain& chain, const Deployment& deployment);

    void Timer_Tick() { step(); } // each second
    // The page that sends just now, none while none does.
    SendingPage* page() const;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    // Nobody sees a box.
    class NoDialogs : public Dialogs {
    public:
        void message(const QString&, const QString&) override {}
        bool ask(const QString&, const QString&) override { return false; }
        DrivePath pickFile(const QString&, const DrivePath&, const QString&, Offer) override { return {}; }
        Result<void> showText(const HostPath&, const QString&) override { return {}; }
    };

    template <class P>
    void registerPage();
    void cameToFront(const Page& page);
    void pressed();
    void step();
    void beginNext();
    void endTry(SendingPage& page);
    void makeWay();
    void stop();
    void tellCount();
    bool isFree() const;

    SessionState& m_state;
    const Deployment& m_deployment;
    PageChain& m_chain;
    NoDialogs m_dialogs;
    Platform m_platform;
    SessionState m_own;
    PageChain m_pages;
    WaitingOrders m_orders;
    std::optional<OrderFolder> m_inHand;
    std::chrono::milliseconds m_lastPress{0}; // by the running clock
    Ticker m_timer;
};

} // namespace lumora
