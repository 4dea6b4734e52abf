// The editor: the caption, its keyboard and the box by which it is dragged.
#include "editing/caption/mikledet.h"
#include "editing/editor/tFrmNew.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

void tFrmNew::Command8_Click() {
    if (!m_open)
        return;
    stopHolds();
    EditFields& fields = edit();
    if (fields.TextOn == 0) {
        fields.TextFont = QStringLiteral("David");
        fields.TextFontSize = 24;
        fields.TextBlue = 30;
        fields.TextGreen = 255;
        fields.TextRed = 255;
        fields.TextX = 100;
        fields.TextY = 100;
        fields.TextOn = 1;
        PlaceTextLabel();
    }
    auto& keyboard = m_chain.load<mikledet>();
    keyboard.Text1.text = fields.TextBody;
    keyboard.Check4.checked = fields.TextOn == 1;
    m_chain.follow(PageId::tFrmNew, Outcome::CaptionWanted);
    Q_EMIT changed();
}

void tFrmNew::Command11_Click() {
    if (!m_open)
        return;
    packRenderStore();
    PlaceTextLabel();
    Q_EMIT changed();
}

void tFrmNew::PlaceTextLabel() {
    Labeltext.visible = m_open && edit().TextOn == 1;
    Labeltext.text = TextLabelPlace::blanks(edit());
    LabeltextBox = TextLabelPlace::boxOf(edit());
}

void tFrmNew::Labeltext_MouseDown(QPointF at) {
    if (!m_open || !Labeltext.visible)
        return;
    m_labelHandle.put({LabeltextBox.left, LabeltextBox.top});
    m_labelHandle.press(at);
}

void tFrmNew::Labeltext_MouseMove(QPointF at) {
    if (!m_labelHandle.held())
        return;
    m_labelHandle.move(at);
    LabeltextBox.left = m_labelHandle.position().x();
    LabeltextBox.top = m_labelHandle.position().y();
    // The letters follow the finger; the fields follow when it is lifted.
    EditFields meanwhile = edit();
    const QPoint anchor = TextLabelPlace::anchorOf(LabeltextBox, meanwhile);
    meanwhile.TextX = static_cast<std::int16_t>(anchor.x());
    meanwhile.TextY = static_cast<std::int16_t>(anchor.y());
    PicPic = drawn(meanwhile);
    Q_EMIT changed();
}

// Stored without packing: the record takes the new place at the next pack, as the lab's own editor does.
void tFrmNew::Labeltext_MouseUp() {
    if (!m_labelHandle.held())
        return;
    m_labelHandle.release();
    const QPoint anchor = TextLabelPlace::anchorOf(LabeltextBox, edit());
    edit().TextX = static_cast<std::int16_t>(anchor.x());
    edit().TextY = static_cast<std::int16_t>(anchor.y());
    RenderPreview();
    StoreCurrentEdit();
}

} // namespace lumora
