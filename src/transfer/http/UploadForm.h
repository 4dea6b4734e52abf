#pragma once

#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"
#include "transfer/delivery/LineTrouble.h"
#include "transfer/http/ServerList.h"
#include "transfer/http/UploadScript.h"

namespace lumora {

class PageChain;
struct Platform;
struct SessionState;

// The second sending page: puts one finished order folder on the lab's web server, file by file, and asks scripts there
// which files arrived. The answer to an upload is never taken for success, only the server's list is. Three attempts go
// by themselves; a further one takes a click. The local folder stays as it is but for the list fetched into it.
class UploadForm : public Page {
    Q_OBJECT
public:
    UploadForm(SessionState& state, const Platform& platform, PageChain& chain);

    void setTexts() override;

    // Events.
    void Form_Activate();   // the page has come up
    void Timer1_Tick();     // the panel grows
    void Timer2_Tick();     // one second of the countdown
    void Command2_Click();  // refresh the list
    void Command4_Click();  // what is missing on the server
    void Command3_Click();  // stop the sending
    void Command10_Click(); // continue the sending
    void Command28_Click(); // a new order
    void Image5_Click();    // up to three attempts, anew
    void Image3_Click();    // close

    // Events of the hidden area: the makers' test buttons.
    void Command1_Click(); // "Upload File"
    void Command5_Click();
    void Command6_Click(); // "GetUrlSource"
    void Command7_Click(); // "BdokBaSharat"
    void Command8_Click();

    // State.
    TextList List4Kvazim;   // every file of the order folder, full paths
    TextList List4Hossarim; // the files still missing, full paths
    TextList ListAfterWeb;  // entries of the last listing
    TextList ListInOrder;   // entries of the list file
    Caption TxtWeb;         // the last answer, or the list file's text
    Caption TxtFromWeb;     // the list file's text
    Caption TxtUrl;         // the rest of the upload's query
    QString caption;        // title of the window

    static constexpr int Picture1FullWidth = 330;
    Caption Picture1; // the countdown's panel
    int Picture1Width = 0;
    Caption Picture5;
    Caption Picture6; // the end panel
    Caption Pic4Timer;
    Caption Pic4Hamten; // the bar that runs in each pause
    int Pic4HamtenWidth = 0;
    static constexpr int PicSargel2Width = 1000;
    int PicSargel1Width = 0; // 0 to PicSargel2Width
    int percent = 0;
    Caption Image3; // close
    Caption Image4;
    Caption Image5;        // send now, or again
    Caption Command2;      // refresh
    Caption Command3;      // stop
    Caption Command10;     // continue
    Caption Command28;     // a new order; shown in the end states
    Caption Command15;     // enabled while files travel, and without a handler
    Caption Label1;        // which attempt
    Caption Label4;        // index of the file that travels
    Caption Label7;        // percent
    Caption Label8;        // seconds of the countdown
    Caption Label9;        // "sending"
    Caption Label10;       // the shop's telephone
    Caption Label11;       // "this order went up in full"
    Caption Label12;       // files left
    Caption Label13;       // "the sending starts in"
    Caption Label14;       // "seconds"
    Caption Label15;       // name of the order folder
    Caption Label16;       // the same in the end panel
    Caption Label4Rshom;   // "write down the order number"
    Caption Label4Alu;     // "the files went up"
    Caption Label4Tashlum; // "call the shop about payment"
    Caption Label4Notru;   // "files left to send"
    Caption Label4File;    // "file 3 of 17: name"; empty while nothing travels
    Caption Label4Do;      // what the customer can do now
    Caption Label4Reason;  // what the last failure of the line means
    Ticker Timer1;         // 1 ms
    Ticker Timer2;         // 1000 ms
    bool sending = false;
    bool verifying = false; // every file has gone, and the server is asked which have arrived
    bool done = false;      // all has arrived
    bool failed = false;    // three attempts were not enough, or nothing can be sent

    // The signal is Page::changed().

private:
    enum class Phase {
        Checking,
        NoOrder,
        NoServer,
        Countdown,
        Stopped,
        Sending,
        Verifying,
        Reporting,
        Success,
        AllThere,
        NotAll,
    };

    void activateWhenFree();
    void enter(Phase phase);
    void showWhatToDo();
    void leavePage();
    bool idle() const;
    void pump();
    void BuildOrderFileList();
    void startPanel();
    void takeAllAsMissing();
    void showMissingCount();
    QString folderName() const;
    QString siteAddress(const QString& rest) const;

    void HttpAttempts();
    void HttpSendFiles(int listNumber);
    void ShowHttpProgress();
    void HttpPause(int times = 1);
    ServerVerdict CheckOrderOnServer(int listNumber);
    void HttpFetchFileListN(int listNumber);
    void HttpSendReport();
    void HttpSendDone();
    QString FetchUrl(const QString& url);
    void finishSuccess();
    void tellReason(LineStep step, const Failure& failure, const QString& file = {});
    LineStep listTrouble() const;

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    UploadScript m_script;
    Failure m_listFailure; // of the last list file that was asked for; no message when it was fetched
    Phase m_phase = Phase::Checking;
    bool m_activated = false;
    bool m_busy = false; // a check runs
    bool m_left = false; // the customer has left: every loop ends at its next step
};

} // namespace lumora
