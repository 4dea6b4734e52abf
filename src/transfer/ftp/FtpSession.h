#pragma once

#include "common/Result.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "transfer/delivery/Attempts.h"
#include "transfer/ftp/FtpLists.h"

#include <QStringList>

#include <memory>
#include <vector>

namespace lumora {

struct Platform;

// One FTP session with the lab's server: opens it, connects, walks down to the lab's folders, makes the order's folder,
// puts, lists, deletes. It never decides what to send. Each call blocks; between calls events are pumped.
//
// Closed, then open (hOpen), connected (bActiveSession), in the order's folder, and closed again: the sender runs this
// cycle once for each file and once for each check, so that a broken line never costs more than the file in hand.
class FtpSession {
public:
    FtpSession(const ClientProfile& profile, TransferState& transfer, const Platform& platform, SendingEvents& events,
               SendingStop& stop, FtpLists& lists);

    // A pass begins: its counters, and each trouble that is told once a pass may be told again.
    void beginPass();

    // Host, user and password from the client profile.
    void takeSettings();

    void FtpOpenInternet();
    void FtpConnectServer();
    void EnterFolderTK1();
    void EnterFolderTK2();
    // The four above with their pauses. FolderOk tells whether the lab's folder was found.
    void walkToLabFolder();

    // True if the walk has ended where order folders lie.
    bool insideOrderBase() const;
    // Enters the order's folder, or makes it. False if it could not be entered: nothing must be put then.
    bool EnterOrderFolder();
    // Enters an order's folder that the listing of the base showed, and lists it into List6. False if that failed;
    // List6 stays then.
    bool enterListedFolder(const QString& name);
    bool inOrderFolder() const { return m_inOrderFolder; }
    void FtpMakeOrderDir(const QString& name);

    // One put. False if it failed, which LogList, List7 and List4Broken then tell; nothing happens without a session.
    bool FtpSendFile(const QString& path);
    // kashloo.txt as List4Broken is now. A write that fails is told once a pass.
    void keepBrokenFiles();
    // The answer is not examined: deleting what is not there is normal here.
    void remove(const QString& remoteName);

    // Listings into colNames and colAttrs. An empty directory gives one empty name; a listing that fails gives none and
    // ends the session.
    void ListRemote(const QString& dir);
    void ListRemoteHere();
    void ListRemoteChecked();
    enum class Target { List1, List2, List4, List5, List6 };
    void FillListFromNames(Target target, const QString& dir);

    void FtpCloseConnection(); // the connection alone
    void FtpCloseAll();
    void closeSession(); // both
    QString CurrentRemoteDir();
    void PauseBar(int times = 1);

    // The manual panel: in the current remote directory. A failure ends the session.
    void putHere(const QString& path);
    void getHere(const QString& remoteName, const QString& localFolder);
    void removeHere(const QString& remoteName);
    void makeGoop();

    // The server's own words at a refusal, fetched into LastResponse.
    void takeResponse(const Failure& failure);
    // A line of LogList: hour and minute without a separator and without padding, then the text.
    void log(const QString& text);

    bool hOpen = false;
    std::unique_ptr<FtpConnection> hConnection;
    bool bActiveSession = false;
    bool passive = true; // the server's side opens the data channel
    int dwType = 1;      // transfer type ASCII; no other value ever reaches it
    QStringList colNames;
    std::vector<int> colAttrs; // 16 for a folder
    bool FolderOk = false;
    std::int16_t ConnectFails = 0;
    std::int16_t RoundNo = 0;
    QString FtpHost, FtpUser, FtpPass;
    QString MikumBaSharat;   // remote current directory without its leading slash
    QString RemoteDirectory; // the directory that was last asked for
    QString LastResponse;    // the server's own words at the last refusal

private:
    void tell(SendingMoment moment, int number = 0) { m_events.reached(moment, number); }
    void tellOnce(bool& told, SendingMoment moment, int number = 0);
    void pump();
    void openFolder(const QString& name, int level);
    bool FtpChangeDir(const QString& dir);
    void ClearListing();
    Result<std::vector<FtpEntry>> find();
    void take(const std::vector<FtpEntry>& entries);
    void FtpFatalError(const Failure& failure, const QString& source);
    void listHereAgain();

    const ClientProfile& m_profile;
    TransferState& m_transfer;
    const Platform& m_platform;
    SendingEvents& m_events;
    SendingStop& m_stop;
    FtpLists& m_lists;
    bool m_inOrderFolder = false;
    // A pass opens a session for each file; these troubles are told once.
    bool m_noInternetTold = false;
    bool m_noSessionTold = false;
    bool m_notKeptTold = false;
};

// True when the profile names a host, a user and a password.
bool CheckFtpSettings(const ClientProfile& profile);

} // namespace lumora
