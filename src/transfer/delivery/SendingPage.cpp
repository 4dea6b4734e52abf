#include "transfer/delivery/SendingPage.h"

#include "common/StationLog.h"
#include "common/Warning.h"
#include "imaging/drawing/QrCode.h"
#include "order/CompletenessGuard.h"
#include "order/KeptWork.h"
#include "order/LeftOutPictures.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "order/OrderNames.h"
#include "order/WaitingOrders.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/WayBack.h"
#include "transfer/delivery/OrderFacts.h"
#include "transfer/delivery/SendingTexts.h"
#include "transfer/report/LabReport.h"
#include "transfer/report/ReportOnce.h"
#include "transfer/slip/OrderSlip.h"

#include <QPointer>
#include <QTimer>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Milliseconds.
constexpr int pumpRetry = 20;
constexpr int reportTick = 1000;

} // namespace

SendingPage::SendingPage(PageId id, SessionState& state, const Platform& platform, PageChain& chain,
                         SendingControls& shown, Countdown countdown)
    : Page(id)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_countdown(countdown)
    , m_shown(shown)
    , m_leftOut(id, state, chain, shown.leftOut)
    , Timer4Report(reportTick, [this] { watchReport(); })
    , m_previews(platform.files) {
    connect(&m_previews, &PrintPreviews::ready, this, &SendingPage::changed);
    connect(&chain, &PageChain::shown, this, [this](Page* page) {
        if (page == this)
            QTimer::singleShot(0, this, &SendingPage::activateWhenFree);
    });
    if (state.transfer.SugMishloah != Sending::NewOrder)
        readLeftOut();
    connect(&platform.cards, &Cards::changed, this, [this] {
        showCardMayGo();
        Q_EMIT changed();
    });
    // The window may be closed or the page unloaded inside a pump of a sending, which must not go on unseen.
    connect(&chain, &PageChain::ended, this, [this] { leave(); });
    connect(&chain, &PageChain::unloaded, this, [this](Page* page) {
        if (page == this)
            leave();
    });
}

// The customer was asked when the order was new.
void SendingPage::readLeftOut() {
    const std::optional<OrderLog> log = ReadOrderLog(m_platform.files, OrderFolder::chosen(m_state));
    m_state.transfer.leftOut = LeftOutOf(log ? log->failed : QStringList());
    m_state.transfer.leftOutAsked = true;
}

// While the page before still runs a pump, clicks would not reach this page.
void SendingPage::activateWhenFree() {
    if (m_platform.pump.pumping())
        QTimer::singleShot(pumpRetry, this, &SendingPage::activateWhenFree);
    else
        activate();
}

void SendingPage::activate() {
    if (m_activated)
        return;
    m_activated = true;
    const OrderJournal order(m_platform.files, OrderFolder::chosen(m_state));
    m_slipAsked = order.known() && order.state().phase >= OrderState::Phase::Arrived; // by an earlier run
    if (m_leftOut.isDue())
        m_leftOut.open();
    begin();
}

const PhaseLook& SendingPage::look() const {
    const auto rows = looks();
    return *std::find_if(rows.begin(), rows.end() - 1, [&](const PhaseLook& row) { return row.phase == m_phase; });
}

QString SendingPage::wording(const char16_t* hebrew, const char16_t* english) const {
    return m_state.wording(hebrew, english);
}

QString SendingPage::advice(const PhaseLook& row) const {
    if (m_lacking && row.phase == SendingPhase::Reporting)
        return wording(fewerReportingWords);
    if (m_lacking && row.phase == SendingPhase::AllThere)
        return wording(report().wasTold()      ? fewerToldWords
                       : report().isUnwanted() ? fewerArrivedWords
                                               : fewerUntoldWords)
            .arg(m_lacking->sent())
            .arg(m_lacking->named.value_or(0));
    return wording(row.advice);
}

// An order that lacks chosen pictures is not called whole.
QString SendingPage::adviceOf(const PhaseLook& row) const {
    if (row.phase == SendingPhase::Waiting && isAnswerAwaited())
        return wording(answerAwaitedAdvice);
    if (row.phase == SendingPhase::Success && m_state.Careful && report().isEndUnknown())
        return wording(untoldAdvice);
    if (!mayBeClosed() && row.phase == SendingPhase::Sending)
        return wording(kioskSendingAdvice);
    if (!mayBeClosed() && row.phase == SendingPhase::Refused)
        return wording(kioskRefusedAdvice);
    if (goesOnByItself(row.phase)) {
        const QString phone = m_state.profile.LabPhone.trimmed();
        return wording(goesOnByItselfAdvice) + (phone.isEmpty() ? phone : wording(labPhoneAdvice).arg(phone));
    }
    const bool lacksChosen = !m_state.transfer.leftOut.isEmpty();
    if (lacksChosen && row.phase == SendingPhase::Reporting)
        return wording(partReportingAdvice);
    const bool countIsTold = m_lacking && row.phase == SendingPhase::AllThere;
    if (!row.tellsWhole || countIsTold)
        return advice(row);
    if (!mayBeClosed())
        return wording(lacksChosen ? kioskPartSentAdvice : kioskSentAdvice);
    return lacksChosen ? wording(partSentAdvice) : advice(row);
}

bool SendingPage::mayBeClosed() const {
    return !m_state.closedToCustomers();
}

bool SendingPage::goesOnByItself(SendingPhase phase) const {
    if (phase != SendingPhase::NotAll && phase != SendingPhase::Unclear && phase != SendingPhase::Stopped)
        return false;
    const QList<CountedOrder> waiting = OrdersThatWait(m_state, m_platform);
    return std::any_of(waiting.begin(), waiting.end(), [this](const CountedOrder& one) {
        return one.byItself && one.order.folder.path() == m_state.transfer.OrderFolder;
    });
}

void SendingPage::goOnWithout() {
    if (!m_leftOut.isOpen())
        return;
    const bool awaited = isAnswerAwaited();
    m_leftOut.goOnWithout();
    if (awaited && m_phase == SendingPhase::Waiting)
        startCount();
    Q_EMIT changed();
}

Bitmap SendingPage::smallLeftOut(int index, int cell) const {
    return SmallLeftOut(m_state, m_platform.files, index, cell);
}

// Nothing has left the machine before the order is listed; a step by hand may still write into its folder.
void SendingPage::goBack() {
    const bool busy = isUnderWay(m_phase) || (lineInUse() && m_phase != SendingPhase::Preparing);
    if (busy || !m_leftOut.isOpen())
        return;
    bringWorkBack();
    if (m_leftOut.goBack())
        TakeOrderBack(m_state, m_platform);
}

// An order that was made in another run.
void SendingPage::bringWorkBack() const {
    if (const OrderFolder order = OrderFolder::chosen(m_state); m_state.handOver.takenUp == order.path())
        KeptWork(m_state, m_platform.files, order).bringBack();
}

void SendingPage::endWayBack() {
    m_wayBack = false;
    m_leftOut.endWayBack();
}

bool SendingPage::mayChange() const {
    const bool counts = m_phase == SendingPhase::Countdown || m_phase == SendingPhase::Waiting;
    if (!counts || !m_wayBack || lineInUse() || m_leftOut.isOpen() ||
        m_state.transfer.SugMishloah != Sending::NewOrder || !leadsToPictures(id(), m_state, m_chain))
        return false;
    const Result<OrderState> order = ReadOrderState(m_platform.files, OrderFolder::chosen(m_state));
    return !order || order->phase < OrderState::Phase::Sending;
}

// What was made of the pictures and copied from a card stays until a sending begins, so that the order finds it again.
void SendingPage::change() {
    if (!mayChange())
        return;
    stopTimers();
    bringWorkBack();
    if (goBackToPictures(id(), m_state, m_chain))
        TakeOrderBack(m_state, m_platform);
}

void SendingPage::enter(SendingPhase phase) {
    m_phase = phase;
    writeLog(u"sending %1: %2"_s.arg(OrderFolder::chosen(m_state).name(), phaseName(phase)));
    if (isUnderWay(phase))
        endWayBack();
    readPrints();
    watchCards();
    tellPhase();
    printSlip();
    Q_EMIT changed();
}

void SendingPage::tellPhase() {
    const PhaseLook& row = look();
    m_shown.Label4Title.text = wording(row.title);
    m_shown.Label4Do.text = adviceOf(row);
    m_leftOut.show();
    m_shown.Label4Order.text = wording(u"ההזמנה שלכם", u"Your order");
    m_shown.Command28.visible = row.buttons.testFlag(SendingButton::NewOrder);
    m_shown.Image3.text = mayBeClosed() ? wording(u"סגור", u"Close") : wording(toFirstPageWords);
    m_shown.Image3.visible = mayBeClosed() || !m_shown.Command28.visible; // a new order begins on the first page
    m_shown.changeOrder.text = wording(changeWords);
    m_shown.changeOrder.visible = row.buttons.testFlag(SendingButton::Change) && mayChange();
    showReporting();
    showFacts();
    showThanks();
    showPhase(row);
}

void SendingPage::showPrints() {
    m_isLookedAt = true;
    readPrints();
}

void SendingPage::readPrints() {
    const OrderFolder order = OrderFolder::chosen(m_state);
    if (m_isLookedAt && hasOrder(m_phase) && order.isChosen())
        m_previews.read(order, PrintFileShape::of(m_state.profile));
}

// The details of an order that is sent again are read from its log by FTP alone; else the session's are another's.
bool SendingPage::knowsCustomer() const {
    return m_state.transfer.SugMishloah == Sending::NewOrder || id() == PageId::FtpFrm;
}

void SendingPage::showFacts() {
    QList<OrderFact> facts = hasOrder(m_phase) && knowsCustomer() ? OrderFacts(m_state) : QList<OrderFact>();
    if (isThanked(m_phase))
        facts.prepend({wording(u"תאריך", u"Date"), m_platform.clock.now().date().toString(u"dd/MM/yyyy"_s)});
    for (qsizetype i = 0; i < mostFacts; ++i) {
        const auto at = static_cast<std::size_t>(i);
        const OrderFact fact = facts.value(i);
        m_shown.factName[at].text = fact.name;
        m_shown.fact[at].text = fact.text;
        m_shown.factName[at].visible = m_shown.fact[at].visible = !fact.text.isEmpty();
    }
}

void SendingPage::showThanks() {
    const QString name = knowsCustomer() ? CalledName(m_state) : QString();
    const bool thanked = isThanked(m_phase);
    const bool printsNext = m_phase == SendingPhase::Success && !(m_state.Careful && report().isEndUnknown());
    m_shown.thanks.visible = thanked;
    m_shown.thanks.text = name.isEmpty() ? wording(thanksWords) : wording(thanksByNameWords).arg(name);
    m_shown.shortNumber.text = ShortNumber(OrderFolder::chosen(m_state).name());
    m_shown.nextSteps.visible = thanked && printsNext;
    m_shown.nextSteps.text = wording(nextStepsWords);
    m_shown.slip.visible = thanked && m_slipTaken;
    m_shown.slip.text = wording(slipTakenWords);
    m_shown.slipCode.visible = thanked && knowsCustomer() && (m_state.kiosk.on || !m_state.kiosk.printer.isEmpty());
    m_shown.slipCode.text = wording(slipCodeWords);
    showCardMayGo();
}

Bitmap SendingPage::slipCode() const {
    return m_shown.slipCode.visible ? qrCode(OrderSlip::codeOf(m_state), 1) : Bitmap();
}

// For a customer who stands before the page, once. What becomes of it is told to the staff, who see the start page.
void SendingPage::printSlip() {
    const QString queue = m_state.kiosk.printer;
    if (m_slipAsked || !m_isLookedAt || !isThanked(m_phase) || queue.isEmpty() ||
        m_state.transfer.SugMishloah != Sending::NewOrder)
        return;
    m_slipAsked = true;
    m_platform.printer.print(
        queue, OrderSlip(m_state).pdf(),
        [page = QPointer(this), queue, &state = m_state, &chain = m_chain](const Result<void>& done) {
            state.slipTrouble = done ? QString() : done.failure().message;
            if (!done)
                writeWarning(u"the slip can't be printed on \"%1\": %2"_s.arg(queue, done.failure().message));
            if (page)
                page->slipHandedOver(done.ok());
            chain.setAllTexts();
        });
}

void SendingPage::slipHandedOver(bool taken) {
    m_slipTaken = taken;
    showThanks();
    Q_EMIT changed();
}

void SendingPage::watchCards() {
    const bool ofCustomer = m_state.transfer.SugMishloah == Sending::NewOrder;
    if (!ofCustomer || !m_isLookedAt || !isThanked(m_phase) || !m_platform.cards.areWatched())
        m_cardWatch.reset();
    else if (!m_cardWatch)
        m_cardWatch.emplace(m_platform.cards);
}

// A card that is still being counted is read by this program.
void SendingPage::showCardMayGo() {
    const std::vector<Cards::Card> cards = m_cardWatch ? m_platform.cards.all() : std::vector<Cards::Card>();
    const auto isCounted = [](const Cards::Card& card) { return card.summary.has_value(); };
    m_shown.cardMayGo.visible = !cards.empty() && std::ranges::all_of(cards, isCounted);
    m_shown.cardMayGo.text = wording(cardMayGoWords);
}

void SendingPage::showReporting() {
    m_shown.Label4Hokhaha.text = wording(byNamesOnlyWords);
    m_shown.Label4Dooach.text = wording(reportUnknownWords);
    m_shown.Command4Dooach.text = wording(reportAgainWords);
    m_shown.Label4Hokhaha.visible = provenByNameOnly();
    m_shown.Label4Dooach.visible = reportUnknown();
    m_shown.Command4Dooach.enabled = mayReportAgain();
}

SendingGauge SendingPage::gauge() const {
    const SendingSign sign = look().sign;
    switch (sign) {
    case SendingSign::Seconds:
        return {sign, m_countdown.share(), QString::number(m_countdown.seconds()), wording(u"שניות", u"seconds")};
    case SendingSign::Percent:
        return {sign, m_shown.percent / 100.0, u"%1%"_s.arg(m_shown.percent), wording(u"נשלחו", u"sent")};
    case SendingSign::Asking: // after a pass the ring stays full
        return {sign, m_phase == SendingPhase::Checking ? 1.0 : 0.0, u"…"_s, wording(u"בודקים", u"checking")};
    default:
        return {sign, 1, {}, {}};
    }
}

void SendingPage::tellReason(LineStep step, const Failure& failure, const QString& subject) {
    m_trouble = {step, failure, subject};
    writeLog(u"sending: failure %1"_s.arg(LineErrorNumber(failure.kind)), failure);
    m_reason = LineTroubleText(m_state, step, failure, subject);
    m_shown.Label4Reason.text = m_reason;
    m_shown.Label4Reason.hint = failure.message;
    m_shown.Label4Reason.visible = true;
    Q_EMIT changed();
}

bool SendingPage::hasEnded() const {
    return !isUnderWay(m_phase) && m_phase != SendingPhase::Preparing && m_phase != SendingPhase::Countdown;
}

BothLanguages SendingPage::whyItEnded() const {
    if (m_phase == SendingPhase::Refused && m_refusal)
        return *m_refusal;
    if (m_trouble)
        return inBoth([this](const SessionState& reader) {
            return LineTroubleText(reader, m_trouble->step, m_trouble->failure, m_trouble->subject);
        });
    const bool nothingToSend = m_phase == SendingPhase::NoOrder || m_phase == SendingPhase::NoServer;
    const SendingWords& words = nothingToSend ? look().advice : look().title;
    return {QString::fromUtf16(words.hebrew), QString::fromUtf16(words.english)};
}

BothLanguages SendingPage::inBoth(const std::function<QString(const SessionState&)>& words) const {
    SessionState reader = m_state;
    reader.EnglishTips = 0;
    const QString hebrew = words(reader);
    reader.EnglishTips = 1;
    return {hebrew, words(reader)};
}

bool SendingPage::isAtRest() const {
    return look().buttons.testFlag(SendingButton::NewOrder) && m_phase != SendingPhase::Waiting && !lineInUse();
}

void SendingPage::forgetReason() {
    m_reason.clear();
    m_shown.Label4Reason.text.clear();
    m_shown.Label4Reason.visible = false;
}

void SendingPage::tellLab() {
    if (ReportCalls* calls = reportCalls())
        tellWatched(&LabReport::tell, *calls);
}

void SendingPage::tellWatched(Telling telling, ReportCalls& calls) {
    Timer4Report.start();
    (report().*telling)(calls);
    Timer4Report.stop();
}

bool SendingPage::mayReportAgain() const {
    return report().mayTellAgain() && !lineInUse() && !isUnderWay(m_phase) && m_phase != SendingPhase::Preparing;
}

bool SendingPage::reportUnknown() const {
    return report().isEndUnknown();
}

bool SendingPage::provenByNameOnly() const {
    return report().provenByNameOnly();
}

void SendingPage::reportAgain() {
    ReportCalls* calls = mayReportAgain() ? reportCalls() : nullptr;
    if (!calls)
        return;
    const SendingPhase before = m_phase;
    stopTimers();
    enter(SendingPhase::Reporting);
    tellWatched(&LabReport::tellAgain, *calls);
    enter(before == SendingPhase::Countdown ? SendingPhase::Waiting : before);
}

void SendingPage::watchReport() {
    report().watch();
}

void SendingPage::keepHeld(bool held) const {
    OrderJournal order(m_platform.files, OrderFolder::chosen(m_state));
    const bool waits = order.known() && order.state().phase == OrderState::Phase::Prepared;
    if (waits && m_state.transfer.SugMishloah == Sending::NewOrder && !order.held(held))
        tellNotKept();
}

void SendingPage::tellNotKept() const {
    m_platform.dialogs.message(wording(notKeptWords));
}

bool SendingPage::mayBeSent(const QStringList& paths) {
    if (!m_state.Careful)
        return true; // nothing is to be counted
    const auto counts =
        OrderCompleteness::read(m_state, m_platform.files, OrderFolder::chosen(m_state), LeafNames(paths));
    const QStringList& damaged = counts.damagedFiles;
    if (!damaged.isEmpty())
        tellReason(LineStep::PrintCut, {Failure::Kind::Damaged, damaged.join(u", "_s)}, damaged.first());
    if (CompletenessGuard(m_state, m_platform).maySend(counts))
        return true;
    m_refusal =
        inBoth([&](const SessionState& reader) { return CompletenessGuard(reader, m_platform).whatIsMissing(counts); });
    return false;
}

bool SendingPage::prepareAgain(const OrderJournal& order, const PreparedAgain::IsTaken& isTaken) {
    PreparedAgain again(m_state, m_platform, order);
    const Outcome way = again.way();
    if (!m_chain.canFollow(id(), way) || !again.isPossible() || !again.handOver(isTaken))
        return false;
    m_platform.dialogs.message(wording(numberTakenWords).arg(order.state().number));
    m_chain.follow(id(), way);
    return true;
}

// The order stays in its folder and is listed among the finished ones.
void SendingPage::leaveForNewOrder() {
    m_cardWatch.reset();
    m_state.transfer.leftOut.clear();
    m_chain.follow(id(), Outcome::NewOrderWanted);
}

void SendingPage::leaveProgram() {
    leave();
    m_chain.endProgram();
}

} // namespace lumora
