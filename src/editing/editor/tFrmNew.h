#pragma once

#include "editing/HeldButton.h"
#include "editing/caption/CaptionGuard.h"
#include "editing/editor/ColourStep.h"
#include "editing/editor/CoverZoom.h"
#include "editing/editor/DragHandle.h"
#include "editing/editor/EditLimits.h"
#include "editing/editor/LineFrameChoice.h"
#include "editing/editor/PinchSteps.h"
#include "editing/editor/SeenFrame.h"
#include "editing/editor/tFrmNewControls.h"
#include "editing/redeye/KeptCorrection.h"
#include "editing/render/FrameLists.h"
#include "platform/files/HostPath.h"
#include "session/Page.h"
#include "session/Ticker.h"

#include <QPointF>

#include <cstdint>
#include <map>
#include <optional>

namespace lumora {

class BigPics;
class EditedPreview;
class PageChain;
struct EditFields;
struct Platform;
struct SessionState;

// tFrmNew, "the editor" in the glossary: the customer changes how one picture will be printed, its zoom, place, turn,
// colour, frame and caption.
//
// Each change goes into the edit fields of the session, which are packed into the record and handed to the page of
// pictures at once, so that leaving needs no saving. The controls differ on purpose in when they pack, draw and store.
// Positions are in the logical pixels of the paper, 450 wide when it lies and 300 when it stands; they may lie outside.
class tFrmNew : public Page, private tFrmNewControls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::tFrmNew;
    using Tone = ColourStep::Tone;

    tFrmNew(SessionState& state, const Platform& platform, PageChain& chain);
    ~tFrmNew() override;

    void load() override;
    void setTexts() override;

    // --- events: by other pages ---

    void openPicture();     // of the session's edit fields
    void takeCaption();     // the caption's fields were changed: packs, draws, stores, places Labeltext
    void takeCaptionStep(); // the same while a button is held: the record is stored by storedMeanwhile()
    void keepRecord();      // packs and stores
    void takeCorrection();  // the red-eye page has changed the corrected copy or its mark
    // Ends a held button and a drag: the pointer was lost, or the page went. A button that has not ticked does nothing.
    void stopHolds();

    void Command17_Click() { openPicture(); }
    void Command11_Click() { takeCaption(); }
    void Command5_Click() { keepRecord(); }

    // --- events: by the customer ---

    // Screen pixels for a logical pixel of the paper, held within 1 to largestScale so that a tick stays quick.
    static constexpr double largestScale = 2;
    void setPreviewScale(double scale);

    void Command2_Click() { pickAnotherPicture(); }
    void CommandDone_Click() { backToPictures(); }
    void Image29_Click() { turnHints(); }
    void Command8_Click() { writeCaption(); }
    void Command6_Click() { measureLevels(); }
    void CommandImprove_Click() { improve(); }
    void Command4_Click() { lookQuickly(); }
    // Paper of the next picture that is opened.
    void Command24_Click() { choosePaper(QStringLiteral("1014")); }
    void Command12_Click() { choosePaper(QStringLiteral("1015")); }
    void Command10_Click() { choosePaper(QStringLiteral("1318")); }
    void Command23_Click() { choosePaper(QStringLiteral("1521")); }

    // Image2: 0 and 1 closer and further, 3 and 4 darker and lighter (held); 5 undo, 6 red, 7 red-eye, 8 no added
    // colours, 10 blue (clicked). 2 and 9 do nothing.
    void Image2_MouseDown(int index) { holdTool(index); }
    void Image2_MouseUp(int) { endHold(); }
    void Image2_Click(int index) { useTool(index); }
    void Image2_MouseMove() { hidePanels(); }

    void Image135_MouseDown() { beginHold(Held::Right); }
    void Image115_MouseDown() { beginHold(Held::Left); }
    void Image125_MouseDown() { beginHold(Held::Up); }
    void Image145_MouseDown() { beginHold(Held::Down); }
    void Image16_MouseDown() { beginHold(Held::TurnRight); }
    void Image17_MouseDown() { beginHold(Held::TurnLeft); }
    void Image135_MouseUp() { endHold(); }
    void Image115_MouseUp() { endHold(); }
    void Image125_MouseUp() { endHold(); }
    void Image145_MouseUp() { endHold(); }
    void Image16_MouseUp() { endHold(); }
    void Image17_MouseUp() { endHold(); }
    // What a held button does each 50 ms.
    static constexpr int holdMilliseconds = 50;
    void Timer2_Tick() { zoom(); }
    void Timer3_Tick() { brighten(); }
    void Timer6_Tick() { turn(); }
    void Timer7_Tick() { moveAcross(); }
    void Timer8_Tick() { moveDown(); }

    void Image15_Click() { turnQuarterRight(); }
    void Image18_Click() { turnQuarterLeft(); }
    void Image27_Click() { turnTo(180); }
    void VScrollZ_Change(int value) { setBarZoom(value); }

    void PicPic_MouseDown(QPointF at) { beginDrag(at); }
    void PicPic_MouseMove(QPointF at) { drag(at); } // hides the panels also where nothing is dragged
    void PicPic_MouseUp() { endDrag(); }
    // Two fingers or the wheel: steps of Image2(0) and (1), and of Image16 and Image17, drawn and stored once.
    void PicPic_Pinch(PinchSteps::Steps steps) { pinch(steps); }
    void Labeltext_MouseDown(QPointF at) { beginCaptionDrag(at); }
    void Labeltext_MouseMove(QPointF at) { dragCaption(at); }
    void Labeltext_MouseUp() { endCaptionDrag(); }

    void Image4_Click() { takeTone(Tone::Grey); }
    void Image11_Click() { takeTone(Tone::Sepia); }
    void Image12_Click() { takeTone(Tone::Blue); }
    void Image9_Click() { takeTone(Tone::Green); }
    void Image5_Click() { backToColour(); }
    void Image13_MouseMove() { open(Panel::Tones); } // over the button of the tones, or pressed
    void Image15_MouseMove() { open(Panel::Turns); } // over the quarter turn

    void Combo4_Click(int index) { chooseCategory(index); }
    void Combo2_Click(int index) { chooseFrame(index); }
    void Image20_Click() { nextFrame(); }
    void Image21_Click() { previousFrame(); }
    void Image22_Click() { useFrame(); }
    void Image28_Click() { removeFrame(); }
    void Misgerett_Click(bool checked) { showFrames(checked); }
    void Command9_Click() { stepLineStyle(1); }
    void Command18_Click() { stepLineStyle(-1); }
    void Combo5_Click(int index) { chooseLineStyle(index); }
    void pic4Msgrt_MouseMove(QPointF at) { moveMarker(at); } // positions of the palette
    void PicInMsgrt_Click() { takeLineColour(); }

    // The crop markers, a display tool: nothing is cut by them.
    void Command14_Click() { markCorners(); }
    void Command13_Click() { markInset(); }
    void Command16_Click() { widenMarkers(CropFrame::step); }
    void Command15_Click() { widenMarkers(-CropFrame::step); }
    void CropHandle_MouseDown(CropFrame::Corner corner, QPointF at) { takeCorner(corner, at); }
    void CropHandle_MouseMove(QPointF at) { dragCorner(at); }
    void CropHandle_MouseUp() { releaseCorner(); }

    // The small view that the page of pictures stores, in logical pixels. Null if nothing was drawn since it was taken.
    Bitmap takeSmallView();

    // --- state ---

    const tFrmNewControls& controls() const override { return *this; }
    bool pictureOpen() const { return m_open; }
    int previewZoom() const { return PreviewZoom; } // per cent
    int turnDegrees() const;                        // clockwise from upright, -179 to 180
    int frameOnPicture() const;                     // its row in Combo2List, -1 for none of them
    // A small picture of a frame of Combo2List, its longer side 160 pixels; null when there is none.
    Bitmap framePicture(int index) const;
    // What a button does in one line, for customers who can't hover.
    static QString hintLine(const Caption& button);

Q_SIGNALS:
    // The record of the session is to be kept: the page of pictures listens.
    void stored();
    // The same of a step that is followed by stored() once the button is let go.
    void storedMeanwhile();
    // The customer goes back to the pictures.
    void left();
    // The customer picked a picture by its file, to see all pictures of its folder.
    void picked(const DrivePath& picture);

private:
    enum class Held { Closer, Further, Darker, Lighter, Right, Left, Up, Down, TurnRight, TurnLeft };
    enum class Panel { None, Tones, Turns }; // Frame3, Frame4

    // The way out of the page, and looking.
    void pickAnotherPicture();
    void backToPictures();
    void turnHints();
    void choosePaper(const QString& code) { PaperSizeCode = code; }
    void measureLevels();
    void lookQuickly();
    void open(Panel panel);
    void hidePanels();
    void markCorners();
    void markInset();
    void widenMarkers(int pixels);
    void takeCorner(CropFrame::Corner corner, QPointF at);
    void dragCorner(QPointF at);
    void releaseCorner() { m_cropHandle.release(); }

    // Held buttons, turning, dragging.
    void holdTool(int index);
    void beginHold(Held what);
    void dropHold();
    void endHold(HeldButton::End how = HeldButton::End::LetGo);
    void zoomReleased(HeldButton::End how);
    void zoom();
    void takeZoom(int step);
    void brighten();
    void turn();
    void moveAcross();
    void moveDown();
    void panBy(QPointF distance);
    void moveHandle(QPointF to);
    void turnQuarterRight();
    void turnQuarterLeft();
    void turnTo(std::int16_t code);
    void turnPicture(std::int16_t code);
    void setBarZoom(int percent);
    void pinch(PinchSteps::Steps steps);
    void beginDrag(QPointF at);
    void drag(QPointF at);
    void endDrag();

    // Colours.
    void useTool(int index);
    void changeColours(void (*step)(EditFields& edit));
    void improve();
    void takeTone(Tone tone);
    void backToColour();
    void undoAllEdits();
    void correctRedEyes();

    // Frames and line frames.
    void fillFrames(FrameLists::ListFile kind);
    void fillFramesIfEmpty();
    void chooseCategory(int index);
    void chooseFrame(int index);
    void nextFrame();
    void previousFrame();
    void useFrame();
    void takeFrame();
    void removeFrame();
    void showFrames(bool on);
    void tellFrameTakenOut();
    void tellNotImproved();
    const std::optional<Bitmap>& frame(const EditFields& fields);
    void stepLineStyle(int places);
    void chooseLineStyle(int index);
    void moveMarker(QPointF at);
    void takeLineColour();

    // The caption.
    void writeCaption();
    void commitCaption(void (tFrmNew::*store)());
    void beginCaptionDrag(QPointF at);
    void dragCaption(QPointF at);
    void endCaptionDrag();
    void PlaceTextLabel();

    // Opening, packing, drawing, storing.
    BigPics& surfaces() const;
    EditedPreview* workPicture() const;
    HostPath hostOf(const DrivePath& path) const;
    void tell(const QString& hebrew, const QString& english, const QString& reason) const;
    void OpenPictureInEditor();
    bool LoadWorkBitmap(const DrivePath& path);
    bool loadPictureOfRecord();
    void writeWorkFile();
    void ResetEditorZoom();
    void turnGreyIfToned();
    void putHandle(QPointF position);
    void handleToFields();
    void PackEditState();
    void RenderPreview();
    Bitmap drawn(const EditFields& fields);
    void StoreCurrentEdit();
    void packRenderStore(); // the two patterns that most controls follow
    void renderPackStore();
    void showNumbers();
    void showResolution();

    const SessionState& m_state;
    EditFields& m_edit;
    const Platform& m_platform;
    PageChain& m_chain;
    FrameLists m_frames;

    DragHandle Image3; // has no widget; its position is PanX and PanY with fractions
    DragHandle m_labelHandle;
    DragHandle m_cropHandle;
    CropFrame::Corner m_cropCorner = CropFrame::Corner::Picture11;
    Ticker Timer2, Timer3, Timer6, Timer7, Timer8;
    HeldButton m_held;
    int m_step = 0; // of the held button, a tick
    bool m_open = false;
    Panel m_panel = Panel::None;
    unsigned m_openings = 0;
    bool m_workFileFailed = false;
    bool m_drawnSinceTaken = false;
    double m_scale = 1;

    QString PaperSizeCode = QStringLiteral("1015");
    std::int16_t PreviewZoom = 100;
    LineFrameChoice m_lineFrame;
    const EditLimits m_limits;
    CoverZoom m_coverZoom;
    const SeenFrame m_seenFrame;
    const KeptCorrection m_correction;
    const CaptionGuard m_captionGuard;

    // The frame that was drawn last, under its folder and name, so that a tick does not read it again.
    QString m_frameKey;
    std::optional<Bitmap> m_frame;
    mutable std::map<QString, Bitmap> m_framePictures; // by path
};

} // namespace lumora
