#pragma once

#include "editing/HeldButton.h"
#include "editing/editor/DragHandle.h"
#include "editing/redeye/RedEye.h"
#include "editing/redeye/RedUndoCopy.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"

#include <QPoint>
#include <QPointF>
#include <QRect>
#include <QRegion>

#include <cstdint>
#include <optional>
#include <utility>
#include <vector>

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

// Corrects red eyes in the full-size picture. The customer places a circle on a pupil; the red pixels under it turn
// grey. The corrected picture goes to a file of its own, which the editor and the print use from then on; the
// customer's file is opened for reading only, and each visit starts from it again.
//
// Two coordinates: a point of the picture is in its own pixels; the viewing area is a surface whose middle is (500,
// 400), on which the picture's corner lies at (Picture1Left, Picture1Top) and one pixel takes Magnification units.
class RedI : public Page {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::RedI;

    RedI(SessionState& state, const Platform& platform, PageChain& chain);
    ~RedI() override;

    void load() override;
    void setTexts() override;

    // Shows the page and loads the picture (a drive path). One that can't be read is told, and the page closes.
    void open(const QString& path);

    enum class Button { Left, Right };

    // Events: moving about
    void Command6_Click();                              // fits the overview and draws it
    void Picture3_Click(QPointF at);                    // a point of the overview, in shares of 1
    void Picture1_MouseDown(Button button, QPointF at); // points of the picture
    void Picture1_MouseMove(QPointF at);
    void Picture1_MouseUp(QPointF at); // one that hardly moved picks the point
    void Picture1_MouseLost();         // the pointer was taken away: no pick
    void Image12_MouseDown();          // the arrows: up, down, left, right
    void Image13_MouseDown();
    void Image14_MouseDown();
    void Image15_MouseDown();
    void Arrow_MouseUp();
    void Timer2_Tick();         // up
    void Timer3_Tick();         // down
    void Timer4_Tick();         // left
    void Timer5_Tick();         // right
    void CommandCloser_Click(); // shows the picture larger
    void CommandFurther_Click();

    // Events: the circle's size
    void Image10_MouseDown(); // smaller
    void Image11_MouseDown(); // larger
    void Size_MouseUp();
    void Timer1_Tick();
    // A press of a held button that ends before the first tick counts as one: a view calls this ahead of the MouseUp.
    void tickOnceIfNone();
    // The pointer was lost or the page went: nothing is held any more.
    void stopHolds();
    void Combo1_Change(int index); // a turn of the wheel

    // Events: corrections
    void RedFix(int level);
    void Image2_Click() { RedFix(0); }
    void Image16_Click();                             // once more, ten deeper, and the clean-up of the lists
    void Command13_Click();                           // the peak search
    void Command3_Click();                            // the hand-placed variant, round the middle of the circle
    void Image1_MouseUp();                            // the same
    void Image1_MouseDown(Button button, QPointF at); // right: four passes round this point of the patch
    void HScroll1_Change(int value);                  // the level in tens
    void Image6_Click();                              // darker
    void Frame6_Click();
    void Image6_MouseMove(); // tells when to press it
    void Timer7_Tick();
    void CleanList();    // List2 becomes List1 without repeats
    void Image7_Click(); // one step back
    void Image5_Click() { Rstor_Click(); }

    // Events: the menu
    void kofez_Open();
    void kofez_Close();
    void Bsisi_Click();
    void amok2_Click();
    void amok3_Click();
    void amok4_Click();
    void amok5_Click();
    void amok_Click();
    void Memokad_Click(); // only closes the menu
    void Rstor_Click();   // back to the customer's picture

    // Events: the instructions, all at once
    void CommandHelp_Click();
    void CommandHelpClose_Click();

    // Events: leaving
    void Image8_Click(); // accept
    void Image9_Click();

    // The pixel under the mouse, for the operator.
    void Picture7_MouseMove(QPointF at); // a point of the patch

    // State
    QString caption; // drive path of the picture; "***" while there is none
    Bitmap Picture1; // the whole picture at full size: what is edited
    double Picture1Left = 0;
    double Picture1Top = 0;
    int Magnification = 1;      // 1, 2 or 4
    Bitmap Picture3;            // the overview
    PictureSize Picture3Size;   // its logical size: 250 wide or 300 high
    Caption RedTargetRectangle; // the yellow circle
    QRect circle() const;       // its square, in pixels of the picture; may reach over the edge
    Caption Image1;             // the patch as it was, while the work runs
    Bitmap Image1Picture;
    Bitmap Picture7;    // the patch in work
    Bitmap Picture2;    // the result
    QRect patchPlace;   // where Picture7 belongs in Picture1
    Caption Frame6;     // a darkening button beside the patch
    QPoint Frame6Place; // of its corner, in pixels of the picture
    TextList List1;     // pixels changed, "x^y" within the patch
    TextList List2;     // List1 without repeats
    TextList Combo1;    // what a turn of the wheel adds
    int HScroll1 = 0;
    static constexpr int HScroll1Max = 10;
    bool busy = false;  // a picture is being read or written
    Caption Label4Busy; // what the customer waits for
    Caption Label1, Label2, Label3, Label12, Label24, Label27, Label28, Rlbl, Glbl, Blbl; // the pixel under the mouse
    Caption Label6, Label13, Label16, Label17; // peak and averages of the hand-placed variant
    enum class Order { Unknown, InOrder, OutOfOrder };
    Order Label6Order = Order::Unknown;                  // light green or light orange
    Caption Label25, Label30, Label31;                   // peak redness, less brightness, divided by brightness
    Caption Label37;                                     // level of the repeat step
    Caption Label42, Label43;                            // counts of List1 and List2
    Caption Label38, Label40, Label41, Label44, Label45; // what to do, step by step
    Caption FrameHelp;                                   // the instructions, all at once
    Caption LabelTitle;
    // Where the customer stands: 1 find the eye, 2 fit the circle, 3 correct, 4 accept.
    int stepNumber() const { return static_cast<int>(m_step) + 1; }
    Caption kofez, Bsisi, amok2, amok3, amok4, amok5, amok, Memokad, Rstor;
    Caption Image2, Image5, Image6, Image7, Image8, Image9, Image10, Image11, Image12, Image13, Image14, Image15,
        Image16, Command3, Command6, Command13, CommandCloser, CommandFurther, CommandMenu, CommandMenuClose,
        CommandHelp, CommandHelpClose;

    std::int16_t RedFixLevel = 0; // how much deeper the correction goes
    bool RedChanged = false;      // Picture1 differs from the file
    int RedPeakValue = 0;
    int RedPeakX = 0;
    int RedPeakY = 0;
    int RedPeakBrightness = 1;
    int RedSearchX = 0; // the middle of the search, and of the circle
    int RedSearchY = 0;

    static constexpr int smallestCircle = 4;
    static constexpr int largestCircle = 1000;
    static constexpr int largestMagnification = 4;
    static constexpr QPoint viewingCentre{500, 400};

    Ticker Timer1, Timer2, Timer3, Timer4, Timer5, Timer7;

private:
    enum class Step { FindEye, Place, Aim, Corrected };

    bool ready() const { return !busy && !Picture1.isNull(); }
    bool canCorrect() const { return ready() && RedTargetRectangle.visible; }
    QString undoPath() const;
    void place(QPoint centre);
    void moveTo(double left, double top);
    void bringToCentre(QPointF at);
    void moveCircle(int dx, int dy);
    void resizeCircle(int by);
    void magnify(int to);
    void startHold(Ticker& timer);

    bool keepUndoCopy(const QRect& part);
    void takePatch();
    void putPatchBack();
    void correct();
    void fixFromMenu(int level);
    void fixByHand(int passes, std::optional<QPoint> centre);
    void takeStats();
    void darken();
    void forgetLists();
    void markChanged();
    void afterGoingBack(const QRegion& changedPart);
    void refreshOverview(const QRect& changedPart);

    void showPixel(QRgb pixel, QPoint at);
    void showCounts();
    void showLevel();
    void showState();
    Result<void> saveCorrected();
    void close();
    void waitFor(const QString& text);

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    RedUndoCopy m_undo;
    bool m_changedBefore = false;                       // RedChanged when the undo copy was made
    QRegion m_corrected;                                // where Picture1 may differ from the customer's file
    std::vector<std::pair<QPoint, Bitmap>> m_originals; // what the file holds there
    int m_circleSize = 40;
    int m_sizeStep = 0;
    RedEye::Peak m_peak;
    DragHandle m_drag;
    QPointF m_pressed; // where the drag began
    bool m_dragged = false;
    HeldButton m_held;
    Step m_step = Step::FindEye;
};

} // namespace lumora
