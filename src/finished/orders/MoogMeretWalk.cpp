// The mail packages of the page of finished orders, sent one after another.
#include "common/DrivePath.h"
#include "finished/mail/MailLetter.h"
#include "finished/mail/MailResult.h"
#include "finished/mail/UnsentPackages.h"
#include "finished/orders/MoogMeret.h"
#include "order/CompletenessGuard.h"
#include "order/OrderCompleteness.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/OrderNames.h"
#include "platform/Machine.h"
#include "platform/Platform.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

MoogMeret::Answer MoogMeret::answer() const {
    if (sending())
        return Answer::Sending;
    if (m_walk.count(PackageWalk::Fate::Failed) > 0)
        return Answer::Bad;
    const bool good = m_phase == Phase::Walking ? m_walk.count(PackageWalk::Fate::Sent) > 0 : m_walk.allSent();
    return good ? Answer::Good : Answer::None;
}

int MoogMeret::packagesDone() const {
    return mailSetUp() ? m_walk.count(PackageWalk::Fate::Sent) : List1.currentIndex() + 1;
}

void MoogMeret::sendByMail() {
    if (!mayAct() || !mailIsOffered())
        return;
    if (asksToGoOn()) {
        walkFrom(m_walk.nextUnsent(-1));
        return;
    }
    if (!mayAct())
        return;
    listPackages();
    if (List1.isEmpty())
        tellNothingIsMarked(m_state.wording(u"לא בחרת קבצים למשלוח מתוך החלון הצהב"_s,
                                            u"You chose no files to send from the yellow window."_s));
    else if (mayBeMailed())
        beginWalk();
}

bool MoogMeret::mayBeMailed() {
    const auto counts =
        OrderCompleteness::read(m_state, m_platform.files, OrderFolder(m_files.folder()), LeafNames(List1.items()));
    m_walksWholeOrder = counts.verdict() == OrderCompleteness::Verdict::Whole;
    return CompletenessGuard(m_state, m_platform).maySend(counts) && mayAct();
}

// After a stop, with the same files marked, the customer chooses whether what was sent is sent again.
bool MoogMeret::asksToGoOn() {
    const int unsent = m_phase == Phase::Walked ? UnsentPackages(m_state).count(m_walk) : 0;
    return unsent > 0 && List1.items() == m_files.mailList() &&
           asks(u"נשארו %1 מנות שלא נשלחו. כן: להמשיך בהן. לא: להתחיל מחדש.",
                u"%1 packages were not sent. Yes: go on with them. No: begin again.", {QString::number(unsent)}) &&
           mayAct();
}

void MoogMeret::listPackages() {
    if (!mayAct())
        return;
    List1.clear();
    List1.append(m_files.mailList());
    Q_EMIT changed();
}

void MoogMeret::beginWalk() {
    if (sending() || List1.isEmpty())
        return;
    m_walk.begin(List1.count(), m_platform.clock.now());
    walkFrom(0);
}

void MoogMeret::walkFrom(int first) {
    const QDateTime now = m_platform.clock.now();
    m_walk.take(now);
    Label4Doar.text =
        mailSetUp() ? QString()
                    : m_state.wording(u"לא הוגדר שרת דואר, ולכן המנות רק נספרות ואינן נשלחות."_s,
                                      u"No mail server is set up, so the packages are only counted and not sent."_s);
    Label4Sof.text.clear();
    Label4Shaa.text = now.toString(u"HH:mm:ss"_s);
    enter(Phase::Walking);
    List1.setCurrentIndex(-1); // the first one is sent also if it is the present one
    selectPackage(first);
    // The customer may have stopped the walk or left while the package was sent.
    if (m_phase != Phase::Walking)
        return;
    m_walk.take(m_platform.clock.now());
    Timer3.start();
    showWalk();
}

void MoogMeret::stepWalk() {
    if (sending())
        return;
    const QDateTime now = m_platform.clock.now();
    const QString time = now.toString(u"HH:mm:ss"_s);
    if (std::exchange(Label4Shaa.text, time) != time)
        Q_EMIT changed();
    // After the walk only the clock is updated.
    if (m_phase != Phase::Walking)
        return;
    const PackageWalk::Step step = m_walk.step(List1.currentIndex(), now);
    if (step == PackageWalk::Step::Over)
        endWalk();
    else if (step == PackageWalk::Step::Next)
        selectPackage(m_walk.nextUnsent(List1.currentIndex()));
    if (m_phase != Phase::Walking)
        return;
    m_walk.measure(m_platform.clock.now());
    showWalk();
}

void MoogMeret::stopWalk() {
    if (m_phase != Phase::Walking)
        return;
    Timer3.stop();
    endWalk();
}

// The selected package stays selected.
void MoogMeret::endWalk() {
    enter(Phase::Walked);
    showOutcome();
}

void MoogMeret::clearMinutes() {
    m_walk.clearMinutes();
    showWalk();
}

void MoogMeret::pickPackage(int index) {
    if (m_phase != Phase::Walked || sending() || index < 0 || index >= List1.count())
        return;
    // A package that the server has taken is not sent again; a click on the present package sends it again if it
    // failed.
    if (m_walk.fate(index) == PackageWalk::Fate::Sent)
        List1.setCurrentIndex(index);
    else if (index == List1.currentIndex() && m_walk.fate(index) == PackageWalk::Fate::Failed)
        sendPackage(index);
    else
        selectPackage(index);
    showOutcome();
}

void MoogMeret::selectPackage(int index) {
    const bool moves = index != List1.currentIndex();
    List1.setCurrentIndex(index);
    showWalk();
    if (moves)
        sendPackage(index);
}

// Without a mail server nothing is sent: the walk only shows each file for its minutes.
void MoogMeret::sendPackage(int index) {
    if (!mailSetUp())
        return;
    const DrivePath path(List1.item(index));
    m_walk.tell(index, PackageWalk::Fate::Sending);
    Label4Doar.text = m_state.wording(u"שולחים את המנה. נא להמתין."_s, u"Sending the package. Please wait."_s);
    Label4Doar.hint.clear();
    Q_EMIT changed();
    const DrivePath order = path.folder();
    const QString letter = MailLetter(m_state, detailsOf(order), path.leaf(), packageText());
    MailOutcome outcome;
    if (const auto file = m_platform.files.drives().toHost(path))
        outcome = m_platform.mail.send(m_state.profile.mail, {order.leaf(), letter, *file});
    else
        outcome = {MailEnd::AttachmentMissing, path.text()};
    m_walk.tell(index, outcome.end == MailEnd::Sent ? PackageWalk::Fate::Sent : PackageWalk::Fate::Failed);
    if (m_walksWholeOrder && m_walk.allSent()) // unwritten it counts as not proven, and its prints stay
        static_cast<void>(OrderJournal(m_platform.files, OrderFolder(order)).wentByMail());
    Label4Doar.text = MailResultText(MailResultCode(outcome.end), m_state.english()).trimmed();
    Label4Doar.hint = outcome.words;
    showOutcome();
}

} // namespace lumora
