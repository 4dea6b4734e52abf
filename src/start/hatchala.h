#pragma once

#include "platform/Platform.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"
#include "session/lab/Deployment.h"

#include <array>

namespace lumora {

class PageChain;
struct SessionState;

// The start page: greets the customer, starts an order, shows the way to the price list and the site, switches the
// language, and can ask at which shop the prints are fetched. Every load begins in Hebrew with the profile of the
// deployment.
class hatchala : public Page {
    Q_OBJECT
public:
    hatchala(SessionState& state, const Platform& platform, PageChain& chain, const Deployment& deployment);

    void load() override;
    void setTexts() override;

    // --- events ---

    // The start button: the press hands over; the click comes only when the page stayed, and then opens the question of
    // the shop.
    void Image1_MouseDown();
    void Image1_Click();
    void Image11_Click();            // price list on the web
    void Image5_Click();             // the lab's site
    void Image8_Click();             // the same, its second picture
    void Image3_MouseDown();         // ends the program
    void Check1_Click(bool checked); // English wording
    void List1_Click(int row);       // the shop, also when the row is chosen already
    void Command1_Click();
    void Command2_Click();

    // Where the mouse, a finger or the keyboard is; what has no help counts as the bare page.
    enum class Hover { Nothing, Image1, Image11, Image5, Image3, Image6 };
    void MouseMove(Hover over);
    void Picture1_Escape(); // the question of the shop is put off: the page waits as before

    void Timer1_Tick();
    void Timer2_Tick();
    void Timer3_Tick();
    void Timer4_Tick();
    void Timer5_Tick();
    void StartAutomatically();

    // The service panel: settings as one line of text. No step of the page chain shows it.
    void Command3_Click(); // "Read"
    void Command4_Click(); // "myzofen"
    void Command5_Click(); // "shoora"
    void Command6_Click(); // "open zofen"
    void Command7_Click() {}
    void Command8_Click();
    void Command9_Click() {}
    // Builds the settings text of the profile, writes the settings file and shows both forms of it.
    void BuildSettingsText();
    // Fetches the remote copy to the settings file; tells nothing of a failure.
    void DownloadSettings();
    // The lines of the settings file into List2; "No Server" for a file that is missing or is not this client's.
    void ReadSettingsFile(const QString& path);
    void SplitSettingsText(const QString& text);

    // --- state ---

    Caption Title;  // the page's greeting
    Caption Notice; // a line left by the page before, such as the number of an order that stays here; hidden when there
                    // is none
    Caption Image1; // start
    Caption Image11;     // price list
    Caption Image5;      // site
    Caption Image8;      // the site's own name
    Caption Image6;      // how to reach the lab
    Caption Image3;      // exit
    CheckCaption Check1; // "English Tips"
    Caption Label1;      // the lab's mail address
    Caption Label4Tel;   // the lab's telephone
    Caption Label4Tel2;
    Caption Label4Zel; // the shadow of Label4Tel
    Caption Label3;    // what the button for the site does, in English
    Caption Label4;    // what the exit does, in English
    Caption Label6;    // the countdown's number
    Caption Label7;    // the countdown's text
    Caption Label8;    // the arrow that moves above the start button
    static constexpr int arrowTop = 400;
    static constexpr int arrowBottom = 430;
    int Label8Top = arrowTop;
    Caption Picture1; // the panel with List1
    static constexpr int panelWidth = 230;
    int Picture1Width = 0; // grows to panelWidth
    Caption List1Caption;  // what is asked
    TextList List1;        // where the prints are fetched; row 0 is always the first shop
    Caption Picture2;      // decoration that gives way to the help picture
    Caption Picture3;      // the line above a help picture; in English the question of the shop
    Caption Image2;
    std::array<Caption, 6> Image12; // help pictures by Hover, index 0 unused
    QString Picture4;               // drive path of the advertising picture; empty when there is none
    static constexpr int pictureWidth = 265;
    int Picture4Width = pictureWidth; // 4 to pictureWidth
    Caption Command1;
    Caption Command2;

    Caption Picture8; // the service panel
    Caption Command3;
    Caption Command4;
    Caption Command5;
    Caption Command6;
    Caption Command7;
    Caption Command8;
    Caption Command9;
    Caption Label5; // the settings text
    TextList List2; // lines of the settings file
    TextList List4pices;

    Ticker Timer1; // fetches the advertising picture, once; no step starts it
    Ticker Timer2; // moves the advertising picture
    Ticker Timer3; // opens the panel
    Ticker Timer4; // countdown to the automatic start; no step starts it
    Ticker Timer5; // moves the arrow

Q_SIGNALS:
    // Label8Top, Picture1Width or Picture4Width has moved by a step: dozens of times a second, so that a view moves
    // just that piece. The page may wait for hours.
    void moved();

private:
    void loadProfile();
    void showProfile();
    void setHelp();
    void startWith(const QString& code);
    void handOver();
    QString settingsFile() const;

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    const Deployment& m_deployment;
    int m_pictureStep = 0; // the picture moves once it has been at a limit
    Hover m_over = Hover::Nothing;
    bool m_leaving = false;
};

} // namespace lumora
