#include "transfer/waiting/WaitingSending.h"

#include "editing/editor/gdisave.h"
#include "platform/Machine.h"
#include "session/lab/ClientProfile.h"
#include "session/lab/Deployment.h"
#include "transfer/delivery/SendingPage.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/http/UploadForm.h"
#include "transfer/report/InetForm.h"

#include <QCoreApplication>
#include <QEvent>
#include <QThread>

namespace lumora {

namespace {

constexpr int waitingTick = 1000; // milliseconds

bool isStartPage(const Page* page) {
    return page && page->id() == PageId::hatchala;
}

} // namespace

template <class P>
void WaitingSending::registerPage() {
    m_pages.registerPage(P::pageId, [this] { return std::make_unique<P>(m_own, m_platform, m_pages); });
}

WaitingSending::WaitingSending(SessionState& state, const Platform& platform, PageChain& chain,
                               const Deployment& deployment)
    : m_state(state)
    , m_deployment(deployment)
    , m_chain(chain)
    , m_platform{platform.files,     m_dialogs,      platform.internet, platform.mail,
                 platform.shell,     platform.clock, platform.pump,     platform.volume,
                 platform.instances, platform.cards, platform.printer,  platform.doorProgram}
    , m_pages(platform.pump)
    , m_orders(state, m_platform)
    , m_timer(waitingTick, [this] { step(); }) {
    registerPage<FtpFrm>();
    registerPage<UploadForm>();
    registerPage<InetForm>();
    registerPage<gdisave>();
    connect(&chain, &PageChain::shown, this, [this](const Page* page) { cameToFront(*page); });
    connect(&chain, &PageChain::ended, this, [this] {
        m_timer.stop();
        stop();
    });
    QCoreApplication::instance()->installEventFilter(this);
}

SendingPage* WaitingSending::page() const {
    return m_inHand ? static_cast<SendingPage*>(m_pages.front()) : nullptr;
}

// The start page has read the lab's file by now.
void WaitingSending::cameToFront(const Page& page) {
    makeWay();
    if (!m_state.Waiting)
        return;
    m_lastPress = m_platform.clock.running();
    if (isStartPage(&page)) {
        m_orders.refresh();
        tellCount();
        m_timer.start();
    }
}

bool WaitingSending::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::TouchBegin:
    case QEvent::TabletPress:
    case QEvent::Wheel:
    case QEvent::KeyPress:
        pressed();
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

void WaitingSending::pressed() {
    m_lastPress = m_platform.clock.running();
    makeWay();
}

// A report that was cut is never made again, and it is short.
void WaitingSending::makeWay() {
    const SendingPage* sending = page();
    if (!sending || sending->phase() != SendingPhase::Reporting)
        stop();
}

// No handler and no question is under way, nor a sending that was cut and has not yet come back.
bool WaitingSending::isFree() const {
    return !m_platform.pump.pumping() && QThread::currentThread()->loopLevel() <= 1;
}

void WaitingSending::step() {
    if (SendingPage* sending = page()) {
        if (sending->hasEnded())
            endTry(*sending);
        return;
    }
    const auto alone = m_platform.clock.running() - m_lastPress;
    if (auto* shown = dynamic_cast<SendingPage*>(m_chain.front())) {
        if (!shown->isAtRest())
            m_lastPress = m_platform.clock.running();
        else if (alone >= leftAfter && isFree())
            shown->leaveUnattended();
    } else if (isStartPage(m_chain.front()) && alone >= aloneAfter && isFree() && m_orders.due()) {
        beginNext();
    }
}

// What was read of the orders before a sending that was stopped no longer holds.
void WaitingSending::beginNext() {
    m_orders.refresh();
    const std::optional<UnfinishedOrder> order = m_orders.due();
    if (!order)
        return;
    m_own = {};
    m_own.DiskRoot = m_state.DiskRoot;
    m_own.SugTzad = m_state.SugTzad;
    LoadDefaultProfile(m_own, m_deployment);
    m_inHand = order->folder;
    if (!GoOnWithOrder(*order, m_own, m_platform.files, m_pages, PageId::hatchala))
        m_inHand.reset();
}

void WaitingSending::endTry(SendingPage& page) {
    const BothLanguages why = page.whyItEnded();
    const OrderFolder folder = *std::exchange(m_inHand, std::nullopt);
    m_pages.unload(page.id());
    m_orders.ended(folder, why);
    tellCount();
}

// The page cuts its line as it is taken away, and is deleted once its handlers have returned.
void WaitingSending::stop() {
    if (!m_inHand)
        return;
    m_inHand.reset();
    if (const Page* sending = m_pages.front())
        m_pages.unload(sending->id());
}

void WaitingSending::tellCount() {
    m_state.waitingOrders = m_orders.count();
    if (Page* start = m_chain.find(PageId::hatchala))
        start->setTexts();
}

} // namespace lumora
