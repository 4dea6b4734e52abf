#pragma once

#include "common/DrivePath.h"
#include "editing/HeldButton.h"
#include "editing/editor/DragHandle.h"
#include "editing/redeye/KeptCorrection.h"
#include "editing/redeye/RedEyePicture.h"
#include "editing/redeye/RedEyeSight.h"
#include "editing/redeye/RedIControls.h"
#include "session/Page.h"
#include "session/Ticker.h"

#include <QPointF>

#include <optional>

namespace lumora {

struct EditFields;
struct Platform;
struct SessionState;
class PageChain;

// RedI, "red-eye correction" in the glossary: the customer places a circle on each red pupil and has the red taken out
// of it.
//
// The corrected picture goes to a file of its own, which the editor and the print use from then on; the customer's file
// is opened for reading only; as built in each visit starts from it again.
class RedI : public Page, private RedIControls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::RedI;

    RedI(SessionState& state, const Platform& platform, PageChain& chain);
    ~RedI() override;

    void load() override;
    void setTexts() override;

    // --- events ---

    // Shows the page and loads the picture (a drive path). One that can't be read is told, and the page closes.
    void open(const DrivePath& path);

    // Moving about. Points of the overview are in shares of 1, all others in pixels of the picture.
    enum class Button { Left, Right };
    void Command6_Click() { drawOverview(); }
    void Picture3_Click(QPointF at) { goTo(at); }
    void Picture1_MouseDown(Button button, QPointF at) { press(button, at); }
    void Picture1_MouseMove(QPointF at) { drag(at); }
    void Picture1_MouseUp(QPointF at) { letGo(at); }
    void Picture1_MouseLost() { loseHold(); } // the pointer was taken away: no pick
    void Image12_MouseDown() { beginHold(Timer2); }
    void Image13_MouseDown() { beginHold(Timer3); }
    void Image14_MouseDown() { beginHold(Timer4); }
    void Image15_MouseDown() { beginHold(Timer5); }
    void Arrow_MouseUp() { endArrow(); }
    static constexpr int arrowStep = 2; // pixels of the picture, each 100 ms
    void Timer2_Tick() { moveCircle(Timer2, 0, -arrowStep); }
    void Timer3_Tick() { moveCircle(Timer3, 0, arrowStep); }
    void Timer4_Tick() { moveCircle(Timer4, -arrowStep, 0); }
    void Timer5_Tick() { moveCircle(Timer5, arrowStep, 0); }
    void CommandCloser_Click() { magnify(m_sight.Magnification * 2); }
    void CommandFurther_Click() { magnify(m_sight.Magnification / 2); }

    // The circle's size
    void Image10_MouseDown() { holdSize(-1); }
    void Image11_MouseDown() { holdSize(1); }
    void Size_MouseUp() { endHold(); }
    void Timer1_Tick() { resizeOnce(); }
    void Combo1_Change(int index) { turnWheel(index); }
    // Ends a held button: the pointer was lost, or the page went. A button that has not ticked does nothing.
    void stopHolds() { m_held.end(HeldButton::End::Lost); }

    // Corrections
    void RedFix(int level);
    void Image2_Click() { RedFix(0); }
    void Image16_Click() { deepenAndClean(); }
    void Command13_Click() { findPeak(); }
    void Command3_Click() { correctByHand(); }
    void HScroll1_Change(int value) { setLevel(value); } // in tens
    void Image6_Click() { darkenWithNotice(); }
    void Frame6_Click() { darken(); }
    void Image6_MouseMove() { tellWhenToDarken(); }
    void Timer7_Tick() { hideNotice(); }
    void CleanList(); // sets List2 to List1 without repeats
    void Image7_Click() { goBack(); }
    void Image5_Click() { cancelAll(); }

    // The menu
    void kofez_Open() { openMenu(); }
    void kofez_Close() { closeMenu(); }
    void Bsisi_Click() { fixFromMenu(0); }
    void amok2_Click() { fixFromMenu(15); }
    void amok3_Click() { fixFromMenu(30); }
    void amok4_Click() { fixFromMenu(45); }
    void amok5_Click() { fixFromMenu(65); }
    void amok_Click() { deepen(); }
    void Memokad_Click() { closeMenu(); }
    void Rstor_Click() { cancelAll(); }

    void CommandHelp_Click() { openHelp(); }
    void CommandHelpClose_Click() { show(FrameHelp, false); }
    void Image8_Click() { accept(); }
    void Image9_Click() { leave(); }

    // RedIUnused.cpp: the hand-placed variant by a press on the patch, in points of the patch.
    void Image1_MouseUp();
    void Image1_MouseDown(Button button, QPointF at);

    // --- state ---

    const RedIControls& controls() const override { return *this; }
    const RedEyeSight& sight() const { return m_sight; }
    const RedEyePicture& picture() const { return m_picture; }
    // Where the customer stands: 1 find the eye, 2 fit the circle, 3 correct, 4 accept.
    int stepNumber() const { return static_cast<int>(m_step) + 1; }
    bool holds() const { return m_held.isHeld(); }
    QString readings() const; // for the operator: the pixel under the mouse, the peak, the counts
    QString helpText() const;

private:
    enum class Step { FindEye, Place, Aim, Corrected };

    bool ready() const { return !busy && !m_picture.Picture1.isNull(); }
    bool canCorrect() const { return ready() && RedTargetRectangle.visible; }

    void drawOverview();
    void goTo(QPointF share);
    void press(Button button, QPointF at);
    void drag(QPointF at);
    void letGo(QPointF at);
    void loseHold();
    void place(QPoint centre);
    void magnify(int to);
    void beginHold(Ticker& timer);
    void endHold() { m_held.end(HeldButton::End::LetGo); }
    void endArrow();
    void moveCircle(const Ticker& timer, int right, int down);
    void holdSize(int step);
    void resizeOnce();
    void turnWheel(int index);
    void resizeCircle(int by);

    bool keepUndoCopy(const QRect& part);
    void takePatch();
    void correct();
    void deepen();
    void deepenAndClean();
    void fixFromMenu(int level);
    void findPeak();
    void correctByHand();
    void correctByHand(int passes, QPoint meant);
    void setLevel(int tens);
    void darken();
    void darkenWithNotice();
    void tellWhenToDarken();
    void hideNotice();
    void goBack();
    void cancelAll();
    void afterGoingBack();
    void forgetLists();
    void markCorrected();

    void openMenu();
    void closeMenu() { show(kofez, false); }
    void openHelp();
    void accept();
    void leave();
    void close();
    Result<void> saveCorrected();
    void giveUpCorrected();
    void waitFor(const QString& text);
    void endWait();
    void tellFailure(const QString& hebrew, const QString& english, const Failure& failure) const;

    void show(Caption& control, bool on);
    void readPatch(QPoint pixel);
    void showPeak();
    void showPixel(QRgb pixel, QPoint at);
    void showCounts();
    void showLevel();
    void showState();

    const SessionState& m_state;
    EditFields& m_edit;
    const Platform& m_platform;
    PageChain& m_chain;
    RedEyeSight m_sight;
    RedEyePicture m_picture;
    const KeptCorrection m_kept;
    int m_sizeStep = 0;
    DragHandle m_drag;
    QPointF m_pressed;                     // where the drag began
    std::optional<float> m_averageRedness; // of the patch that was last corrected by hand
    bool m_dragged = false;
    Ticker Timer1, Timer2, Timer3, Timer4, Timer5, Timer7;
    HeldButton m_held;
    Step m_step = Step::FindEye;
};

} // namespace lumora
