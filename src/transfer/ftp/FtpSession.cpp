#include "transfer/ftp/FtpSession.h"

#include "common/DrivePathText.h"
#include "order/BrokenFiles.h"
#include "order/OrderFolder.h"
#include "platform/Dialogs.h"
#include "platform/files/Files.h"
#include "transfer/delivery/LineTrouble.h"

#include <utility>

namespace lumora {

namespace {

constexpr int pauseRounds = 1600;
constexpr int openAttempts = 4;
constexpr int connectAttempts = 5;
constexpr int folderAttribute = 16;
constexpr int plainAttribute = 128;

QString withoutFirstSlash(const QString& directory) {
    return directory.startsWith(u'/') || directory.startsWith(u'\\') ? directory.mid(1) : directory;
}

Failure noLine() {
    return {Failure::Kind::Disconnected, QStringLiteral("no connection to the FTP server")};
}

} // namespace

bool CheckFtpSettings(const SessionState& state) {
    return !state.profile.FtpUser.isEmpty() && !state.profile.FtpServer.isEmpty() &&
           !state.profile.FtpPassword.isEmpty();
}

FtpSession::FtpSession(FtpDesk& desk)
    : m_desk(desk)
    , m_board(desk.board) {}

void FtpSession::beginPass() {
    ConnectFails = 0;
    RoundNo = 0;
    m_noLineTold = false;
    m_noSessionTold = false;
    m_noListKeptTold = false;
}

void FtpSession::takeSettings() {
    FtpHost = m_desk.state.profile.FtpServer;
    FtpPass = m_desk.state.profile.FtpPassword;
    FtpUser = m_desk.state.profile.FtpUser;
}

void FtpSession::PauseBar(int times) {
    m_board.Picture1.visible = m_desk.state.transfer.Mefurak == Travel::Whole;
    for (int time = 0; time < times; ++time) {
        for (int i = 1; i <= pauseRounds && !m_desk.left; ++i) {
            m_board.Picture1Width = i / 6;
            m_desk.pump();
        }
    }
}

void FtpSession::log(const QString& text) {
    const QTime now = m_desk.platform.clock.now().time();
    m_board.LogList.append(QString::number(now.hour()) + QString::number(now.minute()) + text);
}

void FtpSession::tell(LineStep step, const Failure& failure, const QString& subject) {
    m_board.Label4Reason.text = LineTroubleText(m_desk.state, step, failure, subject);
    m_board.Label4Reason.hint = failure.message;
    m_board.Label4Reason.visible = true;
    m_desk.changed();
}

void FtpSession::FtpOpenInternet() {
    int i = 1;
    for (; i <= openAttempts; ++i) {
        m_desk.pump();
        if (m_desk.wholeFiles())
            m_desk.status(m_desk.wording(QStringLiteral("  קשר ראשוני "), QStringLiteral("  First contact ")) +
                          QString::number(i));
        hOpen = m_desk.platform.internet.open();
        if (hOpen) {
            FtpEnableControls(true);
            return;
        }
        FtpCloseAll();
    }
    tell(LineStep::Open, noLine());
    if (!std::exchange(m_noLineTold, true))
        m_desk.platform.dialogs.message(m_desk.wording(QStringLiteral("לא נוצר קשר אינטרנט לאחר מספר נסיונות"),
                                                       QStringLiteral("No internet contact after several attempts: ")) +
                                        QString::number(i));
    FtpEnableControls(true);
}

void FtpSession::FtpConnectServer() {
    m_board.List1.clear();
    if (!bActiveSession && hOpen) {
        const auto channel =
            m_board.chkPassive.checked ? Internet::DataChannel::Passive : Internet::DataChannel::Active;
        int count = 0;
        Failure last = noLine();
        while (count < connectAttempts && !hConnection && !m_desk.left && !m_desk.StopFlag) {
            m_desk.pump();
            if (m_desk.StopFlag)
                break;
            ++count;
            if (m_desk.wholeFiles())
                m_desk.status(QString::number(count) +
                              m_desk.wording(QStringLiteral("  נסיון ליצור קשר עם השרת  "),
                                             QStringLiteral("  Trying to reach the server  ")));
            auto connected = m_desk.platform.internet.connectFtp(FtpHost, FtpUser, FtpPass, channel);
            if (connected)
                hConnection = std::move(*connected);
            else
                last = connected.failure();
        }
        if (!hConnection) {
            bActiveSession = false;
            if (m_desk.StopFlag)
                return;
            tell(LineStep::Connect, last);
            m_desk.status(m_desk.wording(QStringLiteral("אין תקשורת עם השרת לאחר מספר נסיונות"),
                                         QStringLiteral("No contact with the server after several attempts: ")) +
                          QString::number(count));
            return;
        }
        bActiveSession = true;
        m_board.List1.append(FtpHost);
        ListRemote({});
        if (!colNames.isEmpty())
            FillListFromNames(Target::List1, {});
    }
    if (m_desk.wholeFiles())
        m_desk.status(
            m_desk.wording(QStringLiteral("יצר קשר עם השרת"), QStringLiteral("Contact made with the server")));
}

void FtpSession::reconnect(Captions captions) {
    const auto follow = [&] {
        if (captions == Captions::Follow)
            m_desk.captionFollowsStatus();
    };
    FtpOpenInternet();
    follow();
    PauseBar();
    FtpConnectServer();
    follow();
    PauseBar();
    EnterFolderTK1();
    follow();
    EnterFolderTK2();
    follow();
}

void FtpSession::openFolder(const QString& name, Target target, Caption& asTold, Caption& withoutSlash) {
    ConnectFails = 0;
    RoundNo = 0;
    m_board.Frame9.visible = false;
    if (!bActiveSession) {
        if (!std::exchange(m_noSessionTold, true))
            m_desk.platform.dialogs.message(QStringLiteral("No in session!"));
        return;
    }
    m_board.List2.clear();
    ListRemote(name);
    FillListFromNames(target, name);
    if (target == Target::List4 && m_desk.wholeFiles())
        m_desk.status(
            m_desk.wording(QStringLiteral("יוצר קשר בתוך השרת"), QStringLiteral("Making contact inside the server")));
    asTold.text = CurrentRemoteDir();
    MikumBaSharat = withoutFirstSlash(asTold.text);
    withoutSlash.text = MikumBaSharat;
}

void FtpSession::EnterFolderTK1() {
    const QString& name = m_desk.state.profile.FtpFolder1;
    if (name.isEmpty())
        return;
    FolderOk = m_board.List1.contains(name);
    if (FolderOk)
        openFolder(name, Target::List4, m_board.Label37, m_board.Label38);
}

void FtpSession::EnterFolderTK2() {
    const QString& name = m_desk.state.profile.FtpFolder2;
    if (name.isEmpty())
        return;
    const bool below = !m_desk.state.profile.FtpFolder1.isEmpty();
    FolderOk = (below ? m_board.List4 : m_board.List1).contains(name);
    if (FolderOk) {
        openFolder(name, Target::List5, m_board.Label40, m_board.Label41);
    } else if (!below) {
        ++ConnectFails;
        m_desk.status(m_desk.wording(QStringLiteral("תקשורת נכשלה מנסה שוב להתקשר"),
                                     QStringLiteral("Communication failed, trying to connect again")));
    }
}

bool FtpSession::insideOrderBase() const {
    const ClientProfile& profile = m_desk.state.profile;
    return MikumBaSharat ==
           (profile.FtpFolder1.isEmpty() ? profile.FtpFolder2 : profile.FtpFolder1 + u'/' + profile.FtpFolder2);
}

bool FtpSession::enterListedFolder(const QString& name) {
    m_inOrderFolder = false;
    if (!hConnection)
        return false;
    const auto entered = hConnection->setCurrentDirectory(name);
    if (!entered) {
        tell(LineStep::OrderFolder, entered.failure());
        return false;
    }
    ListRemoteHere();
    if (!bActiveSession)
        return false;
    FillListFromNames(Target::List6, name);
    m_inOrderFolder = true;
    return true;
}

bool FtpSession::EnterOrderFolder() {
    const QString ready =
        m_desk.wording(QStringLiteral("מתכונן להעברת קבצים"), QStringLiteral("Preparing to transfer files"));
    m_inOrderFolder = false;
    if (!insideOrderBase()) {
        m_desk.status(
            m_desk.wording(QStringLiteral("מחוץ לתיקייה הרצוייה"), QStringLiteral("Outside the desired folder")));
        return false;
    }
    QString& name = m_desk.state.transfer.ShemTikiya;
    name = OrderFolder::chosen(m_desk.state).name();
    if (m_board.List5.contains(name)) {
        if (!enterListedFolder(name))
            return false;
        m_desk.status(m_desk.wording(QStringLiteral("מיד ממשיך בהעברת קבצים"),
                                     QStringLiteral("Continuing the transfer at once")));
        m_desk.pump();
        m_desk.status(ready);
        return true;
    }
    // What another folder held must not make a file of this one pass for sent.
    m_board.List6.clear();
    FtpMakeOrderDir(name);
    m_desk.pump();
    if (!bActiveSession || !hConnection) {
        log(QStringLiteral("after MakeRemoteDir"));
        return false;
    }
    const auto entered = hConnection->setCurrentDirectory(name);
    if (!entered) {
        tell(LineStep::OrderFolder, entered.failure());
        return false;
    }
    m_inOrderFolder = true;
    FillListFromNames(Target::List2, name);
    m_desk.status(ready);
    return true;
}

void FtpSession::FtpMakeOrderDir(const QString& name) {
    const auto made = hConnection ? hConnection->makeDirectory(name) : Result<void>(noLine());
    if (!made) {
        tell(LineStep::OrderFolder, made.failure());
        log(QStringLiteral(" make remotedir fail"));
        return;
    }
    m_board.List2.clear();
    ListRemoteChecked();
    FillListFromNames(Target::List2, name);
}

bool FtpSession::FtpSendFile(const QString& path) {
    if (!bActiveSession || !hConnection)
        return false;
    if (path.isEmpty()) {
        log(QStringLiteral("sendfile-no-image selected"));
        return false;
    }
    const QString name = LeafName(path);
    m_desk.pump();
    const Files& files = m_desk.platform.files;
    const auto local = files.drives().toHost(path);
    const auto sent = local && files.fileExists(path) ? hConnection->put(*local, name)
                                                      : Result<void>(Failure{Failure::Kind::NotFound, path});
    m_desk.pump();
    if (sent)
        return true;
    tell(LineStep::Put, sent.failure(), name);
    log(QStringLiteral("fail to up load") + path);
    m_board.List7.append(path);
    PauseBar();
    m_board.List4Broken.append(path);
    return false;
}

void FtpSession::keepBrokenFiles() {
    const auto written =
        WriteBrokenFiles(m_desk.platform.files, OrderFolder::chosen(m_desk.state), m_board.List4Broken);
    if (!written && !std::exchange(m_noListKeptTold, true))
        m_desk.platform.dialogs.message(written.failure().message);
}

void FtpSession::remove(const QString& remoteName) {
    if (hConnection && !remoteName.isEmpty())
        (void)hConnection->remove(remoteName);
}

void FtpSession::ClearListing() {
    colNames.clear();
    colAttrs.clear();
}

Result<std::vector<FtpEntry>> FtpSession::find() {
    if (!hConnection)
        return noLine();
    return hConnection->list(QStringLiteral("*.*"));
}

void FtpSession::take(const std::vector<FtpEntry>& entries) {
    for (const FtpEntry& entry : entries) {
        colNames.append(entry.name);
        colAttrs.push_back(entry.folder ? folderAttribute : plainAttribute);
    }
    // The find record is taken without a look at the handle, so that an empty directory leaves one empty name. The
    // counts of the verification know it so.
    if (entries.empty()) {
        colNames.append(QString());
        colAttrs.push_back(0);
    }
}

void FtpSession::ListRemote(const QString& dir) {
    ClearListing();
    if (!dir.isEmpty() && !FtpChangeDir(dir))
        return;
    ListRemoteHere();
}

void FtpSession::ListRemoteHere() {
    ClearListing();
    const auto found = find();
    if (found) {
        take(*found);
    } else {
        tell(LineStep::List, found.failure());
        FtpFatalError(found.failure(), QStringLiteral("FtpFindFirstFile"));
    }
}

void FtpSession::ListRemoteChecked() {
    ClearListing();
    const auto found = find();
    if (found && !found->empty())
        take(*found);
}

bool FtpSession::FtpChangeDir(const QString& dir) {
    if (dir.isEmpty()) {
        m_desk.platform.dialogs.message(QStringLiteral("Please enter the directory to CD"));
        return false;
    }
    QString target = dir;
    if (!FtpHost.isEmpty() && target.startsWith(FtpHost))
        target = target.mid(FtpHost.size());
    if (target.isEmpty())
        target = QStringLiteral("/");
    const auto changed = hConnection ? hConnection->setCurrentDirectory(target) : Result<void>(noLine());
    m_board.Label5.text = target;
    if (!changed) {
        tell(LineStep::OrderFolder, changed.failure());
        FtpFatalError(changed.failure(), QStringLiteral("rcd"));
    }
    return changed.ok();
}

void FtpSession::FillListFromNames(Target target, const QString& dir) {
    if (dir == FtpHost && colNames.isEmpty())
        return;
    const auto refill = [&](TextList& list) {
        list.clear();
        list.append(colNames);
    };
    switch (target) {
    case Target::List1:
        m_board.List1.append(colNames);
        break;
    case Target::List2:
        for (const QString& name : std::as_const(colNames)) {
            m_board.List2.append(name);
            m_board.List1.append(u'/' + name);
        }
        break;
    case Target::List4:
        refill(m_board.List4);
        break;
    case Target::List5:
        refill(m_board.List5);
        break;
    case Target::List6:
        refill(m_board.List6);
        break;
    }
}

void FtpSession::FtpEnableControls(bool enable) {
    m_board.chkPassive.enabled = enable;
    m_board.optBin.enabled = enable;
    m_board.optAscii.enabled = enable;
    m_board.cmdClosehOpen.visible = enable;
    m_board.cmdInternetOpen.visible = !enable;
    m_board.txtProxy.visible = !enable;
}

void FtpSession::FtpCloseConnection() {
    hConnection.reset();
    m_inOrderFolder = false;
    ClearListing();
    bActiveSession = false;
    FtpEnableControls(true);
}

void FtpSession::FtpCloseAll() {
    hConnection.reset();
    m_inOrderFolder = false;
    hOpen = false;
}

void FtpSession::closeSession() {
    FtpCloseAll();
    bActiveSession = false;
    m_board.txtProxy.text.clear();
    ClearListing();
    FtpEnableControls(false);
}

QString FtpSession::CurrentRemoteDir() {
    auto directory = hConnection ? hConnection->currentDirectory() : Result<QString>(noLine());
    if (!directory) {
        m_desk.status(m_desk.wording(QStringLiteral("נותק הקשר"), QStringLiteral("The connection was cut")));
        return {};
    }
    return directory->left(directory->indexOf(QChar(u'\0')));
}

void FtpSession::FtpFatalError(const Failure& failure, const QString& source) {
    Q_UNUSED(source);
    if (LineErrorNumber(failure.kind) == 12003 && hConnection)
        LastResponse = hConnection->lastResponse();
    closeSession();
}

void FtpSession::FtpFatalErrorAsk(const Failure& failure, const QString& source) {
    const int number = LineErrorNumber(failure.kind);
    if (number == 12003 && hConnection)
        LastResponse = hConnection->lastResponse();
    const QString text = source + QStringLiteral(" Err: ") + QString::number(number) + QStringLiteral(" Extd Err: ") +
                         LastResponse + QStringLiteral("\r\nClose Connection and Session?");
    if (m_desk.platform.dialogs.ask(text))
        closeSession();
}

void FtpSession::listHereAgain() {
    m_board.List2.clear();
    ListRemoteHere();
    FillListFromNames(Target::List2, {});
}

void FtpSession::putHere(const QString& path) {
    const auto local = m_desk.platform.files.drives().toHost(path);
    const auto sent = local && hConnection ? hConnection->put(*local, LeafName(path)) : Result<void>(noLine());
    if (!sent)
        FtpFatalError(sent.failure(), QStringLiteral("FtpPutFile"));
    else
        listHereAgain();
}

void FtpSession::getHere(const QString& remoteName, const QString& localFolder) {
    const auto local = m_desk.platform.files.drives().toHost(JoinDrivePath(localFolder, remoteName));
    const auto got = local && hConnection ? hConnection->get(remoteName, *local) : Result<void>(noLine());
    if (!got)
        FtpFatalError(got.failure(), QStringLiteral("FtpGetFile"));
}

void FtpSession::removeHere(const QString& remoteName) {
    const auto removed = hConnection ? hConnection->remove(remoteName) : Result<void>(noLine());
    if (!removed)
        FtpFatalError(removed.failure(), QStringLiteral("FtpGetFile"));
    else
        listHereAgain();
}

void FtpSession::makeGoop() {
    const auto made = hConnection ? hConnection->makeDirectory(QStringLiteral("goop")) : Result<void>(noLine());
    if (!made)
        FtpFatalError(made.failure(), QStringLiteral("FtpPutFile"));
    else
        listHereAgain();
}

} // namespace lumora
