// The editor: brightness, added colours, tones, undo.
#include "editing/editor/BigPics.h"
#include "editing/editor/tFrmNew.h"
#include "editing/redeye/RedI.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <array>

namespace lumora {

// The record is stored when the button is let go.
void tFrmNew::brighten() {
    if (!m_held.ticks(Timer3))
        return;
    ColourStep::brighten(m_edit, m_step);
    RenderPreview();
    PackEditState();
}

void tFrmNew::useTool(int index) {
    switch (index) {
    case 5:
        return undoAllEdits();
    case 6:
        return changeColours(ColourStep::addRed);
    case 7:
        return correctRedEyes();
    case 8:
        return changeColours(ColourStep::removeAddedColours);
    case 10:
        return changeColours(ColourStep::addBlue);
    default:
        return;
    }
}

void tFrmNew::changeColours(void (*step)(EditFields& edit)) {
    if (!m_open)
        return;
    step(m_edit);
    renderPackStore();
}

// The gains are measured on the work picture, which has none of them, so that a second press changes nothing more.
// Those of a tone are its tint and stay.
void tFrmNew::improve() {
    if (!m_open)
        return;
    const std::array before{m_edit.GainR, m_edit.GainG, m_edit.GainB};
    if (m_edit.ToneFlag != 1) {
        surfaces().measureLevels();
        ColourStep::improve(m_edit, surfaces().controls().levels.gains);
    }
    if (before == std::array{m_edit.GainR, m_edit.GainG, m_edit.GainB})
        return tellNotImproved();
    renderPackStore();
}

void tFrmNew::correctRedEyes() {
    if (!m_open)
        return;
    stopHolds();
    m_chain.load<RedI>().open(m_edit.PicturePath);
}

void tFrmNew::takeTone(Tone tone) {
    if (!m_open)
        return;
    // A second grey step would darken the picture again.
    if (m_edit.ToneFlag != 1)
        surfaces().turnGrey();
    ColourStep::takeTone(m_edit, tone);
    PackEditState();
    StoreCurrentEdit();
    RenderPreview();
    StoreCurrentEdit();
    hidePanels();
}

// As built in, the picture comes from the customer's file, also where a corrected copy exists. The record keeps its
// marker, so that the correction is seen again when the picture is opened the next time.
void tFrmNew::backToColour() {
    if (!m_open)
        return;
    stopHolds();
    ResetEditorZoom();
    if (!(m_correction.isSeen() ? loadPictureOfRecord() : LoadWorkBitmap(m_edit.PicturePath)))
        return;
    ColourStep::backToColour(m_edit);
    putHandle(QPointF(m_edit.PanX, m_edit.PanY));
    renderPackStore();
    hidePanels();
}

} // namespace lumora
