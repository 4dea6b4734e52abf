#pragma once

#include "editing/HeldButton.h"
#include "editing/editor/DragHandle.h"
#include "editing/render/CropFrame.h"
#include "editing/render/FrameLists.h"
#include "editing/render/LineFramePalette.h"
#include "editing/render/TextLabelPlace.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "platform/files/HostPath.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"

#include <QPointF>

#include <array>
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

// The editor: one picture on its paper, with zoom, place, turn, colour, frame and caption. What the customer does
// changes the edit fields of the session, which are packed into the record and handed to the page of pictures at once,
// so that leaving needs no saving. The controls differ on purpose in when they pack, draw and store.
//
// All positions are in the logical pixels of the paper, 450 wide when it lies and 300 when it stands; a view that shows
// it larger maps what it is told.
class tFrmNew : public Page {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::tFrmNew;

    tFrmNew(SessionState& state, const Platform& platform, PageChain& chain);
    ~tFrmNew() override;

    void load() override;
    void setTexts() override;

    // --- events ---

    // How many real pixels a logical pixel of the paper has on this screen, held within 1 to 2: a tick stays a twelfth
    // of its time then.
    static constexpr double largestScale = 2;
    void setPreviewScale(double scale);

    // Pressed by other pages.
    void Command17_Click(); // opens the picture of the session's edit fields
    void Command11_Click(); // the caption was changed: packs, draws, stores, places Labeltext
    void Command5_Click();  // packs and stores

    void Command2_Click();    // picks a picture by the file dialog
    void CommandDone_Click(); // back to the pictures
    void Image29_Click();     // shows the hints
    void Command4_Click();    // "zoom": a quick look at the work picture
    void Command8_Click();    // the caption and its keyboard
    void Command6_Click();    // automatic level step
    // Paper of the next picture that is opened: 10/14, 10/15, 13/18, 15/21.
    void Command24_Click();
    void Command12_Click();
    void Command10_Click();
    void Command23_Click();

    // Image2: 0 and 1 zoom in and out, 3 and 4 darker and lighter (held); 5 undo, 6 red, 7 red-eye, 8 no added
    // colours, 10 blue (clicked). 2 and 9 do nothing.
    void Image2_MouseDown(int index);
    void Image2_MouseUp(int index);
    void Image2_Click(int index);
    void Image2_MouseMove(); // hides the panels Frame3 and Frame4

    // Held: the picture to the right, left, up and down.
    void Image135_MouseDown();
    void Image115_MouseDown();
    void Image125_MouseDown();
    void Image145_MouseDown();
    void Image135_MouseUp() { endHold(); }
    void Image115_MouseUp() { endHold(); }
    void Image125_MouseUp() { endHold(); }
    void Image145_MouseUp() { endHold(); }
    // Held: turn by single degrees.
    void Image16_MouseDown();
    void Image17_MouseDown();
    void Image16_MouseUp() { endHold(); }
    void Image17_MouseUp() { endHold(); }
    // Clicked.
    void Image15_Click(); // a quarter turn clockwise
    void Image18_Click(); // and back
    void Image27_Click(); // cancels the turn

    // What a held button does each 50 ms.
    void Timer2_Tick(); // zoom
    void Timer3_Tick(); // brightness
    void Timer6_Tick(); // turn
    void Timer7_Tick(); // to the side
    void Timer8_Tick(); // up and down
    // A press that ends before the first tick counts as one: a view calls this ahead of the MouseUp.
    void tickOnceIfNone();
    // The pointer was lost or the page went: what is in hand is let go as by its MouseUp.
    void stopHolds();

    // Dragging the picture. Positions may lie outside the paper.
    void PicPic_MouseDown(QPointF at);
    void PicPic_MouseMove(QPointF at); // also without a drag: hides the panels
    void PicPic_MouseUp();
    // Dragging the caption by its box, also in positions of the paper.
    void Labeltext_MouseDown(QPointF at);
    void Labeltext_MouseMove(QPointF at);
    void Labeltext_MouseUp();

    void VScrollZ_Change(int value);

    // Tones: grey, sepia, blue, green; back to colour.
    void Image4_Click();
    void Image11_Click();
    void Image12_Click();
    void Image9_Click();
    void Image5_Click();
    void Image13_MouseMove(); // over the button of the tones, or pressed: shows Frame3
    void Image15_MouseMove(); // over the quarter turn: shows Frame4

    // Frames.
    void Combo4_Click(int index);       // a category
    void Combo2_Click(int index);       // a frame of it
    void Image20_Click();               // next
    void Image21_Click();               // previous
    void Image22_Click();               // puts the chosen frame on the picture
    void Image28_Click();               // takes it off
    void Misgerett_Click(bool checked); // shows frames at all
    // Line frames: style forward and back, colour by the palette.
    void Command9_Click();
    void Command18_Click();
    void pic4Msgrt_MouseMove(QPointF at); // positions of the palette, cells of 33
    void PicInMsgrt_Click();

    // The crop markers, a display tool: nothing is cut by them.
    void Command14_Click(); // to the corners of the paper
    void Command13_Click(); // a preset inset
    void Command16_Click(); // wider
    void Command15_Click(); // narrower
    void CropHandle_MouseDown(CropFrame::Corner corner, QPointF at);
    void CropHandle_MouseMove(QPointF at);
    void CropHandle_MouseUp();

    // --- state ---

    Bitmap PicPic;          // what the paper shows, in the scale that was asked for; null while no picture is open
    PictureSize PicPicSize; // the paper in logical pixels
    // The view that the page of pictures keeps, in logical pixels, as preview and record have it. Null if nothing was
    // drawn since it was taken.
    Bitmap takeSmallView();
    bool pictureOpen() const { return m_open; }

    // The box that marks the caption, in logical pixels of the paper. Its text is blanks that give its length.
    TextLabelBox LabeltextBox;
    Caption Labeltext;

    Caption Label10; // the turn
    Caption Label11; // the zoom
    Caption Label13; // the record, for the operator
    Caption Label5;  // how many frames the category has
    Caption Label6;  // the frame in hand, "3  / "
    Caption Label4;  // the palette's index
    int VScrollZ = 100;
    static constexpr int VScrollZMin = 40;
    static constexpr int VScrollZMax = 210;

    TextList Combo4List;            // categories
    TextList Combo2List;            // frames of the category
    TextList Combo5List;            // line styles
    Caption Combo4, Combo2, Combo5; // what the boxes say
    CheckCaption Misgerett;
    // A small picture of a frame of Combo2List, its longer side 160 pixels; null when there is none.
    Bitmap framePicture(int index) const;

    LineFramePalette palette; // pic4Msgrt with its marker PicInMsgrt
    CropFrame crop;

    Caption Frame3;   // the panel of the tones
    Caption Frame4;   // the panel of the turns
    Caption Picture3; // the tools; shown once a picture is open
    Caption Image19;  // what to do while none is
    Caption Frame5;   // the spare panel of the operator
    Caption Title;    // the leaf name of the picture

    std::array<Caption, 11> Image2;
    int sunkImage2 = -1; // the held button of Image2 that has its border down
    Caption Image135, Image115, Image125, Image145, Image15, Image16, Image17, Image18, Image27;
    Caption Image4, Image5, Image9, Image11, Image12, Image13;
    Caption Image20, Image21, Image22, Image28, Image29;
    Caption Command2, Command4, Command6, Command8, Command9, Command18, CommandDone;
    Caption Command10, Command12, Command23, Command24; // the paper sizes
    Caption Command13, Command14, Command15, Command16; // the crop markers

    bool hintsAsLabels = false; // Image29: a pointer that can't hover reads the hints below the buttons

    static constexpr int holdMilliseconds = 50;

Q_SIGNALS:
    // The record of the session is to be kept: the page of pictures listens.
    void stored();
    // The customer goes back to the pictures.
    void left();
    // The customer picked a picture by its file, to see all pictures of its folder.
    void picked(const QString& path);

private:
    enum class Tone { Grey, Sepia, Blue, Green };
    enum class Release { MouseUp, Lost };

    EditFields& edit() const;
    BigPics& surfaces() const;
    EditedPreview* workPicture() const;
    HostPath hostOf(const QString& path) const;
    void tell(const QString& hebrew, const QString& english, const QString& reason) const;
    void hidePanels();

    void ResetEditorZoom();
    void OpenPictureInEditor();
    bool LoadWorkBitmap(const QString& path);
    bool loadPictureOfRecord();
    void writeWorkFile();
    void putHandle(QPointF position);
    void handleToFields();
    void PackEditState();
    void RenderPreview();
    Bitmap drawn(const EditFields& fields);
    void StoreCurrentEdit();
    void UndoAllEdits();
    // The two patterns that most controls follow.
    void packRenderStore();
    void renderPackStore();

    void hold(Ticker& ticker, int step);
    void dropHold();
    void endHold(Release release = Release::MouseUp);
    void zoomReleased(Release release);
    void panBy(QPointF distance);
    void setTurn(std::int16_t code);
    void setGains(float red, float green, float blue);
    void takeTone(Tone tone);

    void fillFrames(FrameLists::ListFile kind);
    void fillFramesIfEmpty();
    void takeFrame();
    void stepLineStyle(int step);
    QChar lineFrameLetter() const;
    const std::optional<Bitmap>& frame(const EditFields& fields);
    void PlaceTextLabel();
    void showNumbers();

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    FrameLists m_frames;

    DragHandle Image3; // unseen: its place is PanX and PanY, with fractions
    DragHandle m_labelHandle;
    DragHandle m_cropHandle;
    CropFrame::Corner m_cropCorner = CropFrame::Corner::Picture11;
    Ticker Timer2, Timer3, Timer6, Timer7, Timer8;
    HeldButton m_held;
    int m_step = 0; // of the held button, a tick
    bool m_open = false;
    unsigned m_openings = 0;
    bool m_workFileFailed = false;
    bool m_drawnSinceTaken = false;
    double m_scale = 1;

    QString PaperSizeCode = QStringLiteral("1015");
    std::int16_t PreviewZoom = 100;
    QString FrameColorLetter;
    QString FrameStyleDigits;

    // The frame that was drawn last, by folder and name: it is read once and not at each tick.
    QString m_frameKey;
    std::optional<Bitmap> m_frame;
    mutable std::map<QString, Bitmap> m_framePictures;
};

} // namespace lumora
