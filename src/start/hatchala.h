#pragma once

#include "common/DrivePath.h"
#include "order/UnfinishedOrders.h"
#include "platform/Platform.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"
#include "session/lab/Deployment.h"
#include "start/StartMotion.h"

namespace lumora {

class PageChain;
struct SessionState;

struct hatchalaControls : Controls {
    Caption Title{*this, u"Title"};                            // the page's greeting
    Caption Notice{*this, u"Notice", Caption::At::Hidden};     // left by the page before: the number of a kept order
    Caption Image1{*this, u"Image1"};                          // start
    Caption Image11{*this, u"Image11"};                        // price list
    Caption Image5{*this, u"Image5"};                          // site
    Caption Image8{*this, u"Image8"};                          // the site's own name
    Caption Image6{*this, u"Image6"};                          // how to reach the lab
    Caption Image3{*this, u"Image3"};                          // exit
    CheckCaption Check1{*this, u"Check1"};                     // "English Tips"
    Caption Command4Ivrit{*this, u"Command4Ivrit"};            // in its place in English: back to Hebrew
    Caption Label1{*this, u"Label1"};                          // the lab's mail address
    Caption Label4Tel{*this, u"Label4Tel"};                    // the lab's telephone
    Caption Label4Tel2{*this, u"Label4Tel2"};                  // the same
    Caption Label4Zel{*this, u"Label4Zel"};                    // the shadow of Label4Tel
    Caption Label3{*this, u"Label3", Caption::At::Hidden};     // in English, what the button for the site does
    Caption Label4{*this, u"Label4", Caption::At::Hidden};     // in English, what the exit does
    Caption Label6{*this, u"Label6", Caption::At::Hidden};     // the countdown's seconds
    Caption Label7{*this, u"Label7", Caption::At::Hidden};     // the countdown's text
    Caption Label8{*this, u"Label8"};                          // the arrow that moves above the start button
    Caption Label4How{*this, u"Label4How"};                    // heading of the steps to prints
    ControlArray<Caption, 3> Label4Step{*this, u"Label4Step"}; // the steps
    Caption Picture1{*this, u"Picture1", Caption::At::Hidden}; // the panel that asks for the shop
    Caption List1Caption{*this, u"List1Caption"};              // what is asked
    TextList List1{*this, u"List1"};                           // where the prints are fetched; row 0 is the first shop
    Caption shopsBack{*this, u"shopsBack"};                    // closes the question
    Caption Picture2{*this, u"Picture2"};                      // decoration; a help picture takes its place
    Caption Image2{*this, u"Image2"};                          // the same
    Caption Picture3{*this, u"Picture3", Caption::At::Hidden}; // the line above a help picture
    ControlArray<Caption, 6> Image12{*this, u"Image12", Caption::At::Hidden}; // help pictures by Hover, from index 1
    Caption Pic4Hemshech{*this, u"Pic4Hemshech", Caption::At::Hidden}; // the panel that offers an unfinished order
    Caption Label4Hemshech{*this, u"Label4Hemshech"};                  // its number, and how far it came
    Caption Label4Od{*this, u"Label4Od", Caption::At::Hidden};         // how many more there are
    Caption Command4Hemshech{*this, u"Command4Hemshech"};              // goes on with it
    Caption Command4Achar{*this, u"Command4Achar"};                    // puts it off
    Caption Command4Bitul{*this, u"Command4Bitul"};                    // throws it away
    Caption Label4Sfarot{*this, u"Label4Sfarot", Caption::At::Hidden}; // on a kiosk: the digits typed so far
    ControlArray<Caption, 10> Command4Sifra{*this, u"Command4Sifra", Caption::At::Hidden}; // the digits
    Caption Command4Mehak{*this, u"Command4Mehak", Caption::At::Hidden};                   // takes one back
    Caption Label4Mamtinot{*this, u"Label4Mamtinot", Caption::At::Hidden}; // for the staff: what waits for them
    DrivePath Picture4; // the file of the advertising picture; empty when there is none

    // Never shown: two buttons that code presses, and the service panel with the settings as one line of text.
    Caption Command1{*this, u"Command1", Caption::At::Hidden};
    Caption Command2{*this, u"Command2", Caption::At::Hidden};
    Caption Picture8{*this, u"Picture8", Caption::At::Hidden};
    Caption Command3{*this, u"Command3"};
    Caption Command4{*this, u"Command4"};
    Caption Command5{*this, u"Command5"};
    Caption Command6{*this, u"Command6"};
    Caption Command7{*this, u"Command7"}; // without effect
    Caption Command8{*this, u"Command8"};
    Caption Command9{*this, u"Command9"}; // without effect
    Caption Label5{*this, u"Label5"};     // the settings text
    TextList List2{*this, u"List2"};      // lines of the settings file
    TextList List4pices{*this, u"List4pices"};
};

struct hatchalaTimers {
    Ticker Timer1; // fetches the advertising picture, once; no step starts it
    Ticker Timer2; // moves the advertising picture
    Ticker Timer3; // opens the panel
    Ticker Timer4; // countdown to the automatic start; no step starts it
    Ticker Timer5; // moves the arrow
};

// hatchala, "the start page" in the glossary: the customer begins an order, opens the price list or the lab's site,
// changes the language, and says at which shop the prints are fetched if the lab asks for it. Each load begins in
// Hebrew with the profile of the deployment, and offers an order that was not finished.
class hatchala : public Page, private hatchalaControls {
    Q_OBJECT
public:
    hatchala(SessionState& state, const Platform& platform, PageChain& chain, const Deployment& deployment);

    void load() override;
    void setTexts() override;

    // --- events ---

    // The order begins on the press. The click comes only if the page has stayed, and then the shop must still be
    // chosen.
    void Image1_MouseDown() { startWith(QStringLiteral("KUP")); }
    void Image1_Click() { askForTheShop(); }
    void Image11_Click() { openPriceList(); }
    void Image5_Click() { openSite(); }
    void Image8_Click() { openSite(); }
    void Image3_MouseDown() { leaveProgram(); }
    void Check1_Click(bool checked) { setEnglish(checked); }
    void Command4Ivrit_Click() { setEnglish(false); }
    void List1_Click(int row) { chooseShop(row); } // also when the row is chosen already
    void Command2_Click() { startWithShop(); }
    void Picture1_Escape() { putOffTheQuestion(); }
    void Command4Hemshech_Click() { goOnWithOrder(); }
    void Command4Achar_Click() { putOffOrder(); }
    void Command4Bitul_Click() { throwOrderAway(); }
    void Command4Sifra_Click(int digit) { typeDigit(digit); }
    void Command4Mehak_Click() { takeDigitBack(); }
    // The control under the mouse or the finger, or with the keyboard focus; Nothing for a control without help.
    enum class Hover { Nothing, Image1, Image11, Image5, Image3, Image6 };
    void MouseMove(Hover over) { showHelp(over); }
    void Timer2_Tick() { movePicture(); }
    void Timer3_Tick() { unfoldPanel(); }
    void Timer5_Tick() { moveArrow(); }

    // No step of the page chain calls these; hatchalaUnused.cpp has them.
    void Command1_Click() { showSender(); }
    void Command3_Click() { fetchSettings(); }
    void Command4_Click() { scramble(); }
    void Command5_Click() { BuildSettingsText(); }
    void Command6_Click() { unscramble(); }
    void Command8_Click() { SplitSettingsText(Label5.text); }
    void Timer1_Tick() { fetchPicture(); }
    void Timer4_Tick() { countDown(); }
    // Begins an order at the end of the countdown.
    void StartAutomatically();
    // Builds the settings text of the profile, writes the settings file and shows both forms of it.
    void BuildSettingsText();
    // Fetches the remote copy to the settings file. After a failure there is no such file.
    void DownloadSettings();
    // Reads the lines of the settings file into List2; shows "No Server" if the file is missing or is not this
    // client's.
    void ReadSettingsFile(const DrivePath& path);
    void SplitSettingsText(const QString& text);

    // --- state ---

    const hatchalaControls& controls() const override { return *this; }
    bool isUntouched() const override;
    void leftAlone() override; // an offer that nobody took up lapses
    Hover hover() const { return m_over; }
    const StartMotion& motion() const { return m_motion; }
    const hatchalaTimers& timers() const { return m_timers; }

Q_SIGNALS:
    // --- signals, besides changed() ---

    // Tells one step of motion(). It comes dozens of times a second, and the page may wait for hours, so a view moves
    // only that piece.
    void moved();

private:
    void setHelp();
    void loadProfile();
    void showProfile();
    void startWith(const QString& code);
    void startWithShop();
    void handOver();
    void askForTheShop();
    void putOffTheQuestion();
    void chooseShop(int row);
    void openPriceList();
    void openSite();
    void leaveProgram();
    void stopTimers();

    // hatchalaOffer.cpp
    void offerUnfinished();
    void readUnfinished();
    void showOffer();
    void showDigits();
    void showWaiting();
    void showKept();
    void goOnWithOrder();
    void putOffOrder();
    void throwOrderAway();
    bool anotherRuns() const;
    void endCustomer();
    void offerToStaff();
    bool asksForDigits() const;
    void typeDigit(int digit);
    void takeDigitBack();
    bool asksToThrowAway(const QString& number);
    QString offerText(const UnfinishedOrder& order) const;

    void setEnglish(bool english);
    void showHelp(Hover over);
    void movePicture();
    void unfoldPanel();
    void moveArrow();

    void showSender();
    void fetchPicture();
    void countDown();
    void fetchSettings();
    void scramble();
    void unscramble();
    DrivePath settingsFile() const;

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    const Deployment& m_deployment;
    hatchalaTimers m_timers;
    StartMotion m_motion;
    Hover m_over = Hover::Nothing;
    QList<UnfinishedOrder> m_unfinished; // the first one is offered
    KeptOrder m_kept;
    bool m_recognised = false;  // on a kiosk: the customer of the first one has given the digits
    bool m_ofStaff = false;     // the offer was read for the staff
    QString m_digits;           // typed so far
    int m_wrongDigits = 0;      // times in a row
    bool m_asksForGone = false; // the panel asks whether to go on without the pictures that are gone
    int m_secondsLeft = 5;      // of the countdown
    bool m_leaving = false;
};

} // namespace lumora
