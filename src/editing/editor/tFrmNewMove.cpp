// The editor: zoom, turn and place, held buttons and dragging.
#include "common/FixedText.h"
#include "editing/editor/tFrmNew.h"
#include "order/EditRecord.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {
// --- held buttons ---

void tFrmNew::beginHold(Held what) {
    // In the order of Held. Zoom in percent, brightness in hundredths of a gain, places in pixels, turns in degrees.
    const std::pair<Ticker&, int> steps[] = {{Timer2, 2},  {Timer2, -2}, {Timer3, -4}, {Timer3, 4}, {Timer7, 2},
                                             {Timer7, -2}, {Timer8, -2}, {Timer8, 2},  {Timer6, 1}, {Timer6, -1}};
    stopHolds(); // a second finger takes over
    if (!m_open)
        return;
    const auto& [ticker, step] = steps[static_cast<std::size_t>(what)];
    m_step = step;
    m_held.press(ticker);
    Q_EMIT changed();
}

// Nothing is stored here, since the fields may be those of another picture by now.
void tFrmNew::dropHold() {
    m_held.end(HeldButton::End::Lost);
    sunkImage2 = -1;
    Image3.release();
    m_labelHandle.release();
    m_cropHandle.release();
}

void tFrmNew::endHold(HeldButton::End how) {
    const bool zooms = m_held.holds(Timer2);
    const bool brightens = m_held.holds(Timer3);
    const bool ticked = m_held.end(how);
    sunkImage2 = -1;
    if (zooms && ticked)
        zoomReleased(how);
    else if (brightens && ticked)
        StoreCurrentEdit();
    Q_EMIT changed();
}

void tFrmNew::stopHolds() {
    endHold(HeldButton::End::Lost);
    endCaptionDrag();
    endDrag();
    m_cropHandle.release();
}

void tFrmNew::holdTool(int index) {
    const std::map<int, Held> held = {{0, Held::Closer}, {1, Held::Further}, {3, Held::Darker}, {4, Held::Lighter}};
    const auto found = held.find(index);
    if (found == held.end())
        return;
    beginHold(found->second);
    if (m_held.isHeld())
        sunkImage2 = index;
}

// The record is packed and stored when the button is let go.
void tFrmNew::zoom() {
    if (!m_held.ticks(Timer2))
        return;
    takeZoom(m_step);
    RenderPreview();
    showNumbers();
}

void tFrmNew::takeZoom(int step) {
    PreviewZoom = EditStep::zoom(PreviewZoom, step);
    m_coverZoom.forget();
    m_edit.ZoomPercent = PreviewZoom;
}

void tFrmNew::zoomReleased(HeldButton::End how) {
    const unsigned opening = m_openings;
    if (how == HeldButton::End::LetGo)
        m_platform.pump.pump();
    if (!m_open || opening != m_openings)
        return; // another picture was opened meanwhile
    m_edit.ZoomPercent = PreviewZoom;
    PackEditState();
    StoreCurrentEdit();
}

void tFrmNew::turn() {
    if (!m_held.ticks(Timer6))
        return;
    turnPicture(EditStep::turn(m_edit.RotationCode, m_step));
    renderPackStore();
}

void tFrmNew::moveAcross() {
    if (m_held.ticks(Timer7))
        panBy(QPointF(m_step, 0));
}

void tFrmNew::moveDown() {
    if (m_held.ticks(Timer8))
        panBy(QPointF(0, m_step));
}

void tFrmNew::panBy(QPointF distance) {
    moveHandle(Image3.position() + distance);
    handleToFields();
    packRenderStore();
}

void tFrmNew::moveHandle(QPointF to) {
    putHandle(m_limits.pan(*workPicture(), m_edit, Image3.position(), to));
}

// --- turning by clicks ---

void tFrmNew::turnPicture(std::int16_t code) {
    const std::int16_t zoomBefore = m_edit.ZoomPercent;
    m_coverZoom.turn(m_edit, code, *workPicture());
    if (m_edit.ZoomPercent != zoomBefore)
        PreviewZoom = m_edit.ZoomPercent;
    m_limits.hold(m_edit);
    showNumbers();
}

void tFrmNew::turnTo(std::int16_t code) {
    if (!m_open)
        return;
    turnPicture(code);
    packRenderStore();
}

void tFrmNew::turnQuarterRight() {
    turnTo(EditStep::quarterRight(m_edit.RotationCode));
}

void tFrmNew::turnQuarterLeft() {
    turnTo(EditStep::quarterLeft(m_edit.RotationCode));
}

// --- two fingers and the wheel ---

void tFrmNew::pinch(PinchSteps::Steps steps) {
    const Page* front = m_chain.front();
    if (!m_open || (front != nullptr && front->id() == PageId::mikledet))
        return;
    stopHolds();
    if (steps.zoom != 0)
        takeZoom(steps.zoom * PinchSteps::zoomStep);
    const int side = steps.turn < 0 ? -1 : 1;
    for (int turned = 0; turned != steps.turn; turned += side) {
        if (side > 0 || m_edit.RotationCode > PinchSteps::leastTurn)
            turnPicture(EditStep::turn(m_edit.RotationCode, side));
    }
    renderPackStore();
    showNumbers();
    Q_EMIT changed();
}

// --- dragging the picture ---

void tFrmNew::beginDrag(QPointF at) {
    if (m_open)
        Image3.press(at);
}

void tFrmNew::drag(QPointF at) {
    const Page* front = m_chain.front();
    if (front != nullptr && front->id() == PageId::mikledet)
        return;
    hidePanels();
    if (!Image3.held())
        return;
    moveHandle(Image3.position() + Image3.distance(at));
    // Only a copy of the fields follows the finger; the record waits until it is lifted.
    EditFields meanwhile = m_edit;
    meanwhile.PanX = HoldIn16Bits(Image3.position().x());
    meanwhile.PanY = HoldIn16Bits(Image3.position().y());
    PicPic = drawn(meanwhile);
    Q_EMIT changed();
}

void tFrmNew::endDrag() {
    if (!Image3.held())
        return;
    Image3.release();
    handleToFields();
    packRenderStore();
}

// The bar leaves the picture as it is, since the drawing reads ZoomPercent; the next held zoom starts from the bar.
void tFrmNew::setBarZoom(int percent) {
    VScrollZ = std::clamp(percent, VScrollZMin, VScrollZMax);
    PreviewZoom = HoldIn16Bits(VScrollZ);
    showNumbers();
    if (m_open)
        RenderPreview();
    Q_EMIT changed();
}

} // namespace lumora
