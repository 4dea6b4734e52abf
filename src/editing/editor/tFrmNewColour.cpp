// The editor: brightness, added colours, tones, undo.
#include "editing/editor/BigPics.h"
#include "editing/editor/tFrmNew.h"
#include "editing/redeye/RedI.h"
#include "order/EditRecord.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {
namespace {

constexpr int undo = 5;
constexpr int addRed = 6;
constexpr int redEye = 7;
constexpr int noAddedColours = 8;
constexpr int addBlue = 10;

constexpr int colourStep = 6; // hundredths of a gain

} // namespace

void tFrmNew::setGains(float red, float green, float blue) {
    edit().GainR = red;
    edit().GainG = green;
    edit().GainB = blue;
}

// Stored when the button is let go.
void tFrmNew::Timer3_Tick() {
    if (!m_held.ticks(Timer3))
        return;
    setGains(EditStep::gain(edit().GainR, m_step), EditStep::gain(edit().GainG, m_step),
             EditStep::gain(edit().GainB, m_step));
    RenderPreview();
    PackEditState();
}

void tFrmNew::Image2_Click(int index) {
    if (!m_open)
        return;
    EditFields& fields = edit();
    switch (index) {
    case undo:
        UndoAllEdits();
        return;
    case redEye:
        stopHolds();
        m_chain.load<RedI>().open(fields.PicturePath);
        return;
    case addRed:
        setGains(EditStep::gain(fields.GainR, colourStep), fields.GainG, EditStep::gain(fields.GainB, -colourStep));
        break;
    case addBlue:
        setGains(EditStep::gain(fields.GainR, -colourStep), fields.GainG, EditStep::gain(fields.GainB, colourStep));
        break;
    case noAddedColours:
        setGains(fields.GainG, fields.GainG, fields.GainG);
        break;
    default:
        return;
    }
    renderPackStore();
}

void tFrmNew::takeTone(Tone tone) {
    if (!m_open)
        return;
    EditFields& fields = edit();
    setGains(1, 1, 1);
    // Grey once: a second time would darken it again.
    if (fields.ToneFlag != 1)
        surfaces().Command1_Click();
    fields.ToneFlag = 1;
    switch (tone) {
    case Tone::Grey:
        break;
    case Tone::Sepia:
        setGains(EditStep::gain(1, 30), 1, EditStep::gain(1, -20));
        break;
    case Tone::Blue:
        setGains(1, 1, EditStep::gain(1, 30));
        break;
    case Tone::Green:
        setGains(1, EditStep::gain(1, 30), 1);
        break;
    }
    PackEditState();
    StoreCurrentEdit();
    RenderPreview();
    StoreCurrentEdit();
    hidePanels();
}

void tFrmNew::Image4_Click() {
    takeTone(Tone::Grey);
}

void tFrmNew::Image11_Click() {
    takeTone(Tone::Sepia);
}

void tFrmNew::Image12_Click() {
    takeTone(Tone::Blue);
}

void tFrmNew::Image9_Click() {
    takeTone(Tone::Green);
}

// From the customer's file, also where a corrected copy exists: the correction is seen again when the picture is opened
// the next time, and the record keeps its marker.
void tFrmNew::Image5_Click() {
    if (!m_open)
        return;
    stopHolds();
    ResetEditorZoom();
    if (!LoadWorkBitmap(edit().PicturePath))
        return;
    setGains(1, 1, 1);
    edit().ToneFlag = 0;
    putHandle(QPointF(edit().PanX, edit().PanY));
    renderPackStore();
    hidePanels();
}

} // namespace lumora
