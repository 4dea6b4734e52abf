#pragma once

#include "platform/line/Internet.h"
#include "transfer/ftp/FtpDesk.h"

#include <memory>
#include <vector>

namespace lumora {

enum class LineStep;

// The thin layer between the sending page and the FTP server: opens a session, connects, walks down to the lab's
// folders, makes the order's folder, puts, lists, deletes. It never decides what to send. Each call blocks; between
// calls events are pumped.
//
// Closed, then open (hOpen), connected (bActiveSession), in the order's folder, and closed again: the sender runs this
// cycle once for each file and once for each check, so that a broken line never costs more than the file in hand.
class FtpSession {
public:
    explicit FtpSession(FtpDesk& desk);

    // A pass begins: its counters, and each box of a failed line may come once more.
    void beginPass();

    // Host, user and password from the client profile.
    void takeSettings();

    void FtpOpenInternet();
    void FtpConnectServer();
    void EnterFolderTK1();
    void EnterFolderTK2();
    // FolderOk tells whether the walk succeeded. captions: the window's title follows the status line at each step.
    enum class Captions { Follow, Stay };
    void reconnect(Captions captions);

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
    void closeSession(); // both, and the controls that go with it
    void FtpEnableControls(bool enable);
    QString CurrentRemoteDir();

    // The system's only pause: rounds of repaint and event pumping, no clock.
    void PauseBar(int times = 1);

    // Shows number, server's reply and a question whether to close. No caller.
    void FtpFatalErrorAsk(const Failure& failure, const QString& source);

    // The manual panel: in the current remote directory. A failure ends the session.
    void putHere(const QString& path);
    void getHere(const QString& remoteName, const QString& localFolder);
    void removeHere(const QString& remoteName);
    void makeGoop();

    // A line of LogList: hour and minute without a separator and without padding, then the text.
    void log(const QString& text);
    void tell(LineStep step, const Failure& failure, const QString& subject = {});

    bool hOpen = false;
    std::unique_ptr<FtpConnection> hConnection;
    bool bActiveSession = false;
    int dwType = 1; // transfer type ASCII; no other value ever reaches it
    QStringList colNames;
    std::vector<int> colAttrs; // 16 for a folder
    bool FolderOk = false;
    std::int16_t ConnectFails = 0;
    std::int16_t RoundNo = 0;
    QString FtpHost, FtpUser, FtpPass;
    QString MikumBaSharat; // remote current directory without its leading slash
    QString LastResponse;  // the server's own words at the last refusal

private:
    void openFolder(const QString& name, Target target, Caption& asTold, Caption& withoutSlash);
    bool FtpChangeDir(const QString& dir);
    void ClearListing();
    Result<std::vector<FtpEntry>> find();
    void take(const std::vector<FtpEntry>& entries);
    void FtpFatalError(const Failure& failure, const QString& source);
    void listHereAgain();

    FtpDesk& m_desk;
    FtpBoard& m_board;
    bool m_inOrderFolder = false;
    // A pass asks for a session for each file; its boxes come once.
    bool m_noLineTold = false;
    bool m_noSessionTold = false;
    bool m_noListKeptTold = false;
};

// True when the profile names a host, a user and a password.
bool CheckFtpSettings(const SessionState& state);

} // namespace lumora
