#pragma once

#include "platform/files/Files.h"
#include "session/Page.h"
#include "session/Ticker.h"
#include "transfer/ftp/FtpBoard.h"

#include <memory>

namespace lumora {

class PageChain;
struct Platform;
struct SessionState;
struct UploadRoom;

// The sending page: takes one finished order folder and gets all of its files onto the lab's server. It lists them,
// counts down, sends each on a connection of its own, then looks at what arrived and goes round again for what did not,
// four times in all. Success sends the two reports. A stop or a failure leaves the local folder as it is, so that the
// order can be sent again.
class FtpFrm : public Page, public FtpBoard {
    Q_OBJECT
public:
    FtpFrm(SessionState& state, const Platform& platform, PageChain& chain);
    ~FtpFrm() override;

    void load() override;
    void setTexts() override;

    // Events.
    void Form_Activate();   // the page has come up: a new order or a resend begins by itself
    void Timer1_Tick();     // one second of the countdown
    void Timer2_Tick();     // blinks
    void Command12_Click(); // send: up to four attempts
    void Command10_Click(); // send again, all that is missing
    void Image5_Click();    // send now, without waiting for the countdown
    void Command23_Click(); // stop the countdown, go on with it
    void Command18_Click(); // stop the countdown
    void Command15_Click(); // stop the sending
    void Command21_Click(); // stop the sending
    void Image3_Click();    // close
    void Command14_Click(); // do not close after all
    void Command16_Click(); // close although nothing was sent
    void Command11_Click(); // exit
    void Command8_Click();  // exit
    void Command28_Click(); // a new order
    void Image4_Click();    // order number to the clipboard, folder on the screen
    void Command24_Click(); // show the hidden area
    void Command9_Click();  // hide it
    void Command22_Click(); // "press here in case of a communication fault"

    // Events of the hidden area.
    void Command13_Click(); // before sending: a new order
    void Command1_Click();  // before sending: a resend
    void Command2_Click();  // older bulk path: refill and send
    void Command4_Click();  // older bulk path: up to three rounds
    void Command17_Click(); // one order of the chain
    void Command19_Click(); // all orders of the chain
    void Command25_Click(); // BdikaAfterUploadB: what of the chosen order has arrived
    void Command26_Click(); // shows the proof picture
    void Command27_Click(); // copy
    void Command3_Click();  // put
    void Command5_Click();  // get
    void Command6_Click();  // delete
    void Command7_Click();  // make dir
    void cmdInternetOpen_Click();
    void cmdClosehOpen_Click();
    void optBin_Click();
    void optAscii_Click();
    void chkPassive_Click(bool checked);
    void File1_Click(int index);
    void List2_Click(int index);
    void ListRezefFiles_Click(int index);

    // State: see FtpBoard. The file list of the order folder and the timers stand here.
    FileList File1;
    Ticker Timer1;              // 1000 ms
    Ticker Timer2;              // 500 ms
    std::int16_t AllDone = 0;   // 1 after success; read by the close button
    std::int16_t NumToSend = 0; // number of files that make up the order

    // The signal is Page::changed().

    // Takes one chain order by its folder name and sends it.
    void SendChainOrder(const QString& name);
    // Makes a resend of a folder from File1 itself, as the finished-orders page does. No caller.
    void PrepareResendHere(const QString& folder);
    // The routine with the yes/no box that the makers meant for a fatal error. No caller.
    void AskAfterFatalError();

private:
    enum class Phase {
        Preparing, // the order's folder is being read: start controls would find nothing yet
        NoOrder,
        NoServer,
        Countdown,
        Waiting,
        Sending,
        Checking,
        Reporting,
        Success,
        NotAll,
        Stopped,
        Silent,
    };

    // FtpFrm.cpp
    void activateWhenFree();
    void setButtonTexts();
    void setPanelTexts();
    void showWhatToDo();
    void enter(Phase phase);
    void leaveProgram();
    void leavePage();
    QString silentEndText() const;
    void stopTimers();
    void addProofPicture();

    // FtpFrmOrder.cpp
    bool settingsFound();
    void beginList();
    void listFolder();
    bool orderIsChosen() const;
    void CountOrderPictures();
    void ShowOrderSummary();
    void armCountdown();

    // FtpFrmAttempts.cpp
    Phase RunAttempts();
    bool checkAttempt(int attempt);
    void showNotAll();
    void showFailure();
    void SendSuccess();
    void finish(Phase phase);

    // FtpFrmHidden.cpp
    bool inSession(const QString& message);
    QString chosenRemoteName();

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    std::unique_ptr<UploadRoom> m_room; // the rules at work
    QStringList m_handedOver;           // the lines that the finished-orders page gave
    Phase m_phase = Phase::Preparing;
    bool m_activated = false;
    // Asked for by Command26, set by no page.
    bool m_proofWanted = false;
    QString m_proofText;
};

} // namespace lumora
