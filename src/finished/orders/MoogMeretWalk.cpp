// The walk over the packages of a mail sending.
#include "common/DrivePathText.h"
#include "finished/mail/MailLetter.h"
#include "finished/mail/MailResult.h"
#include "finished/orders/MoogMeret.h"
#include "order/OrderDetailsReader.h"
#include "order/OrderFolder.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/line/Mail.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <algorithm>
#include <utility>

namespace lumora {

MoogMeret::Package MoogMeret::package(int index) const {
    return index >= 0 && static_cast<std::size_t>(index) < m_packages.size()
               ? m_packages[static_cast<std::size_t>(index)]
               : Package::Waiting;
}

bool MoogMeret::mailSetUp() const {
    return m_state.profile.mail.setUp();
}

void MoogMeret::Command2_Click() {
    if (m_leaving || m_sending || m_walking || !Command2.visible)
        return;
    showSendButtons(false);
    List1Shown.enabled = true;
    Command20_Click();
    if (List1.isEmpty()) {
        m_platform.dialogs.message(
            m_state.wording(QStringLiteral("לא בחרת קבצים למשלוח מתוך החלון הצהב"),
                            QStringLiteral("You chose no files to send from the yellow window.")));
        showSendButtons(true);
        return;
    }
    Command13_Click();
}

void MoogMeret::Command20_Click() {
    if (m_sending || m_walking)
        return;
    List1.clear();
    List1.append(File1.mailList());
    m_packages.assign(static_cast<std::size_t>(List1.count()), Package::Waiting);
    Q_EMIT changed();
}

void MoogMeret::Command13_Click() {
    if (m_sending || List1.isEmpty())
        return;
    m_packages.resize(static_cast<std::size_t>(List1.count()), Package::Waiting);
    m_walking = true;
    Command18.visible = Command28.visible = Command4Orders.visible = false;
    Command19.visible = Label24.visible = true;
    List1Shown.visible = false;
    Label4Doar.text = mailSetUp()
                          ? QString()
                          : m_state.wording(QStringLiteral("לא הוגדר שרת דואר, ולכן המנות רק נספרות ואינן נשלחות."),
                                            QStringLiteral("No mail server is set up, so the packages are only "
                                                           "counted and not sent."));
    Label4Sof.text.clear();
    Label4Shaa.text = m_platform.clock.now().toString(QStringLiteral("HH:mm:ss"));
    m_walk.begin(m_platform.clock.now());
    selectPackage(0);
    // The message may have taken its time, or the customer may have left or stopped meanwhile.
    if (!m_walking || m_chain.hasEnded())
        return;
    m_walk.begin(m_platform.clock.now());
    Timer3.start();
    showWalk();
}

void MoogMeret::Timer3_Tick() {
    Command12_Click();
}

void MoogMeret::Command12_Click() {
    if (m_sending)
        return;
    const QDateTime now = m_platform.clock.now();
    const QString time = now.toString(QStringLiteral("HH:mm:ss"));
    if (std::exchange(Label4Shaa.text, time) != time)
        Q_EMIT changed();
    // Once it is over the clock alone goes on: a package that is picked from the list is sent by itself.
    if (!m_walking)
        return;
    switch (m_walk.step(List1.currentIndex(), List1.count(), now)) {
    case PackageWalk::Step::Over:
        Command2.visible = true;
        endWalk();
        return;
    case PackageWalk::Step::Next:
        selectPackage(List1.currentIndex() + 1);
        break;
    case PackageWalk::Step::Wait:
        break;
    }
    if (m_chain.hasEnded())
        return;
    m_walk.measure(m_platform.clock.now());
    showWalk();
}

void MoogMeret::Command19_Click() {
    if (!m_walking)
        return;
    Timer3.stop();
    Command2.visible = true;
    endWalk();
}

// The selection stays where it is.
void MoogMeret::endWalk() {
    m_walking = false;
    m_walked = true;
    Command18.visible = Command28.visible = Command4Orders.visible = List1Shown.visible = true;
    Command19.visible = Label24.visible = false;
    showOutcome();
    Q_EMIT changed();
}

void MoogMeret::leaveWalk() {
    m_walked = false;
    Command18.visible = Command4Orders.visible = false;
}

void MoogMeret::Label13_Click() {
    m_walk.clearMinutes();
    showWalk();
}

void MoogMeret::List1_Click(int index) {
    if (m_sending || m_walking || !List1Shown.enabled || index < 0 || index >= List1.count())
        return;
    // One that the server has taken is not sent twice; the one in hand is, when it has failed.
    if (package(index) == Package::Sent)
        List1.setCurrentIndex(index);
    else if (index == List1.currentIndex() && package(index) == Package::Failed)
        sendPackage(index);
    else
        selectPackage(index);
    showOutcome();
    Q_EMIT changed();
}

void MoogMeret::selectPackage(int index) {
    const bool moves = index != List1.currentIndex();
    List1.setCurrentIndex(index);
    showWalk();
    if (moves)
        sendPackage(index);
}

// Without a mail server there is no step: the walk shows each file for its time.
void MoogMeret::sendPackage(int index) {
    if (!mailSetUp())
        return;
    const auto at = static_cast<std::size_t>(index);
    const QString path = List1.item(index);
    m_packages[at] = Package::Sending;
    m_sending = true;
    Label4Doar.text = m_state.wording(QStringLiteral("שולחים את המנה. נא להמתין."),
                                      QStringLiteral("Sending the package. Please wait."));
    Label4Doar.hint.clear();
    Q_EMIT changed();
    const QString order = FolderOfPath(path);
    const QString letter = MailLetter(m_state, detailsOf(order), LeafName(path), Label4Mana.text);
    MailOutcome outcome;
    if (const auto file = m_platform.files.drives().toHost(path))
        outcome = m_platform.mail.send(m_state.profile.mail, {LeafName(order), letter, *file});
    else
        outcome = {MailEnd::AttachmentMissing, path};
    m_sending = false;
    m_packages[at] = outcome.end == MailEnd::Sent ? Package::Sent : Package::Failed;
    Label4Doar.text = MailResultText(MailResultCode(outcome.end), m_state.english()).trimmed();
    Label4Doar.hint = outcome.words;
    if (!m_walking)
        showOutcome();
    Q_EMIT changed();
}

OrderDetails MoogMeret::detailsOf(const QString& folder) const {
    OrderDetails details;
    const QString text = OrderFolder(folder).logPath();
    if (m_platform.files.fileExists(text))
        ReadResentDetails(m_platform.files, text, details);
    return details;
}

void MoogMeret::showWalk() {
    Label13.text = QString::number(static_cast<int>(m_walk.minutes()));
    Label4Mana.text = m_state.wording(QStringLiteral("מנה %1 מתוך %2"), QStringLiteral("Package %1 of %2"))
                          .arg(List1.currentIndex() + 1)
                          .arg(List1.count());
    Label4Shem.text = List1.currentIndex() < 0 ? QString() : LeafName(List1.currentItem());
    Q_EMIT changed();
}

void MoogMeret::showOutcome() {
    const auto sent = std::count(m_packages.begin(), m_packages.end(), Package::Sent);
    if (!m_walked || !mailSetUp()) {
        Label4Sof.text.clear();
    } else if (sent == List1.count()) {
        Label4Sof.text = m_state
                             .wording(QStringLiteral("כל %1 המנות נשלחו בדואר."),
                                      QStringLiteral("All %1 packages were sent by mail."))
                             .arg(sent);
    } else {
        Label4Sof.text =
            m_state
                .wording(QStringLiteral("נשלחו %1 מתוך %2 מנות. כל הקבצים שמורים במחשב זה. כדי לשלוח מנה שלא נשלחה יש "
                                        "ללחוץ עליה ברשימה."),
                         QStringLiteral("%1 of %2 packages were sent. All files are kept on this computer. Press a "
                                        "package that was not sent to send it."))
                .arg(sent)
                .arg(List1.count());
    }
}

} // namespace lumora
