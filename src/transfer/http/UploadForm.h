#pragma once

#include "session/Ticker.h"
#include "transfer/delivery/SendingPage.h"
#include "transfer/http/HttpSender.h"
#include "transfer/http/UploadFormControls.h"

namespace lumora {

// UploadForm, "sending an order by HTTP" in the glossary: the customer waits while one order folder is sent to the
// lab's web server. Three attempts follow each other; a further one needs a click. The local folder is unchanged but
// for the server's list that is downloaded into it.
class UploadForm : public SendingPage, private UploadFormControls, private SendingEvents {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::UploadForm;

    UploadForm(SessionState& state, const Platform& platform, PageChain& chain);

    void setTexts() override;

    // Events.
    void Timer1_Tick() { growPanel(); }
    void Timer2_Tick() { countSecond(); }
    void Timer4Line_Tick() { watchLine(); }
    void Command2_Click() { refreshList(); }
    void Command4_Click() { findMissing(); }
    void Command3_Click() { stopCount(); }
    void Command10_Click() { goOn(); }
    void Command15_Click() { stopSending(); }
    void sendNow_Click() { endCount(); }
    void Command28_Click() { leaveForAnother(); }
    void Image5_Click() { sendAgain(); }
    void Image3_Click() { leaveProgram(); }
    void Command24_Click() { showLabArea(true); }
    void Command9_Click() { showLabArea(false); }

    // Events of the lab's own area.
    void Command1_Click() { postTestPicture(); } // "Upload File"
    void Command5_Click() { postNothing(); }
    void Command6_Click() { fetchTestListing(); } // "GetUrlSource"
    void Command7_Click() { checkOrder(); }       // "BdokBaSharat"
    void Command8_Click() { fetchListFile(); }

    // State.
    const UploadFormControls& controls() const override { return *this; }
    const HttpLists& lists() const { return m_sender.lists; }
    bool counting() const { return Timer1.running() || Timer2.running(); } // the panel grows or the seconds count

    // The signal is Page::changed().

private:
    void begin() override;
    void startCount() override { startPanel(); }
    void leave() override;
    bool idle() const;
    void growPanel();
    void countSecond();
    void stopTimers() override;
    LabReport& report() override { return m_sender.report; }
    const LabReport& report() const override { return m_sender.report; }
    ReportCalls* reportCalls() override { return &m_sender; }
    bool lineInUse() const override { return m_busy; }
    void startPanel();
    void refreshList();
    void findMissing();
    void watchLine() { m_sender.watch(); }
    void stopCount();
    void endCount();
    void stopSending();
    void goOn();
    void sendAgain();
    void sendMissing();
    bool tellOfArrival();
    void succeed();
    void endAllThere();
    void endIncomplete(SendingPhase end);
    void prepareOrderAgain();
    void leaveForAnother();

    // UploadFormTexts.cpp
    std::span<const PhaseLook> looks() const override;
    void showPhase(const PhaseLook& row) override;
    void showCount();
    void showTrouble();
    void showAttemptsOver();
    void showLeft();
    void showOrder();
    void showAnswers();

    // UploadFormLabArea.cpp
    void showLabArea(bool shown);
    void setLabTexts();
    void showLabButtons();
    template <class Test>
    void run(const Test& test);
    void postTestPicture();
    void postNothing();
    void fetchTestListing();
    void checkOrder();
    void fetchListFile();

    // UploadFormEvents.cpp
    void reached(SendingMoment moment, int number) override;
    void progressed(int index, int count) override;
    void sending(int index, int count, const QString& name) override;
    void pieceSent(double, std::optional<int>) override {}
    void movedBytes(qint64, qint64, std::optional<int>) override {}
    void failed(LineStep step, const Failure& failure, const QString& subject) override;
    void notKept(const Failure& failure) override;
    void enteredFolder(int, const QString&, const QString&) override {}
    void pausing(int round) override;

    Ticker Timer1;     // 1 ms: the panel grows
    Ticker Timer2;     // 1000 ms: the countdown
    Ticker Timer4Line; // 1000 ms: the watch over the line
    HttpSender m_sender;
    bool m_busy = false;          // a check or a test of the lab's area uses the line
    bool m_attemptFailed = false; // an attempt of this sending has left files behind
    std::optional<int> m_left;    // files that have not arrived, once they are counted
    QString m_orderName;          // as the server was asked for it
};

} // namespace lumora
