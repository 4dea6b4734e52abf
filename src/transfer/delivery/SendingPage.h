#pragma once

#include "session/Page.h"
#include "transfer/delivery/Countdown.h"
#include "transfer/delivery/SendingControls.h"
#include "transfer/delivery/SendingEvents.h"
#include "transfer/delivery/SendingPhase.h"

namespace lumora {

class PageChain;
struct Platform;
struct SessionState;

// What the gauge says: a sign, or how much of the ring is filled and the two texts within it.
struct SendingGauge {
    SendingSign sign;
    double share = 0; // 0 to 1
    QString large;
    QString small;
};

// What the two sending pages have in common: the phase, the table that says how each phase looks, the countdown, and
// the ways in and out. A page acts once it is in front, so that what it does is seen; made alone it sends nothing.
class SendingPage : public Page {
    Q_OBJECT
public:
    void Form_Activate(); // the page has come up

    SendingPhase phase() const { return m_phase; }
    const PhaseLook& look() const { return lookOf(m_phase); }
    SendingGauge gauge() const;
    const Countdown& countdown() const { return m_countdown; }
    const SendingControls& sendingControls() const { return m_shown; }

protected:
    SendingPage(PageId id, SessionState& state, const Platform& platform, PageChain& chain, SendingControls& shown,
                Countdown countdown);

    // The page's table by phase.
    virtual const PhaseLook& lookOf(SendingPhase phase) const = 0;
    // The advice of a row, its numbers filled in.
    virtual QString advice(const PhaseLook& row) const;
    // What else the phase changes.
    virtual void showPhase(const PhaseLook& row) = 0;
    // The page begins by itself.
    virtual void begin() = 0;
    // The customer leaves the page or the program: nothing more is sent.
    virtual void leave() = 0;

    void enter(SendingPhase phase);
    // The phase in the language of the session.
    void tellPhase();
    void tellReason(LineStep step, const Failure& failure, const QString& subject);
    void forgetReason();
    void leaveForNewOrder();
    void leaveProgram();

    QString wording(const char16_t* hebrew, const char16_t* english) const;
    QString wording(const SendingWords& words) const { return wording(words.hebrew, words.english); }

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    Countdown m_countdown;

private:
    void activateWhenFree();

    SendingControls& m_shown;
    SendingPhase m_phase = SendingPhase::Preparing;
    bool m_activated = false;
};

} // namespace lumora
