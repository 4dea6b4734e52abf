#pragma once

#include "entry/album/AlbumPanels.h"
#include "entry/details/DetailsCheck.h"
#include "platform/Platform.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"

#include <array>

namespace lumora {

class PageChain;
struct SessionState;

// The details page: a menu of kinds of order, then one step after another (details, paper, border, fit, terms) up to
// the choice of pictures. Exactly one step is open at a time.
class nnn : public Page {
    Q_OBJECT
public:
    nnn(SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    enum class Step {
        Menu,    // Image1
        Details, // Text2, Text3, Text4, Check2, Command10, Command12
        Options, // Frame4: Option1, Combo1, Option3
        Border,  // Picture4: Image13, Picture16, Command6
        Fit,     // Picture5: Option4, Option5
        Terms,   // Check1, Command29, Command3
        Album,   // the panels of a parent album
    };

    // --- events ---

    void Image1_Click(int tile);
    void Text2_Change(const QString& text);
    void Text3_Change(const QString& text);
    void Text4_Change(const QString& text);
    void Check2_Click(bool checked);   // remember the details
    void Command10_Click();            // details from memory
    void Command12_Click();            // from the details to the options
    void Option1_Click(int index);     // a quick size; also when it is chosen already
    void Combo1_Click(int index);      // one of all sizes; also when it is chosen already
    void Option3_Click(int index);     // paper kind; also when it is chosen already
    void Command8_Click();             // on from the options when a kind was chosen before
    void Image13_MouseDown(int index); // a border
    void Command6_Click();             // on from the border
    void Option4_Click();              // fit
    void Option5_Click();              // fill
    void Check1_Click(bool checked);   // agrees to the terms
    void Command29_Click();            // reads the terms
    void Command30_Click();            // closes the hint beside the terms
    void Command3_Click();             // the last button: checks, then the pictures
    void Command24_Click();            // the last button of an album, pressed once the album is checked
    void Command4_Click();             // one step back
    void Command2_Click();             // cancel: back to the menu
    void Command5_Click();             // fills the messages and texts in the language of the session
    void Command14_Click();            // opens Frame1
    void Command15_Click();            // clarifications and warnings
    void Command7_Click();             // cleans the history
    void Command9_Click();             // closes Frame1 without cleaning

    // The quick order by a name alone. Bound to no control.
    void QuickCheck();
    // Orders by a coupon for 220 and 3, or 350 and 5 pictures. Bound to no control.
    enum class Coupon { Small, Large };
    void CouponOrder(Coupon coupon);

    // --- state ---

    AlbumPanels album; // with its own events

    Step step = Step::Menu;
    Caption Title;     // what the open step asks for
    Caption StepLine;  // "step 2 of 5"; hidden in the menu
    Caption Choice;    // what was chosen so far: size, kind, border, fit
    Caption Label4Tel; // the lab's telephone, for a question

    std::array<Caption, 10> Image1; // tiles, with a line of explanation as hint
    int markedTile = -1;            // of the tiles 0 to 2

    Caption LabelText2; // captions of the boxes
    Caption LabelText3;
    Caption LabelText4;
    Caption Text2;           // name; the text is what the customer typed
    Caption Text3;           // telephone
    Caption Text4;           // delivery address, shown for home delivery
    bool Text4Calls = false; // the address is missing and its box calls for attention
    CheckCaption Check2;
    Caption Command10;
    Caption Command12;

    Caption Frame4; // sizes and kinds
    Caption LabelSizes;
    Caption LabelKinds;
    std::array<CheckCaption, 3> Option1;
    Caption Combo1;                      // its text: the prompt, or the size taken
    TextList Combo1List;                 // sizes on offer, current index the one chosen from it
    std::array<CheckCaption, 2> Option3; // matte, glossy
    Caption Label4kpn;                   // pictures that a coupon holds; hidden without one
    Caption Command8;

    Caption Picture4;                     // borders
    std::array<CheckCaption, 10> Image13; // text: the border code's name; checked: the one chosen
    int Picture16 = -1;                   // index of the border shown large; -1 none
    Caption Command6;

    Caption Picture5; // fit or fill
    CheckCaption Option4;
    CheckCaption Option5;
    Caption Label2; // "FIT"
    Caption Label3; // "FIL"

    CheckCaption Check1;
    Caption Command29;
    Caption Command30;
    Caption LabelTerms; // the hint that Command30 closes
    Caption Image4;     // decoration of the terms
    Caption Label8;     // the arrow to the last button
    Caption Command3;
    Caption Command24; // the same of an album; hidden, for the album's own last button presses it

    Caption Command2;
    Caption Command4;
    Caption Command14;
    Caption Command15;
    Caption Frame1; // the question whether to clean the history
    Caption Command7;
    Caption Command9;

    // The box that takes the keyboard next; a view moves the focus when the number has changed.
    QString focusBox;
    int focusRequest = 0;

    QString VolumeSerial;

private:
    void open(Step next);
    void showStep();
    bool beginTile();
    void clearChoices();
    void showProgress();
    void fillSizes();
    void afterKind();
    bool asksBorder() const;
    bool asksFit() const;
    bool termsAgreed(const CheckCaption& box);
    void rememberOrForget();
    void takeAlbum();
    bool nameGiven();
    QString sizesPrompt() const;
    void saveDetails();
    void focusOn(const QString& box);
    void refuse(const DetailsProblem& problem);
    void GoToSelection();
    bool prepareOrder();
    void tell(const QString& hebrew, const QString& inEnglish);

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    DetailsMessages m_messages;
    bool m_termsHint = true; // not closed by the customer yet
    bool m_leaving = false;
};

} // namespace lumora
