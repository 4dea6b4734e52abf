// The manual panel of the lab's own area: one step after the other on a connection that is opened by hand.
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "transfer/delivery/StoppableLine.h"
#include "transfer/ftp/FtpFrm.h"

namespace lumora {

using namespace Qt::StringLiterals;

// During the step nothing else may use the connection, and a stop cuts it.
template <class Step>
void FtpFrm::byHand(const Step& step) {
    FtpSession& session = m_sender.session;
    const bool wasActive = session.bActiveSession;
    m_byHand = true;
    m_sender.stop.StopFlag = false;
    session.LastResponse.clear();
    Command21.enabled = true;
    showLabButtons();
    {
        const StoppableLine line(m_platform);
        step();
    }
    m_byHand = false;
    Command21.enabled = false;
    if (m_sender.stop.left)
        session.closeSession();
    else if (m_sender.stop.StopFlag)
        showStoppedByHand();
    else if (wasActive && !session.bActiveSession)
        showFailedByHand();
    showLabButtons();
}

bool FtpFrm::inSession() {
    if (!mayAct())
        return false;
    if (!m_sender.session.bActiveSession)
        m_platform.dialogs.message(u"Not in session"_s);
    return m_sender.session.bActiveSession;
}

QString FtpFrm::chosenRemoteName() {
    if (!inSession())
        return {};
    const QString chosen = lists().List2.currentItem();
    if (chosen.isEmpty())
        m_platform.dialogs.message(u"Please select the item to GET!"_s);
    return chosen.mid(chosen.lastIndexOf(u'/') + 1);
}

// A connection opened by hand stops the count.
void FtpFrm::openByHand() {
    if (!mayAct())
        return;
    holdCount();
    byHand([this] {
        m_sender.session.FtpOpenInternet();
        m_sender.session.FtpConnectServer();
    });
}

void FtpFrm::closeByHand() {
    if (!mayAct())
        return;
    m_sender.session.closeSession();
    Q_EMIT changed();
}

void FtpFrm::choosePassive(bool passive) {
    if (!mayAct())
        return;
    m_sender.session.passive = chkPassive.checked = passive;
    Q_EMIT changed();
}

// Both buttons set the same transfer type: the lab's server takes all files, pictures too, as ASCII and keeps their
// bytes.
void FtpFrm::chooseType(bool binary) {
    if (!mayAct())
        return;
    m_sender.session.dwType = 1;
    optBin.checked = binary;
    optAscii.checked = !binary;
    Q_EMIT changed();
}

void FtpFrm::takeProxy(const QString& text) {
    txtProxy.text = text;
    Q_EMIT changed();
}

void FtpFrm::chooseLocal(int index) {
    m_sender.lists.File1.setCurrentIndex(index);
    Q_EMIT changed();
}

void FtpFrm::chooseRemote(int index) {
    m_sender.lists.List2.setCurrentIndex(index);
    Q_EMIT changed();
}

void FtpFrm::putChosen() {
    if (!inSession())
        return;
    const QString name = lists().File1.currentItem();
    if (name.isEmpty())
        m_platform.dialogs.message(u"Please select a local file to put"_s);
    else {
        endWayBack();
        byHand([&] { m_sender.session.putHere(m_files.folder() / name); });
    }
}

void FtpFrm::getChosen() {
    if (const QString name = chosenRemoteName(); !name.isEmpty())
        byHand([&] { m_sender.session.getHere(name, m_files.folder()); });
}

void FtpFrm::removeChosen() {
    if (const QString name = chosenRemoteName(); !name.isEmpty())
        byHand([&] { m_sender.session.removeHere(name); });
}

void FtpFrm::makeRemoteFolder() {
    if (inSession())
        byHand([this] { m_sender.session.makeGoop(); });
}

} // namespace lumora
