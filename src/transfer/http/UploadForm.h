#pragma once

#include "session/Ticker.h"
#include "transfer/delivery/SendingPage.h"
#include "transfer/http/HttpSender.h"

namespace lumora {

// The controls of the page that sends by HTTP.
struct UploadFormControls : SendingControls {
    Caption TxtWeb{*this, u"TxtWeb"};         // the last answer, or the list file's text
    Caption TxtFromWeb{*this, u"TxtFromWeb"}; // the list file's text
    Caption TxtUrl{*this, u"TxtUrl"};         // the rest of the upload's query

    static constexpr int Picture1FullWidth = 330;
    Caption Picture1{*this, u"Picture1", Caption::At::Hidden}; // panel of the countdown
    int Picture1Width = 0;
    Caption Picture5{*this, u"Picture5", Caption::At::Hidden};
    Caption Picture6{*this, u"Picture6", Caption::At::Hidden}; // the end panel
    Caption Pic4Timer{*this, u"Pic4Timer", Caption::At::Hidden};
    Caption Pic4Hamten{*this, u"Pic4Hamten", Caption::At::Hidden}; // the bar that moves in each pause
    int Pic4HamtenWidth = 0;
    static constexpr int PicSargel2Width = 1000;
    int PicSargel1Width = 0; // 0 to PicSargel2Width

    Caption Image4{*this, u"Image4"};
    Caption Image5{*this, u"Image5", Caption::At::Hidden};       // send again
    Caption Command2{*this, u"Command2", Caption::At::Hidden};   // refresh
    Caption Command3{*this, u"Command3", Caption::At::Hidden};   // stop
    Caption Command10{*this, u"Command10", Caption::At::Hidden}; // continue
    Caption Command15{*this, u"Command15", Caption::At::Greyed}; // enabled during a sending; has no handler
    Caption endClose{*this, u"endClose", Caption::At::Hidden};   // close, at the end

    Caption Label1{*this, u"Label1"};                                // number of the attempt
    Caption Label4{*this, u"Label4"};                                // index of the last posted file
    Caption Label7{*this, u"Label7"};                                // percent
    Caption Label8{*this, u"Label8"};                                // seconds of the countdown
    Caption Label9{*this, u"Label9", Caption::At::Hidden};           // "sending"
    Caption Label10{*this, u"Label10"};                              // the shop's telephone
    Caption Label4Tel{*this, u"Label4Tel", Caption::At::Hidden};     // the same in a sentence
    Caption Label11{*this, u"Label11", Caption::At::Hidden};         // "this order went up in full"
    Caption Label12{*this, u"Label12"};                              // files left
    Caption Label4Left{*this, u"Label4Left", Caption::At::Hidden};   // the same in a sentence
    Caption Label13{*this, u"Label13"};                              // "the sending starts in"
    Caption Label14{*this, u"Label14"};                              // "seconds"
    Caption Label4Count{*this, u"Label4Count", Caption::At::Hidden}; // the countdown in a sentence, or Label11
    Caption Label15{*this, u"Label15"};                              // name of the order folder
    Caption Label16{*this, u"Label16"};                              // the same in the end panel
    Caption Label4Rshom{*this, u"Label4Rshom"};                      // "write down the order number"
    Caption Label4Alu{*this, u"Label4Alu"};                          // "the files went up"
    Caption Label4Tashlum{*this, u"Label4Tashlum"};                  // "call the shop about payment"
    Caption Label4Notru{*this, u"Label4Notru"};                      // "files left to send"
    Caption Pic4Trouble{*this, u"Pic4Trouble", Caption::At::Hidden}; // card of a failure during a sending
};

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
    void Command2_Click() { refreshList(); }
    void Command4_Click() { findMissing(); }
    void Command3_Click() { stopCount(); }
    void Command10_Click() { goOn(); }
    void Command28_Click() { leaveForAnother(); }
    void Image5_Click() { sendAgain(); }
    void Image3_Click() { leaveProgram(); }

    // Events that no control sends, the lab's tests of its scripts; in UploadFormUnused.cpp.
    void Command1_Click(); // "Upload File"
    void Command5_Click();
    void Command6_Click(); // "GetUrlSource"
    void Command7_Click(); // "BdokBaSharat"
    void Command8_Click();

    // State.
    const UploadFormControls& controls() const override { return *this; }
    const HttpLists& lists() const { return m_sender.lists; }
    bool counting() const { return Timer1.running() || Timer2.running(); } // the panel grows or the seconds count

    // The signal is Page::changed().

private:
    void begin() override;
    void leave() override;
    bool idle() const;
    void growPanel();
    void countSecond();
    void stopTimers() override;
    LabReport& report() override { return m_sender.report; }
    ReportCalls* reportCalls() override { return &m_sender; }
    void startPanel();
    void refreshList();
    void findMissing();
    bool mayBeSent();
    void stopCount();
    void goOn();
    void sendAgain();
    void sendMissing();
    void succeed();
    void endAllThere();
    void leaveForAnother();

    // UploadFormTexts.cpp
    std::span<const PhaseLook> looks() const override;
    void showPhase(const PhaseLook& row) override;
    void showCount();
    void showTrouble();
    void showLeft();
    void showOrder();
    void showAnswers();

    // UploadFormUnused.cpp
    template <class Test>
    void run(const Test& test);

    // UploadFormEvents.cpp
    void reached(SendingMoment moment, int number) override;
    void progressed(int index, int count) override;
    void sending(int index, int count, const QString& name) override;
    void pieceSent(double, std::optional<int>) override {}
    void failed(LineStep step, const Failure& failure, const QString& subject) override;
    void brokenNotKept(const Failure& failure) override;
    void enteredFolder(int, const QString&, const QString&) override {}
    void pausing(int round) override;

    Ticker Timer1; // 1 ms: the panel grows
    Ticker Timer2; // 1000 ms: the countdown
    HttpSender m_sender;
    bool m_busy = false;          // a check outside an attempt runs
    bool m_attemptFailed = false; // an attempt of this sending has left files behind
    std::optional<int> m_left;    // files that have not arrived, once they are counted
    QString m_orderName;          // as the server was asked for it
};

} // namespace lumora
