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
namespace {

constexpr int zoomIn = 0;
constexpr int zoomOut = 1;
constexpr int darker = 3;
constexpr int lighter = 4;

constexpr int zoomStep = 2;
constexpr int brightnessStep = 4; // hundredths of a gain
constexpr int turnStep = 1;
constexpr int panStep = 2;

} // namespace

// --- held buttons ---

void tFrmNew::hold(Ticker& ticker, int step) {
    stopHolds(); // a second finger takes over
    if (!m_open)
        return;
    m_step = step;
    m_held.press(ticker);
    Q_EMIT changed();
}

// Without what a MouseUp does besides: the fields may be those of another picture by now.
void tFrmNew::dropHold() {
    m_held.release();
    sunkImage2 = -1;
    Image3.release();
    m_labelHandle.release();
    m_cropHandle.release();
}

void tFrmNew::endHold(Release release) {
    const bool zoomed = m_held.holds(Timer2);
    const bool brightened = m_held.holds(Timer3);
    m_held.release();
    sunkImage2 = -1;
    if (zoomed)
        zoomReleased(release);
    else if (brightened)
        StoreCurrentEdit();
    Q_EMIT changed();
}

void tFrmNew::stopHolds() {
    endHold(Release::Lost);
    if (m_labelHandle.held())
        Labeltext_MouseUp();
    if (Image3.held())
        PicPic_MouseUp();
    m_cropHandle.release();
}

void tFrmNew::tickOnceIfNone() {
    m_held.tickOnceIfNone();
}

void tFrmNew::Image2_MouseDown(int index) {
    if (index == zoomIn || index == zoomOut)
        hold(Timer2, index == zoomIn ? zoomStep : -zoomStep);
    else if (index == darker || index == lighter)
        hold(Timer3, index == lighter ? brightnessStep : -brightnessStep);
    else
        return;
    if (m_held.isHeld())
        sunkImage2 = index;
}

void tFrmNew::Image2_MouseUp(int) {
    endHold();
}

void tFrmNew::Image2_MouseMove() {
    hidePanels();
}

// Packing and storing wait for the release: drawing alone is what the eye needs meanwhile.
void tFrmNew::Timer2_Tick() {
    if (!m_held.ticks(Timer2))
        return;
    PreviewZoom = EditStep::zoom(PreviewZoom, m_step);
    edit().ZoomPercent = PreviewZoom;
    RenderPreview();
    showNumbers();
}

void tFrmNew::zoomReleased(Release release) {
    const unsigned opening = m_openings;
    if (release == Release::MouseUp)
        m_platform.pump.pump();
    if (!m_open || opening != m_openings)
        return; // another picture was opened meanwhile
    edit().ZoomPercent = PreviewZoom;
    PackEditState();
    StoreCurrentEdit();
}

void tFrmNew::Timer6_Tick() {
    if (!m_held.ticks(Timer6))
        return;
    edit().RotationCode = EditStep::turn(edit().RotationCode, m_step);
    showNumbers();
    renderPackStore();
}

void tFrmNew::Timer7_Tick() {
    if (!m_held.ticks(Timer7))
        return;
    panBy(QPointF(m_step, 0));
}

void tFrmNew::Timer8_Tick() {
    if (!m_held.ticks(Timer8))
        return;
    panBy(QPointF(0, m_step));
}

void tFrmNew::panBy(QPointF distance) {
    putHandle(Image3.position() + distance);
    handleToFields();
    packRenderStore();
}

void tFrmNew::Image135_MouseDown() {
    hold(Timer7, panStep);
}

void tFrmNew::Image115_MouseDown() {
    hold(Timer7, -panStep);
}

void tFrmNew::Image125_MouseDown() {
    hold(Timer8, -panStep);
}

void tFrmNew::Image145_MouseDown() {
    hold(Timer8, panStep);
}

void tFrmNew::Image16_MouseDown() {
    hold(Timer6, turnStep);
}

void tFrmNew::Image17_MouseDown() {
    hold(Timer6, -turnStep);
}

// --- turning by clicks ---

void tFrmNew::setTurn(std::int16_t code) {
    if (!m_open)
        return;
    edit().RotationCode = code;
    showNumbers();
    packRenderStore();
}

void tFrmNew::Image15_Click() {
    setTurn(EditStep::quarterRight(edit().RotationCode));
}

void tFrmNew::Image18_Click() {
    setTurn(EditStep::quarterLeft(edit().RotationCode));
}

void tFrmNew::Image27_Click() {
    setTurn(180);
}

// --- dragging the picture ---

void tFrmNew::PicPic_MouseDown(QPointF at) {
    if (m_open)
        Image3.press(at);
}

void tFrmNew::PicPic_MouseMove(QPointF at) {
    const Page* front = m_chain.front();
    if (front != nullptr && front->id() == PageId::mikledet)
        return;
    hidePanels();
    if (!Image3.held())
        return;
    Image3.move(at);
    putHandle(Image3.position());
    // The paper follows the finger; fields and record follow when it is lifted.
    EditFields meanwhile = edit();
    meanwhile.PanX = HoldIn16Bits(Image3.position().x());
    meanwhile.PanY = HoldIn16Bits(Image3.position().y());
    PicPic = drawn(meanwhile);
    Q_EMIT changed();
}

void tFrmNew::PicPic_MouseUp() {
    if (!Image3.held())
        return;
    Image3.release();
    handleToFields();
    packRenderStore();
}

// The drawing reads ZoomPercent, so that the bar leaves the picture as it is; the next held zoom goes on from here.
void tFrmNew::VScrollZ_Change(int value) {
    VScrollZ = std::clamp(value, VScrollZMin, VScrollZMax);
    PreviewZoom = HoldIn16Bits(VScrollZ);
    showNumbers();
    if (m_open)
        RenderPreview();
    Q_EMIT changed();
}

} // namespace lumora
