#pragma once

#include "kiosk/IdleWatch.h"
#include "session/Ticker.h"

#include <QObject>

namespace lumora {

class PageChain;
struct KioskRules;
struct Platform;

// Brings a kiosk back to its start page when nobody is there any more. Each press, key and card is a sign of life,
// while a page prepares or sends an order nobody is missed, and boxes that wait for an answer are closed with no.
class IdleEnd : public QObject {
    Q_OBJECT
public:
    IdleEnd(const KioskRules& rules, const Platform& platform, PageChain& chain);

    void Timer_Tick() { step(); } // each second
    void stay() { sign(); }       // the question is answered
    bool asks() const { return m_watch.phase() == IdleWatch::Phase::Asking; }
    int secondsLeft() const { return m_watch.secondsLeft(); }

Q_SIGNALS:
    void changed(); // of the question

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void sign();
    void step();
    IdleWatch::Silence silence() const;

    const Platform& m_platform;
    PageChain& m_chain;
    IdleWatch m_watch;
    Ticker m_timer;
};

} // namespace lumora
