// The editor: the caption, its keyboard and the box by which it is dragged.
#include "editing/caption/mikledet.h"
#include "editing/editor/tFrmNew.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

void tFrmNew::writeCaption() {
    if (!m_open)
        return;
    stopHolds();
    hidePanels();
    if (m_edit.TextOn == 0) {
        m_captionGuard.begin(m_edit);
        PlaceTextLabel();
        // A caption that was removed has its text, and prints from now on.
        if (m_edit.TextBody.isEmpty())
            RenderPreview();
        else
            packRenderStore();
    }
    m_chain.load<mikledet>().open(m_edit.TextBody, m_edit.TextOn == 1);
    m_chain.follow(pageId, Outcome::CaptionWanted);
    Q_EMIT changed();
}

void tFrmNew::takeCaption() {
    commitCaption(&tFrmNew::stored);
}

void tFrmNew::takeCaptionStep() {
    commitCaption(&tFrmNew::storedMeanwhile);
}

void tFrmNew::commitCaption(void (tFrmNew::*store)()) {
    if (!m_open)
        return;
    PackEditState();
    RenderPreview();
    Q_EMIT(this->*store)();
    PlaceTextLabel();
    Q_EMIT changed();
}

void tFrmNew::PlaceTextLabel() {
    Labeltext.visible = m_open && m_edit.TextOn == 1;
    Labeltext.text = TextLabelPlace::blanks(m_edit);
    LabeltextBox = TextLabelPlace::boxOf(m_edit);
}

void tFrmNew::beginCaptionDrag(QPointF at) {
    if (!m_open || m_edit.TextOn != 1)
        return;
    m_labelHandle.put({LabeltextBox.left, LabeltextBox.top});
    m_labelHandle.press(at);
}

void tFrmNew::dragCaption(QPointF at) {
    if (!m_labelHandle.held())
        return;
    m_labelHandle.move(at);
    LabeltextBox.left = m_labelHandle.position().x();
    LabeltextBox.top = m_labelHandle.position().y();
    // Only a copy of the fields follows the finger; the record waits until it is lifted.
    EditFields meanwhile = m_edit;
    const QPoint anchor = TextLabelPlace::anchorOf(LabeltextBox, meanwhile);
    meanwhile.TextX = static_cast<std::int16_t>(anchor.x());
    meanwhile.TextY = static_cast<std::int16_t>(anchor.y());
    m_limits.hold(meanwhile);
    PicPic = drawn(meanwhile);
    Q_EMIT changed();
}

// As built in, the caption is stored without packing: the record takes its new place at the next pack.
void tFrmNew::endCaptionDrag() {
    if (!m_labelHandle.held())
        return;
    m_labelHandle.release();
    const QPoint anchor = TextLabelPlace::anchorOf(LabeltextBox, m_edit);
    m_edit.TextX = static_cast<std::int16_t>(anchor.x());
    m_edit.TextY = static_cast<std::int16_t>(anchor.y());
    if (m_captionGuard.keepsDraggedPlace())
        PackEditState();
    RenderPreview();
    StoreCurrentEdit();
    if (anchor != QPoint(m_edit.TextX, m_edit.TextY)) // held within the columns of the record
        PlaceTextLabel();
}

} // namespace lumora
