#pragma once

#include "editing/HeldButton.h"
#include "editing/caption/KeyLayout.h"
#include "imaging/Bitmap.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"

#include <QPoint>

#include <array>
#include <cstdint>

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

// The on-screen keyboard for a picture's caption, shown below the editor's picture. What it changes are the caption's
// fields of the edit state; after each change it presses the editor's Command11, so that the picture and the list
// follow at once. The editor sets Text1 and Check4 before it shows the page.
class mikledet : public Page {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::mikledet;

    mikledet(SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    // Events. Positions of the caption are in pixels of the preview.
    void leter_Click(int key); // adds the key's caption; the 61st letter is refused
    void Command1_Click();     // a blank, which reaches the picture with the next key
    void Command3_Click();     // takes the last character back
    void Command7_Click();     // a new line
    void Command6_Click();     // clears the text
    void Command4_Click();     // Hebrew letters
    void Command9_Click();     // small Latin letters
    void Command2_Click();     // capital Latin letters
    void Command5_Click();     // shows the further symbols; again: puts them away
    void Command8_Click();     // takes the caption off the picture; its text stays in the record
    void Check4_Click(bool on);
    void Command10_Click(); // fills the font list and takes its first
    void Combo1_Click(int index);
    void Command13_Click() {}
    void Command14_Click() {}
    void CommandDone_Click(); // back to the editor
    // A real keyboard does what the keys do. What can't be printed is refused.
    void KeyPress(QChar character);

    // Held: larger, smaller; left, right, up, down.
    void Image1_MouseDown();
    void Image1_MouseUp();
    void Image2_MouseDown();
    void Image2_MouseUp();
    void Image15_MouseDown(int direction);
    void Image15_MouseUp();
    void Timer1_Tick(); // moves by the step
    void Timer2_Tick(); // changes the size by the step
    // A press that ends before the first tick counts as one: a view calls this ahead of the MouseUp.
    void tickOnceIfNone();
    // Lets go of what is held, as when the pointer is lost.
    void stopHolding();

    void Image3_Click();                 // next style: regular, bold, italic, both
    void Image4_Click();                 // across or down
    void Image5_Click(int alignment);    // near, centre, far
    void Picture18_MouseDown(QPoint at); // takes the colour of this pixel of the palette

    // State
    Caption Text1; // what was typed; lines end in CR LF
    std::array<Caption, KeyLayout::keys> leter;
    KeyLayout::Letters letters = KeyLayout::Letters::Hebrew; // what the letter keys are labelled with
    CheckCaption Check4;                                     // the caption is on the picture
    TextList Combo1List;
    Caption Combo1;        // the font
    Caption Frame1;        // the panel of further symbols, keys KeyLayout::firstSymbol and on
    Bitmap Picture18Image; // the palette: equal fields of one colour each, side by side
    Caption Picture18;
    std::int16_t SizeStep = 0;
    std::int16_t MoveStepX = 0;
    std::int16_t MoveStepY = 0;
    Caption Title;
    Caption Command1, Command3, Command5, Command6, Command7, Command8, Command10, Command13, Command14, CommandDone;
    CheckCaption Command2, Command4, Command9; // the chosen letters are ticked
    Caption Image1, Image2, Image3, Image4;
    std::array<Caption, 4> Image15;     // left, right, up, down
    std::array<CheckCaption, 3> Image5; // near, centre, far

    static constexpr int mostLetters = 60;

private:
    void add(const QString& text);
    void textChanged();
    void commitText();
    void relabel(KeyLayout::Letters to);
    void refresh();
    void setTextOn(bool on);
    void holdSize(std::int16_t step);
    void holdMove(std::int16_t x, std::int16_t y);

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    Ticker m_timer1;
    Ticker m_timer2;
    HeldButton m_held;
};

} // namespace lumora
