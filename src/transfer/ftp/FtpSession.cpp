#include "transfer/ftp/FtpSession.h"

#include "common/DrivePath.h"
#include "order/BrokenFiles.h"
#include "order/OrderFolder.h"
#include "order/OrderSender.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int ftpPauseRounds = 1600;
constexpr int openAttempts = 4;
constexpr int connectAttempts = 5;
constexpr int folderAttribute = 16;
constexpr int plainAttribute = 128;

QString withoutFirstSlash(const QString& directory) {
    return directory.startsWith(u'/') || directory.startsWith(u'\\') ? directory.mid(1) : directory;
}

Failure noLine() {
    return {Failure::Kind::Disconnected, u"no connection to the FTP server"_s};
}

} // namespace

bool CheckFtpSettings(const ClientProfile& profile) {
    return SenderSetUp(profile, Sender::Ftp);
}

FtpSession::FtpSession(SessionState& state, const Platform& platform, SendingEvents& events, SendingStop& stop,
                       FtpLists& lists)
    : m_profile(state.profile)
    , m_transfer(state.transfer)
    , m_careful(state.Careful)
    , m_platform(platform)
    , m_events(events)
    , m_stop(stop)
    , m_lists(lists)
    , m_folderOwner(state, platform.files)
    , m_arrival(state, platform.files) {}

void FtpSession::beginOrder() {
    m_putBegun = false;
    m_owner = FtpFolderOwner::Owner::NotKnown;
    m_arrival.beginOrder();
    m_inFolder.clear();
    m_journal.emplace(m_platform.files, OrderFolder(m_transfer.OrderFolder));
    if (m_transfer.SugMishloah == Sending::Resend)
        m_journal->markSentAgain();
}

void FtpSession::beginPass() {
    ConnectFails = 0;
    RoundNo = 0;
    m_noInternetTold = false;
    m_noSessionTold = false;
    m_notKeptTold = false;
    m_unkept.reset();
}

void FtpSession::takeSettings() {
    FtpHost = m_profile.FtpServer;
    FtpPass = m_profile.FtpPassword;
    FtpUser = m_profile.FtpUser;
}

void FtpSession::PauseBar(int times) {
    for (int time = 0; time < times; ++time)
        pauseInRounds(ftpPauseRounds, m_events, m_platform.pump, m_stop);
}

void FtpSession::pump() {
    m_platform.pump.pump();
}

void FtpSession::log(const QString& text) {
    const QTime now = m_platform.clock.now().time();
    m_lists.LogList.append(QString::number(now.hour()) + QString::number(now.minute()) + text);
}

// A call that the customer's stop has cut is not told as a failure.
void FtpSession::trouble(LineStep step, const Failure& failure, const QString& subject) {
    if (!m_stop.StopFlag && !m_stop.left)
        m_events.failed(step, failure, subject);
}

void FtpSession::tellOnce(bool& told, SendingMoment moment, int number) {
    if (!std::exchange(told, true))
        tell(moment, number);
}

void FtpSession::FtpOpenInternet() {
    int i = 1;
    for (; i <= openAttempts; ++i) {
        pump();
        tell(SendingMoment::Opening, i);
        hOpen = m_platform.internet.open();
        if (hOpen) {
            tell(SendingMoment::SessionOpen);
            return;
        }
        FtpCloseAll();
    }
    trouble(LineStep::Open, noLine());
    tellOnce(m_noInternetTold, SendingMoment::NoInternet, i);
    tell(SendingMoment::SessionOpen);
}

void FtpSession::FtpConnectServer() {
    m_lists.List1.clear();
    connectTimedOut = false;
    if (!bActiveSession && hOpen) {
        if (!connect())
            return;
        m_lists.List1.append(FtpHost);
        ListRemote({});
        if (!colNames.isEmpty())
            FillListFromNames(Target::List1, {});
    }
    tell(SendingMoment::Connected);
}

// False: nobody answers, which is told.
bool FtpSession::connect() {
    int count = 0;
    Failure last = noLine();
    connectTimedOut = true;
    while (count < connectAttempts && !hConnection && !m_stop.left && !m_stop.StopFlag) {
        pump();
        if (m_stop.StopFlag)
            break;
        tell(SendingMoment::Connecting, ++count);
        auto connected = m_platform.internet.connectFtp(FtpHost, FtpUser, FtpPass, dataChannel());
        if (connected)
            hConnection = std::move(*connected);
        else
            last = connected.failure();
        connectTimedOut = connectTimedOut && !connected && last.kind == Failure::Kind::TimedOut;
    }
    bActiveSession = hConnection != nullptr;
    if (!hConnection && !m_stop.StopFlag) {
        trouble(LineStep::Connect, last);
        tell(SendingMoment::NotConnected, count);
    }
    return bActiveSession;
}

QStringList FtpSession::foldersOfLab() const {
    QStringList names{m_profile.FtpFolder1, m_profile.FtpFolder2};
    names.removeAll(QString());
    return names;
}

void FtpSession::enterByNames() {
    FtpOpenInternet();
    tell(SendingMoment::WalkStep);
    connectTimedOut = FolderOk = false;
    MikumBaSharat.clear();
    if (!hOpen || (!bActiveSession && !connect()))
        return;
    tell(SendingMoment::Connected);
    tell(SendingMoment::WalkStep);
    for (const QString& name : foldersOfLab()) {
        if (!FtpChangeDir(name)) {
            ++ConnectFails;
            tell(SendingMoment::FolderMissing);
            return;
        }
    }
    ConnectFails = 0;
    RoundNo = 0;
    FolderOk = true;
    tell(SendingMoment::FolderFound);
    tellFolder(2);
    tell(SendingMoment::WalkStep);
}

void FtpSession::listOrderFolders() {
    if (!isKept() || !FtpChangeDir(u'/' + foldersOfLab().join(u'/')))
        return;
    m_inOrderFolder = false;
    ListRemoteHere();
    FillListFromNames(Target::List5, {});
}

void FtpSession::walkToLabFolder() {
    if (isKept()) {
        enterByNames();
        return;
    }
    FtpOpenInternet();
    tell(SendingMoment::WalkStep);
    PauseBar();
    FtpConnectServer();
    tell(SendingMoment::WalkStep);
    PauseBar();
    EnterFolderTK1();
    tell(SendingMoment::WalkStep);
    EnterFolderTK2();
    tell(SendingMoment::WalkStep);
}

void FtpSession::openFolder(const QString& name, int level) {
    ConnectFails = 0;
    RoundNo = 0;
    tell(SendingMoment::FolderFound);
    if (!bActiveSession) {
        tellOnce(m_noSessionTold, SendingMoment::NoSession);
        return;
    }
    m_lists.List2.clear();
    ListRemote(name);
    FillListFromNames(level == 1 ? Target::List4 : Target::List5, name);
    if (level == 1)
        tell(SendingMoment::InsideServer);
    tellFolder(level);
}

void FtpSession::tellFolder(int level) {
    const QString asTold = CurrentRemoteDir();
    MikumBaSharat = withoutFirstSlash(asTold);
    m_events.enteredFolder(level, asTold, MikumBaSharat);
}

void FtpSession::EnterFolderTK1() {
    const QString& name = m_profile.FtpFolder1;
    if (name.isEmpty())
        return;
    FolderOk = m_lists.List1.contains(name);
    if (FolderOk)
        openFolder(name, 1);
}

void FtpSession::EnterFolderTK2() {
    const QString& name = m_profile.FtpFolder2;
    if (name.isEmpty())
        return;
    const bool below = !m_profile.FtpFolder1.isEmpty();
    FolderOk = (below ? m_lists.List4 : m_lists.List1).contains(name);
    if (FolderOk) {
        openFolder(name, 2);
    } else if (!below) {
        ++ConnectFails;
        tell(SendingMoment::FolderMissing);
    }
}

bool FtpSession::insideOrderBase() const {
    return MikumBaSharat ==
           (m_profile.FtpFolder1.isEmpty() ? m_profile.FtpFolder2 : m_profile.FtpFolder1 + u'/' + m_profile.FtpFolder2);
}

bool FtpSession::enterListedFolder(const QString& name, bool made) {
    m_inOrderFolder = false;
    if (!hConnection)
        return false;
    const auto entered = hConnection->setCurrentDirectory(name);
    if (!entered) {
        trouble(LineStep::OrderFolder, entered.failure());
        return false;
    }
    return lookAround(name, made);
}

bool FtpSession::lookAround(const QString& name, bool made) {
    m_inOrderFolder = false;
    if (!hConnection)
        return false;
    // Once a put was tried, a refused listing may hide what it left.
    listHere(m_putBegun || !m_lists.List4Broken.isEmpty() ? EmptyFolder::IsListed : EmptyFolder::MayBeRefused);
    if (!bActiveSession || !mayJoin(name, made))
        return false;
    FillListFromNames(Target::List6, name);
    m_inFolder.clear();
    for (const FtpEntry& entry : m_listing.entries) {
        if (!entry.folder)
            m_inFolder += {entry.name, entry.length};
    }
    m_inOrderFolder = true;
    return true;
}

bool FtpSession::isOther(const QString& path) {
    return hConnection && m_arrival.isOther(*hConnection, path, m_inFolder);
}

bool FtpSession::isWhole(const QString& path) {
    return hConnection && m_arrival.isWhole(*hConnection, path, m_inFolder);
}

std::optional<ArrivalProof> FtpSession::prove(const QStringList& paths) {
    return hConnection ? m_arrival.proofOf(*hConnection, paths, m_inFolder) : std::nullopt;
}

bool FtpSession::lineEndsChanged(const QString& path) {
    return hConnection && m_arrival.lineEndsChanged(*hConnection, path, m_lists.List4Makor.items(), m_inFolder);
}

bool FtpSession::lineEndsExplain(const ArrivalProof& proof, const QStringList& paths) const {
    return m_arrival.lineEndsExplain(proof, paths);
}

// Asked once an order; a folder of another order of a chain is only looked at.
bool FtpSession::mayJoin(const QString& name, bool made) {
    using Owner = FtpFolderOwner::Owner;
    if (!m_journal || m_journal->folder().name() != name || m_owner == Owner::Ours)
        return true;
    if (made && (m_listing.refused || !m_listing.unread.isEmpty())) {
        m_owner = Owner::Ours;
        return true;
    }
    m_owner = m_folderOwner.of(*m_journal, *hConnection, m_listing);
    if (m_owner == Owner::NotKnown && !m_listing.unread.isEmpty())
        trouble(LineStep::List, {Failure::Kind::Damaged, m_listing.unread});
    return m_owner == Owner::Ours || m_owner == Owner::NotAsked;
}

bool FtpSession::joinOrderFolder(const QString& name, bool made) {
    return enterListedFolder(name, made) && joinHere();
}

bool FtpSession::joinHere() {
    if (!mayGoOn(m_journal->sendingBegins(Sender::Ftp, m_owner == FtpFolderOwner::Owner::Ours))) {
        m_inOrderFolder = false;
        return false;
    }
    tell(SendingMoment::Continuing);
    pump();
    tell(SendingMoment::Ready);
    return true;
}

bool FtpSession::EnterOrderFolder() {
    m_inOrderFolder = false;
    if (!insideOrderBase()) {
        tell(SendingMoment::OutsideFolder);
        return false;
    }
    QString& name = m_transfer.ShemTikiya;
    name = OrderFolder(m_transfer.OrderFolder).name();
    if (isKept() && hConnection) {
        const auto entered = hConnection->setCurrentDirectory(name);
        if (entered)
            return lookAround(name, false) && joinHere();
        const Failure& why = entered.failure();
        if (why.passing || (why.kind != Failure::Kind::Refused && why.kind != Failure::Kind::AccessDenied)) {
            trouble(LineStep::OrderFolder, why);
            return false;
        }
    } else if (m_lists.List5.contains(name)) {
        return joinOrderFolder(name, false);
    }
    // Names of another folder must not make the pass skip files of this one.
    m_lists.List6.clear();
    m_inFolder.clear();
    const bool made = FtpMakeOrderDir(name);
    if (m_unkept)
        return false;
    if (made && !m_folderOwner.asks()) {
        m_owner = FtpFolderOwner::Owner::Ours;
        keep(m_journal->sendingBegins(Sender::Ftp, true));
    }
    pump();
    if (!bActiveSession || !hConnection) {
        log(u"after MakeRemoteDir"_s);
        return false;
    }
    // It may have been there, though the listing above did not name it, also where its making was answered well.
    if (m_folderOwner.asks())
        return joinOrderFolder(name, made);
    const auto entered = hConnection->setCurrentDirectory(name);
    if (!entered) {
        trouble(LineStep::OrderFolder, entered.failure());
        return false;
    }
    m_inOrderFolder = true;
    if (!made)
        keep(m_journal->sendingBegins(Sender::Ftp, false));
    if (!isKept())
        FillListFromNames(Target::List2, name);
    tell(SendingMoment::Ready);
    return true;
}

bool FtpSession::FtpMakeOrderDir(const QString& name) {
    // After a program that ended before the answer, the next one finds an empty folder and takes it as the order's own.
    if (hConnection && !mayGoOn(m_journal->folderIsAsked(Sender::Ftp)))
        return false;
    const auto made = hConnection ? hConnection->makeDirectory(name) : Result<void>(noLine());
    if (!made) {
        if (made.failure().kind == Failure::Kind::Refused || made.failure().kind == Failure::Kind::AccessDenied)
            keep(m_journal->folderIsRefused());
        trouble(LineStep::OrderFolder, made.failure());
        log(u" make remotedir fail"_s);
        return false;
    }
    if (isKept())
        return true;
    m_lists.List2.clear();
    ListRemoteChecked();
    FillListFromNames(Target::List2, name);
    return true;
}

// Of a chosen part the count would tell nothing of the order.
void FtpSession::countFiles(int sent) {
    if (m_journal && m_transfer.SugMishloah == Sending::NewOrder)
        m_journal->countFiles(sent, m_lists.List4Makor.count());
}

bool FtpSession::FtpSendFile(const QString& path) {
    if (!bActiveSession || !hConnection)
        return false;
    if (path.isEmpty()) {
        log(u"sendfile-no-image selected"_s);
        return false;
    }
    pump();
    const Result<HostPath> local = beginPut(path);
    if (m_unkept)
        return false;
    const auto sent = local ? hConnection->put(*local, LeafName(path)) : Result<void>(local.failure());
    pump();
    return endPut(path, sent);
}

Result<HostPath> FtpSession::beginPut(const QString& path) {
    const Files& files = m_platform.files;
    const DrivePath file(path);
    const auto local = files.drives().toHost(file);
    m_putBegun = true;
    if (!local || !files.fileExists(file))
        return Failure{Failure::Kind::NotFound, path};
    if (!mayGoOn(m_journal->take(path)))
        return *m_unkept;
    return *local;
}

bool FtpSession::endPut(const QString& path, const Result<void>& sent) {
    if (sent) {
        release(path);
        return true;
    }
    trouble(LineStep::Put, sent.failure(), LeafName(path));
    log(u"fail to up load"_s + path);
    m_lists.List7.append(path);
    PauseBar();
    m_lists.List4Broken.append(path);
    return false;
}

void FtpSession::keepBrokenFiles() {
    const OrderFolder order(m_transfer.OrderFolder);
    if (!m_lists.List4Broken.isEmpty() || m_platform.files.fileExists(order.brokenFilesPath()))
        keep(WriteBrokenFiles(m_platform.files, order, m_lists.List4Broken));
}

void FtpSession::keep(const Result<void>& written) {
    if (!written && !std::exchange(m_notKeptTold, true))
        m_events.notKept(written.failure());
}

// As built in a step that could not be kept is told, and the sending goes on.
bool FtpSession::mayGoOn(const Result<void>& written) {
    if (written || !m_careful) {
        keep(written);
        return true;
    }
    m_unkept = written.failure();
    return false;
}

void FtpSession::release(const QString& path) {
    if (const Result<void> written = m_journal->release(path); !m_careful)
        keep(written);
}

void FtpSession::remove(const QString& remoteName) {
    if (hConnection && !remoteName.isEmpty())
        (void)hConnection->remove(remoteName);
}

void FtpSession::ClearListing() {
    m_listing = {};
    colNames.clear();
    colAttrs.clear();
}

Result<FtpListing> FtpSession::find(EmptyFolder empty) {
    if (!hConnection)
        return noLine();
    return hConnection->list(u"*.*"_s, empty);
}

void FtpSession::take(const FtpListing& listing) {
    m_listing = listing;
    for (const FtpEntry& entry : listing.entries) {
        colNames.append(entry.name);
        colAttrs.push_back(entry.folder ? folderAttribute : plainAttribute);
    }
    // An empty directory gives one empty name, and the counts of the check rely on it.
    if (listing.entries.empty()) {
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
    listHere(EmptyFolder::IsListed);
}

void FtpSession::listHere(EmptyFolder empty) {
    ClearListing();
    const auto found = find(empty);
    if (found) {
        take(*found);
    } else {
        trouble(LineStep::List, found.failure());
        FtpFatalError(found.failure(), u"FtpFindFirstFile"_s);
    }
}

void FtpSession::ListRemoteChecked() {
    ClearListing();
    const auto found = find();
    if (found && !found->entries.empty())
        take(*found);
}

bool FtpSession::FtpChangeDir(const QString& dir) {
    if (dir.isEmpty()) {
        tell(SendingMoment::NoDirectory);
        return false;
    }
    QString target = dir;
    if (!FtpHost.isEmpty() && target.startsWith(FtpHost))
        target = target.mid(FtpHost.size());
    if (target.isEmpty())
        target = u"/"_s;
    const auto changed = hConnection ? hConnection->setCurrentDirectory(target) : Result<void>(noLine());
    RemoteDirectory = target;
    if (!changed) {
        trouble(LineStep::OrderFolder, changed.failure());
        FtpFatalError(changed.failure(), u"rcd"_s);
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
        m_lists.List1.append(colNames);
        break;
    case Target::List2:
        for (const QString& name : std::as_const(colNames)) {
            m_lists.List2.append(name);
            m_lists.List1.append(u'/' + name);
        }
        break;
    case Target::List4:
        refill(m_lists.List4);
        break;
    case Target::List5:
        refill(m_lists.List5);
        break;
    case Target::List6:
        refill(m_lists.List6);
        break;
    }
}

std::unique_ptr<FtpConnection> FtpSession::lend() {
    m_inOrderFolder = false;
    return std::move(hConnection);
}

void FtpSession::takeBack(std::unique_ptr<FtpConnection> connection) {
    if (!connection) {
        FtpCloseConnection();
        return;
    }
    hConnection = std::move(connection);
    m_inOrderFolder = true;
}

std::function<Result<std::unique_ptr<FtpConnection>>()> FtpSession::opener() const {
    const QStringList folders = foldersOfLab() + QStringList(m_transfer.ShemTikiya);
    return [&internet = m_platform.internet, host = FtpHost, user = FtpUser, password = FtpPass,
            channel = dataChannel(), folders] {
        auto connection = internet.connectFtp(host, user, password, channel);
        for (const QString& folder : folders) {
            if (!connection)
                break;
            if (const auto entered = (*connection)->setCurrentDirectory(folder); !entered)
                connection = entered.failure();
        }
        return connection;
    };
}

void FtpSession::FtpCloseConnection() {
    hConnection.reset();
    m_inOrderFolder = false;
    ClearListing();
    bActiveSession = false;
    tell(SendingMoment::SessionOpen);
}

void FtpSession::FtpCloseAll() {
    hConnection.reset();
    m_inOrderFolder = false;
    hOpen = false;
}

void FtpSession::closeSession() {
    FtpCloseAll();
    bActiveSession = false;
    ClearListing();
    tell(SendingMoment::SessionClosed);
}

QString FtpSession::CurrentRemoteDir() {
    auto directory = hConnection ? hConnection->currentDirectory() : Result<QString>(noLine());
    if (!directory) {
        tell(SendingMoment::CutOff);
        return {};
    }
    return directory->left(directory->indexOf(QChar(u'\0')));
}

void FtpSession::takeResponse(const Failure& failure) {
    if (LineErrorNumber(failure.kind) == 12003 && hConnection)
        LastResponse = hConnection->lastResponse();
}

void FtpSession::FtpFatalError(const Failure& failure, const QString& source) {
    Q_UNUSED(source);
    takeResponse(failure);
    closeSession();
}

void FtpSession::listHereAgain() {
    m_lists.List2.clear();
    ListRemoteHere();
    FillListFromNames(Target::List2, {});
}

void FtpSession::putHere(const DrivePath& path) {
    const auto local = m_platform.files.drives().toHost(path);
    const bool ofOrder = m_journal && path.folder() == m_journal->folder().path();
    // A file that was in hand stays in hand: the operator may put it into another folder.
    const bool takes = ofOrder && !m_journal->state().filesInHand.contains(path.text());
    if (takes)
        keep(m_journal->take(path.text()));
    const auto sent = local && hConnection ? hConnection->put(*local, path.leaf()) : Result<void>(noLine());
    if (takes && sent)
        keep(m_journal->release(path.text()));
    if (!sent)
        FtpFatalError(sent.failure(), u"FtpPutFile"_s);
    else
        listHereAgain();
}

void FtpSession::getHere(const QString& remoteName, const DrivePath& localFolder) {
    const auto local = m_platform.files.drives().toHost(localFolder / remoteName);
    const auto got = local && hConnection ? hConnection->get(remoteName, *local) : Result<void>(noLine());
    if (!got)
        FtpFatalError(got.failure(), u"FtpGetFile"_s);
}

void FtpSession::removeHere(const QString& remoteName) {
    const auto removed = hConnection ? hConnection->remove(remoteName) : Result<void>(noLine());
    if (!removed)
        FtpFatalError(removed.failure(), u"FtpGetFile"_s);
    else
        listHereAgain();
}

void FtpSession::makeGoop() {
    const auto made = hConnection ? hConnection->makeDirectory(u"goop"_s) : Result<void>(noLine());
    if (!made)
        FtpFatalError(made.failure(), u"FtpPutFile"_s);
    else
        listHereAgain();
}

} // namespace lumora
