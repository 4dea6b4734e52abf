#pragma once

#include "platform/files/Files.h"
#include "session/Ticker.h"
#include "transfer/ftp/FtpFrmControls.h"
#include "transfer/ftp/FtpSender.h"

namespace lumora {

// FtpFrm, "sending an order by FTP" in the glossary: the customer waits while one order folder is sent to the lab's
// server. The page lists the files, counts down, sends, and tries again what has not arrived, four times in all. After
// success it sends the two reports. After a stop or a failure the local folder is unchanged, so that the order can be
// sent again.
class FtpFrm : public SendingPage, private FtpFrmControls, private SendingEvents {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::FtpFrm;

    FtpFrm(SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    // Events.
    void Timer1_Tick() { countSecond(); }
    void Timer2_Tick() { blink(); }
    void Timer4Line_Tick() { watchLine(); }
    void Command12_Click() { sendOrder(); }
    void Command10_Click() { sendAgain(); }
    void Image5_Click() { sendNow(); }
    void Command23_Click() { holdOrGoOn(); }
    void Command18_Click() { holdCount(); }
    void Command15_Click() { stopSending(); }
    void Command21_Click() { stopSending(); }
    void Image3_Click() { close(); }
    void Command14_Click() { stay(); }
    void Command16_Click() { leaveProgram(); }
    void Command11_Click() { leaveProgram(); }
    void Command8_Click() { leaveProgram(); }
    void Command28_Click() { leaveForAnother(); }
    void Image4_Click() { openOrderFolder(); }
    void Command24_Click() { showLabArea(true); }
    void Command9_Click() { showLabArea(false); }
    void Command22_Click() { sendChainAfterFault(); }

    // Events of the lab's own area.
    void Command13_Click() { listNewOrder(); }
    void Command1_Click() { listResend(); }
    void Command2_Click() { refillAndSendInRounds(); }
    void Command4_Click() { sendInRounds(); }
    void Command17_Click() { sendChosenOrder(); }
    void Command19_Click() { sendChain(); }
    void Command25_Click() { checkChosenOrder(); } // BdikaAfterUploadB

    void ListRezefFiles_Click(int index) { chooseOrder(index); }
    void cmdInternetOpen_Click() { openByHand(); }
    void cmdClosehOpen_Click() { closeByHand(); }
    void chkPassive_Click(bool checked) { choosePassive(checked); }
    void optBin_Click() { chooseType(true); }
    void optAscii_Click() { chooseType(false); }
    void txtProxy_Change(const QString& text) { takeProxy(text); }
    void File1_Click(int index) { chooseLocal(index); }
    void List2_Click(int index) { chooseRemote(index); }
    void Command3_Click() { putChosen(); }
    void Command5_Click() { getChosen(); }
    void Command6_Click() { removeChosen(); }
    void Command7_Click() { makeRemoteFolder(); }

    // Events and routines that no control calls; in FtpFrmUnused.cpp.
    void Command26_Click() { showProof(); }
    void Command27_Click();
    void takeChain(const QStringList& folderNames); // fills ListRezefFiles
    // Prepares a resend of a folder from File1, as the page of finished orders does.
    void PrepareResendHere(const DrivePath& folder);
    // Shows the error number and the server's reply, and asks whether to close the session.
    void FtpFatalErrorAsk(const Failure& failure, const QString& source);

    // State.
    const FtpFrmControls& controls() const override { return *this; }
    const FtpLists& lists() const { return m_sender.lists; }
    const FtpSender& sender() const { return m_sender; }
    bool counting() const { return Timer1.running(); }

    // The signal is Page::changed().

private:
    // FtpFrm.cpp
    void begin() override;
    void leave() override;
    void countSecond();
    void blink();
    void holdOrGoOn();
    void holdCount();
    void startCount() override;
    void stopTimers() override;
    LabReport& report() override { return m_sender.report; }
    const LabReport& report() const override { return m_sender.report; }
    ReportCalls* reportCalls() override;
    bool lineInUse() const override { return busy(); }
    void showSeconds();
    void showSecondsAfterFailure();
    void sendOrder();
    void sendAgain();
    void sendNow();
    void stopSending();
    void close();
    void stay();
    void leaveForAnother();
    void openOrderFolder();
    void showLabArea(bool shown);
    bool busy() const; // the line is in use
    bool canSend() const;
    bool inPieces() const;
    void finish(SendingPhase end);
    void showEnd(SendingPhase end);
    void succeed();
    void tellOfArrival();
    void showFailure();
    void showProof();
    void watchLine() { m_sender.watch(); } // each second of a sending
    bool orderMayBeSent();                 // what List3 names makes an order
    void prepareOrderAgain();              // the order's number is another order's on the server
    void tellForeign();
    void FtpEnableControls(bool enable);

    // FtpFrmTexts.cpp
    std::span<const PhaseLook> looks() const override;
    QString advice(const PhaseLook& row) const override;
    void showPhase(const PhaseLook& row) override;
    void showPercent(int share);
    void showMinutes();
    void showFileCount(int files);
    void showCounts();
    void showAttempt(int attempt);
    void showStoppedBoxes();
    void showNoServerBoxes();

    // FtpFrmLabTexts.cpp
    void setLabTexts();
    void showHasArrived();
    void showFailedByHand();
    void showStoppedByHand();

    // FtpFrmEvents.cpp
    void reached(SendingMoment moment, int number) override;
    void progressed(int index, int count) override;
    void sending(int index, int count, const QString& name) override;
    void pieceSent(double share, std::optional<int> minutes) override;
    void movedBytes(qint64 there, qint64 all, std::optional<int> minutes) override;
    void failed(LineStep step, const Failure& failure, const QString& subject) override;
    void notKept(const Failure& failure) override;
    void enteredFolder(int level, const QString& asTold, const QString& withoutSlash) override;
    void pausing(int round) override;
    void status(const QString& text);
    void captionFollowsStatus();
    void showIncomplete(int missing);

    // FtpFrmOrder.cpp
    void beginNewOrder();
    void beginResend();
    bool settingsFound();
    void clearLists();
    void listFolder();
    void listFiles(const DrivePath& folder, const QString& pattern);
    QStringList filesForResend(const DrivePath& folder);
    void addProofPicture();
    void countPictures();
    void ShowOrderSummary();
    void armCountdown();
    void refuseOrder();

    // FtpFrmLabArea.cpp
    bool mayAct() const;
    bool mayList();
    void listNewOrder();
    void listResend();
    void refillAndSendInRounds();
    void sendInRounds();
    void sendChosenOrder();
    void sendChain();
    void sendChainAfterFault();
    void SendChainOrder(const QString& name);
    void checkChosenOrder();
    void listOnServer();
    void chooseOrder(int index);
    void showLabButtons();

    // FtpFrmManual.cpp
    template <class Step>
    void byHand(const Step& step);
    bool inSession();
    QString chosenRemoteName();
    void openByHand();
    void closeByHand();
    void choosePassive(bool passive);
    void chooseType(bool binary);
    void takeProxy(const QString& text);
    void chooseLocal(int index);
    void chooseRemote(int index);
    void putChosen();
    void getChosen();
    void removeChosen();
    void makeRemoteFolder();

    FileList m_files;  // the names of File1
    Ticker Timer1;     // 1000 ms: the countdown
    Ticker Timer2;     // 500 ms: the blinking
    Ticker Timer4Line; // 1000 ms: the watch over the line
    FtpSender m_sender;
    QStringList m_handedOver; // paths from the page of finished orders
    int m_fileCount = 0;      // of the order, as the sending counts them
    std::optional<int> m_printCount;
    std::optional<int> m_minutesLeft; // known from the second piece on, of a kept session once the pace is
    bool m_incomplete = false;        // the pass has left files behind
    bool m_byHand = false;            // a step of the manual panel is under way
    // Command26 shows the proof picture if a page has set both; none does.
    bool m_proofWanted = false;
    QString m_proofText;
};

} // namespace lumora
