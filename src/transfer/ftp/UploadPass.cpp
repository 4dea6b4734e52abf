#include "transfer/ftp/UploadPass.h"

#include "common/DrivePathText.h"
#include "order/BrokenFiles.h"
#include "order/OrderFolder.h"
#include "platform/Dialogs.h"
#include "transfer/delivery/UploadProgress.h"

#include <utility>

namespace lumora {

FtpSession::Captions UploadPass::captions() const {
    return m_desk.wholeFiles() ? FtpSession::Captions::Follow : FtpSession::Captions::Stay;
}

void UploadPass::run() {
    m_board.Picture6.visible = false;
    m_board.Frame9.visible = false;
    m_board.Image6.visible = false;
    m_session.beginPass();
    m_desk.StopFlag = false;
    // The pause since an earlier pass is no pace of the line.
    LastPartTime = {};
    for (int i = 0; i < m_board.List3.count() && !m_desk.StopFlag && !m_desk.left; ++i) {
        m_board.List3.setCurrentIndex(i);
        CurrentIndex = i;
        showProgress(i);
        const QString path = m_board.List3.item(i);
        UploadOneFile(path);
        showPiece(i, path);
    }
    if (m_desk.left)
        return;
    if (m_desk.StopFlag) {
        tellStopped();
        return;
    }
    m_board.Label4Diff.text = QStringLiteral("0");
    m_desk.changed();
}

void UploadPass::tellStopped() {
    m_session.closeSession();
    UserStopped = 1;
    m_desk.StopFlag = false;
    m_board.pageSize = FtpBoard::PageSize::Full;
    m_board.Label4File.text.clear();
    Dialogs& dialogs = m_desk.platform.dialogs;
    dialogs.message(m_desk.wording(QStringLiteral(" התהליך הופסק ביוזמת המשתמש "),
                                   QStringLiteral(" The process was stopped by the user ")));
    dialogs.message(m_desk.wording(QStringLiteral("אם תרצה להמשיך המשלוח לחץ על לחצן שלח דרך האינטרנט\r"
                                                  "אם אינך מתכוון להמשיך במשלוח הנך מתבקש להודיע על כך לחנות תודה"),
                                   QStringLiteral("To go on, press the button that sends through the internet.\r"
                                                  "If you do not mean to go on, please tell the shop. Thank you.")));
    m_desk.changed();
}

void UploadPass::showProgress(int index) {
    const int count = m_board.List3.count();
    if (!m_desk.wholeFiles())
        m_board.Pic4Prog.visible = true;
    m_board.percent = UploadPercent(index, count);
    m_board.PicInProgWidth = BarWidth(m_board.percent, FtpBoard::Pic4ProgWidth);
    const QString percent = QString::number(m_board.percent);
    m_board.caption =
        percent + QStringLiteral(" %") +
        m_desk.wording(QStringLiteral("  נא לא לסגור את החלון עד לגמר כל המשלוח  "),
                       QStringLiteral("  Please do not close the window until the end of the whole sending  "));
    m_board.LabelProg.text = percent + QStringLiteral("  %");
    m_board.Label4File.text =
        m_desk.wording(QStringLiteral("קובץ %1 מתוך %2"), QStringLiteral("File %1 of %2")).arg(index + 1).arg(count);
    m_desk.changed();
}

void UploadPass::showPiece(int index, const QString& name) {
    const auto piece = PieceFromName(name);
    if (!piece)
        return;
    m_board.PicInProgKatanWidth = static_cast<int>(piece->share() * FtpBoard::Pic4ProgWidth);
    const QDateTime now = m_desk.platform.clock.now();
    const int remaining = m_board.List3.count() - 1 - index;
    if (!piece->last() && LastPartTime.isValid())
        m_board.Label4Diff.text = QString::number(MinutesLeft(LastPartTime.secsTo(now), remaining));
    LastPartTime = now;
    m_desk.changed();
}

void UploadPass::closeWithPauses() {
    m_session.PauseBar();
    m_session.FtpCloseConnection();
    m_session.PauseBar();
}

void UploadPass::UploadOneFile(const QString& path) {
    FaultPressed = false;
    m_board.Label2.visible = false;
    m_board.File1Enabled.enabled = false;
    m_board.Command12.visible = false;
    m_board.Label46.text = OrderFolder::chosen(m_desk.state).name();
    m_desk.StopFlag = false;
    m_session.PauseBar(2);
    m_session.reconnect(captions());
    if (!m_session.FolderOk) {
        closeWithPauses();
        if (m_desk.wholeFiles())
            m_desk.status(m_desk.wording(QStringLiteral("מנסה להתקשר\rנא לא לסגור את התוכנה "),
                                         QStringLiteral("Trying to connect\rPlease do not close the program ")));
        m_board.Command12.visible = true;
        m_board.Command12.enabled = false;
        return;
    }
    m_session.PauseBar();
    const bool entered = m_session.EnterOrderFolder();
    m_session.PauseBar();
    m_board.pageSize = FtpBoard::PageSize::Small;
    if (m_desk.left)
        return;
    if (m_desk.StopFlag) {
        m_session.FtpCloseConnection();
        return;
    }
    if (entered)
        send(path);
    closeWithPauses();
}

void UploadPass::showFile(const QString& name) {
    m_desk.status(m_desk.wording(QStringLiteral("  כעת מעלה לשרת "), QStringLiteral("  Now uploading to the server ")));
    if (m_desk.wholeFiles())
        m_board.caption = QStringLiteral("%1 / %2 ").arg(CurrentIndex + 1).arg(m_board.List3.count()) +
                          m_desk.wording(QStringLiteral("נא לא לסגור חלון זה עד גמר כל המשלוחים    "),
                                         QStringLiteral("Please do not close this window until all sendings end    ")) +
                          m_board.Label46.text;
    m_board.Label4File.hint = name;
    m_desk.changed();
}

void UploadPass::send(const QString& path) {
    const QString name = LeafName(path);
    showFile(name);
    const bool onServer = m_board.List6.contains(name);
    const bool remains = onServer && IsBroken(m_board.List4Broken, name);
    if (onServer && !remains) {
        if (m_desk.wholeFiles())
            m_desk.status(m_desk.wording(QStringLiteral("מדלג על הקובץ אשר קיים בשרת"),
                                         QStringLiteral("Skipping the file that exists on the server")));
    } else {
        // A server may still hold the file that a cut line left open; it takes the name again once the remains are
        // gone.
        if (remains)
            m_session.remove(name);
        BrokenBefore = m_board.List4Broken.count();
        if (m_session.FtpSendFile(path)) {
            if (IsBroken(m_board.List4Broken, name)) {
                for (int i = m_board.List4Broken.lastIndex(); i >= 0; --i) {
                    if (m_board.List4Broken.item(i) == path)
                        m_board.List4Broken.removeAt(i);
                }
                m_session.keepBrokenFiles();
            }
        } else if (m_board.List4Broken.count() > BrokenBefore) {
            m_session.keepBrokenFiles();
        }
    }
    if (m_desk.wholeFiles())
        m_desk.status(m_desk.wording(QStringLiteral(" סיים להעלות קובץ"), QStringLiteral(" Finished uploading file ")) +
                      QString::number(CurrentIndex + 1));
}

} // namespace lumora
