#include "kiosk/IdleEnd.h"

#include "common/KioskRules.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/media/Cards.h"
#include "session/PageChain.h"

#include <QCoreApplication>

namespace lumora {

namespace {

constexpr int idleTick = 1000; // milliseconds

} // namespace

IdleEnd::IdleEnd(const KioskRules& rules, const Platform& platform, PageChain& chain)
    : m_platform(platform)
    , m_chain(chain)
    , m_watch(platform.clock, std::chrono::seconds(rules.idleSeconds))
    , m_timer(idleTick, [this] { step(); }) {
    if (!rules.on)
        return;
    connect(&platform.cards, &Cards::changed, this, &IdleEnd::sign);
    connect(&chain, &PageChain::shown, this, &IdleEnd::sign);
    connect(&chain, &PageChain::ended, this, [this] { m_timer.stop(); });
    QCoreApplication::instance()->installEventFilter(this);
    m_timer.start();
}

bool IdleEnd::eventFilter(QObject* watched, QEvent* event) {
    if (IdleWatch::isSignOfLife(event->type()))
        sign();
    return QObject::eventFilter(watched, event);
}

// The start page comes whatever is pressed meanwhile.
void IdleEnd::sign() {
    if (m_watch.phase() == IdleWatch::Phase::Over && m_chain.hasEnded())
        return;
    const bool asked = asks();
    m_watch.sign();
    if (asked)
        Q_EMIT changed();
}

// A handler that works on, behind a page or a box, is waited for as a page is; one that waits for an answer is not.
IdleWatch::Silence IdleEnd::silence() const {
    using enum IdleWatch::Silence;
    const Page* front = m_chain.front();
    const bool waits = m_platform.dialogs.isWaiting();
    if (!front || (!waits && (m_chain.isAnyWorking() || m_platform.pump.pumping())))
        return MayNotEnd;
    if (front->id() != PageId::hatchala)
        return front->isAtRest() && !waits ? IsEnough : IsAsked;
    return front->isUntouched() && !waits ? NeedsNone : IsEnough;
}

void IdleEnd::step() {
    const IdleWatch::Phase before = m_watch.phase();
    if (before == IdleWatch::Phase::Over) {
        m_platform.dialogs.closeAll(); // one box may have brought another
        return;
    }
    const IdleWatch::Phase now = m_watch.look(silence());
    if (now == IdleWatch::Phase::Over && m_chain.isAnyWorking()) {
        m_platform.dialogs.closeAll(); // the page may have waited for the answer alone
        m_watch.sign();
    } else if (now == IdleWatch::Phase::Over) {
        if (Page* front = m_chain.front())
            front->leftAlone();
        m_platform.dialogs.closeAll();
        m_chain.goToStart();
    }
    if (before != now || now == IdleWatch::Phase::Asking)
        Q_EMIT changed();
}

} // namespace lumora
