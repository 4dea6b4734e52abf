#pragma once

#include "editing/HeldButton.h"
#include "editing/caption/CaptionGuard.h"
#include "editing/caption/CaptionStep.h"
#include "editing/caption/mikledetControls.h"
#include "session/Page.h"
#include "session/Ticker.h"

#include <QPoint>

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

// mikledet, "on-screen keyboard" in the glossary: the customer writes a picture's caption on it, below the editor's
// picture.
//
// The page changes the caption's fields of the edit state, and the editor takes them after each change, so that the
// picture and the list follow at once. Positions of the caption are in pixels of the preview.
class mikledet : public Page, private mikledetControls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::mikledet;
    static constexpr int mostLetters = 60;

    mikledet(SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    // --- events ---

    // Begins with this caption. The editor brings the page to the front.
    void open(const QString& text, bool onPicture);

    void leter_Click(int key) { press(key); }
    void Command1_Click() { typeBlank(); }
    void Command3_Click() { takeBack(); }
    void Command7_Click() { breakLine(); }
    void Command6_Click() { clear(); }
    void Command4_Click() { relabel(KeyLayout::Letters::Hebrew); }
    void Command9_Click() { relabel(KeyLayout::Letters::Small); }
    void Command2_Click() { relabel(KeyLayout::Letters::Capital); }
    void Command5_Click() { turnSymbols(); }
    void Command8_Click() { putOnPicture(false); } // its text stays in the record
    void Check4_Click(bool on) { putOnPicture(on); }
    void Combo1_Click(int index) { chooseFont(index); }
    void CommandDone_Click() { backToEditor(); }
    // A key of a real keyboard. A character that can't be printed is refused with a message.
    void KeyPress(QChar character) { takeKey(character); }

    void Image1_MouseDown() { holdSize(CaptionStep::step); }
    void Image2_MouseDown() { holdSize(-CaptionStep::step); }
    void Image15_MouseDown(int direction) { holdArrow(direction); } // left, right, up, down
    void Image1_MouseUp() { endHold(HeldButton::End::LetGo); }
    void Image2_MouseUp() { endHold(HeldButton::End::LetGo); }
    void Image15_MouseUp() { endHold(HeldButton::End::LetGo); }
    void Timer1_Tick() { moveOnce(); }
    void Timer2_Tick() { resizeOnce(); }
    // Ends a held button: the pointer was lost, or the page went. A button that has not ticked does nothing.
    void stopHolds() { endHold(HeldButton::End::Lost); }

    void Image3_Click() { change(CaptionStep::nextStyle); }
    void Image4_Click() { change(CaptionStep::turn); }
    void Image5_Click(int alignment) { align(alignment); }  // near, centre, far
    void Picture18_MouseDown(QPoint at) { takeColour(at); } // a pixel of the palette

    // mikledetUnused.cpp
    void Command10_Click(); // fills the font list and takes its first
    void Command13_Click();
    void Command14_Click();

    // --- state ---

    const mikledetControls& controls() const override { return *this; }
    int style() const; // 0 regular, 1 bold, 2 italic, 3 both
    bool runsDown() const;
    QRgb colour() const;

private:
    void press(int key);
    void takeKey(QChar character);
    void type(const QString& text);
    void typeBlank();
    void takeBack();
    void breakLine();
    void clear();
    void textChanged();
    void relabel(KeyLayout::Letters to);
    void turnSymbols();
    void putOnPicture(bool on);
    void chooseFont(int index);
    void align(int alignment);
    void takeColour(QPoint at);
    void change(void (*step)(EditFields& edit));
    void commitText();
    void commitStep();
    void refresh();
    void holdArrow(int direction);
    void holdSize(std::int16_t step);
    void holdMove(std::int16_t x, std::int16_t y);
    void moveOnce();
    void resizeOnce();
    void endHold(HeldButton::End how);
    void backToEditor();

    const SessionState& m_state;
    EditFields& m_edit;
    const Platform& m_platform;
    PageChain& m_chain;
    Ticker m_timer1;
    Ticker m_timer2;
    HeldButton m_held;
    const CaptionGuard m_guard;
};

} // namespace lumora
