#pragma once

#include "common/Result.h"
#include "order/OrderJournal.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "transfer/delivery/Attempts.h"
#include "transfer/ftp/FtpArrival.h"
#include "transfer/ftp/FtpFolderOwner.h"
#include "transfer/ftp/FtpLists.h"

#include <QStringList>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace lumora {

struct Platform;

// One FTP session with the lab's server: opens, connects, enters the lab's folders, makes the order's folder, puts,
// lists, deletes. It does not decide what to send. Each call blocks; events are pumped between calls.
// Its states: closed, open (hOpen), connected (bActiveSession), in the order's folder. The sender runs through them
// once for each file and once for each check, so that a broken connection costs at most the present file. Where the lab
// keeps the session, once for a pass and its check, and again after a fault; each folder is entered by its name then,
// and none but the order's own is listed.
class FtpSession {
public:
    FtpSession(SessionState& state, const Platform& platform, SendingEvents& events, SendingStop& stop,
               FtpLists& lists);

    // The order of OrderFolder begins: nothing of it has been put. Reads its state.
    void beginOrder();
    // The state of that order. Before beginOrder there is none.
    OrderJournal* journal() { return m_journal ? &*m_journal : nullptr; }
    // A step that could not be kept on this machine is told once a pass.
    void keep(const Result<void>& written);
    // The put of this file was confirmed. With the guards a release that fails is not told: the next take is.
    void release(const QString& path);
    // Why a step of this pass could not be kept that has to be kept before the server hears of it: nothing was put.
    const std::optional<Failure>& unkept() const { return m_unkept; }
    // Begins a pass: resets its counters, and failures that are told once a pass may be told again.
    void beginPass();

    // Takes host, user and password from the client profile.
    void takeSettings();

    void FtpOpenInternet();
    void FtpConnectServer();
    void EnterFolderTK1();
    void EnterFolderTK2();
    // The four steps above with their pauses. FolderOk: the lab's folder was found.
    void walkToLabFolder();
    // The lab keeps the session from file to file.
    bool isKept() const { return m_transfer.keptFtpSession; }
    // The folders beside the order's into List5, for which a kept session has not asked. Leaves the order's folder.
    void listOrderFolders();

    // True when the current directory is the one of the order folders.
    bool insideOrderBase() const;
    // Enters the order's folder and makes it if it is missing. False on failure: nothing may be put then.
    bool EnterOrderFolder();
    // Enters an order's folder that the server has and reads its names into List6. False on failure and where the
    // folder is another order's, with List6 unchanged.
    // made: the server has just answered well that it made the folder.
    bool enterListedFolder(const QString& name, bool made = false);
    // The same where the connection stands in the order's folder.
    bool listOrderFolder() { return lookAround(m_transfer.ShemTikiya, false); }
    bool inOrderFolder() const { return m_inOrderFolder; }
    // What the listing at entering the folder proves of files of the order, by FtpArrival.
    bool provesArrival() const { return m_arrival.decides(); }
    bool isOther(const QString& path);
    bool isWhole(const QString& path);
    std::optional<ArrivalProof> prove(const QStringList& paths);
    bool lineEndsChanged(const QString& path);
    bool lineEndsExplain(const ArrivalProof& proof, const QStringList& paths) const;
    // The folder under this order's name belongs to another order: nothing may be put.
    bool folderIsForeign() const { return m_owner == FtpFolderOwner::Owner::Foreign; }
    bool FtpMakeOrderDir(const QString& name);

    // Puts one file, whose name stands in the order's state until the put is confirmed. A failed put is added to
    // LogList, List7 and List4Broken. False without a session, too.
    bool FtpSendFile(const QString& path);
    // The two halves of it, between which the caller puts the file. The first gives the file to be put, or why there is
    // nothing to put; where unkept() has a value then, nothing may be put. The second tells whether it was put well.
    Result<HostPath> beginPut(const QString& path);
    bool endPut(const QString& path, const Result<void>& sent);
    // So many files of the order were put well or skipped.
    void countFiles(int sent);
    // Writes List4Broken to kashloo.txt. A failed write is told once a pass.
    void keepBrokenFiles();
    // Errors are ignored: the file is often not there.
    void remove(const QString& remoteName);

    // Read a directory into colNames and colAttrs. An empty directory gives one empty name; on failure both are empty
    // and the session is closed.
    void ListRemote(const QString& dir);
    void ListRemoteHere();
    void ListRemoteChecked();
    // The first line of the last listing that could not be read; the listing proves nothing then.
    const QString& unreadLine() const { return m_listing.unread; }
    enum class Target { List1, List2, List4, List5, List6 };
    void FillListFromNames(Target target, const QString& dir);

    // Gives the connection that stands in the order's folder out of hand; takes back one that does, or none.
    std::unique_ptr<FtpConnection> lend();
    void takeBack(std::unique_ptr<FtpConnection> connection);
    // Opens a further connection that stands in the order's folder, on whatever thread, without a word.
    std::function<Result<std::unique_ptr<FtpConnection>>()> opener() const;

    void FtpCloseConnection(); // closes the connection and keeps the session
    void FtpCloseAll();
    void closeSession(); // closes connection and session
    QString CurrentRemoteDir();
    void PauseBar(int times = 1);

    // The manual panel, in the current remote directory. A failure closes the session.
    void putHere(const DrivePath& path);
    void getHere(const QString& remoteName, const DrivePath& localFolder);
    void removeHere(const QString& remoteName);
    void makeGoop();

    // Reads the server's reply to the failed command into LastResponse.
    void takeResponse(const Failure& failure);
    // Adds a line to LogList: hour and minute without separator and padding, then text.
    void log(const QString& text);

    bool hOpen = false;
    std::unique_ptr<FtpConnection> hConnection;
    bool bActiveSession = false;
    bool passive = true; // passive mode: the client opens the data connection
    int dwType = 1;      // transfer type ASCII; no other value is ever set
    QStringList colNames;
    std::vector<int> colAttrs; // 16 for a folder
    bool FolderOk = false;
    std::int16_t ConnectFails = 0;
    std::int16_t RoundNo = 0;
    QString FtpHost, FtpUser, FtpPass;
    QString MikumBaSharat;        // current remote directory without its leading slash
    QString RemoteDirectory;      // last directory asked for
    QString LastResponse;         // the server's reply to the last refused command
    bool connectTimedOut = false; // the last connect: every try ran into the time limit

private:
    void tell(SendingMoment moment, int number = 0) { m_events.reached(moment, number); }
    void trouble(LineStep step, const Failure& failure, const QString& subject = {});
    void tellOnce(bool& told, SendingMoment moment, int number = 0);
    void pump();
    void openFolder(const QString& name, int level);
    bool connect();
    void enterByNames();
    bool lookAround(const QString& name, bool made);
    bool joinHere();
    QStringList foldersOfLab() const;
    void tellFolder(int level);
    Internet::DataChannel dataChannel() const {
        return passive ? Internet::DataChannel::Passive : Internet::DataChannel::Active;
    }
    bool FtpChangeDir(const QString& dir);
    void ClearListing();
    Result<FtpListing> find(EmptyFolder empty = EmptyFolder::IsListed);
    void listHere(EmptyFolder empty);
    bool joinOrderFolder(const QString& name, bool made);
    bool mayJoin(const QString& name, bool made);
    bool mayGoOn(const Result<void>& written);
    void take(const FtpListing& listing);
    void FtpFatalError(const Failure& failure, const QString& source);
    void listHereAgain();

    const ClientProfile& m_profile;
    TransferState& m_transfer;
    const bool& m_careful;
    const Platform& m_platform;
    SendingEvents& m_events;
    SendingStop& m_stop;
    FtpLists& m_lists;
    std::optional<OrderJournal> m_journal;
    FtpFolderOwner m_folderOwner;
    FtpFolderOwner::Owner m_owner = FtpFolderOwner::Owner::NotKnown; // of the order's folder, until it is known
    FtpArrival m_arrival;
    QList<RemoteFile> m_inFolder; // the files that List6 names
    FtpListing m_listing;         // that was read last
    bool m_inOrderFolder = false;
    bool m_putBegun = false; // a put of this order has been tried, so its folder may hold something
    // Each file of a pass opens a session; these failures are told once a pass.
    bool m_noInternetTold = false;
    bool m_noSessionTold = false;
    bool m_notKeptTold = false;
    std::optional<Failure> m_unkept;
};

bool CheckFtpSettings(const ClientProfile& profile);

} // namespace lumora
