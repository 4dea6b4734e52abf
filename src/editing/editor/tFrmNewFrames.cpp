// The editor: frames and line frames.
#include "editing/editor/tFrmNew.h"
#include "editing/render/EditedPicture.h"
#include "imaging/files/PictureFile.h"
#include "order/EditRecord.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {
namespace {

constexpr int framePictureSize = 160;

} // namespace

void tFrmNew::fillFrames(FrameLists::ListFile kind) {
    Combo2List.clear();
    if (!Combo4.text.isEmpty())
        Combo2List.append(m_frames.names(Combo4.text, kind));
    Label5.text = QString::number(Combo2List.count());
    Label6.text.clear();
    Combo2.text = EditRecord::frameOfBorder(m_state.shemot.Bord.left(2));
}

// Another category to choose from; the frame on the picture stays.
void tFrmNew::Combo4_Click(int index) {
    Combo4List.setCurrentIndex(index);
    Combo4.text = Combo4List.currentItem();
    fillFrames(FrameLists::ListFile::Bmp);
    Q_EMIT changed();
}

void tFrmNew::fillFramesIfEmpty() {
    if (Combo2List.isEmpty() && !Combo4List.isEmpty())
        Combo4_Click(std::max(Combo4List.currentIndex(), 0));
}

void tFrmNew::Combo2_Click(int index) {
    Combo2List.setCurrentIndex(index);
    if (Combo2List.currentIndex() < 0)
        return;
    Combo2.text = Combo2List.currentItem();
    Label6.text = QString::number(index + 1) + QStringLiteral("  / ");
    Q_EMIT changed();
    if (!m_open || Combo4.text.isEmpty())
        return;
    takeFrame();
    packRenderStore();
}

void tFrmNew::takeFrame() {
    edit().FrameFolder = Combo4.text;
    edit().FrameName = Combo2.text;
}

void tFrmNew::Image20_Click() {
    fillFramesIfEmpty();
    if (Combo2List.currentIndex() < Combo2List.lastIndex())
        Combo2_Click(Combo2List.currentIndex() + 1);
}

void tFrmNew::Image21_Click() {
    fillFramesIfEmpty();
    if (Combo2List.currentIndex() >= 1)
        Combo2_Click(Combo2List.currentIndex() - 1);
}

void tFrmNew::Image22_Click() {
    fillFramesIfEmpty();
    if (!m_open)
        return;
    takeFrame();
    if (edit().FrameName == EditRecord::noFrame && !Combo2List.isEmpty())
        Combo2_Click(0);
    Misgerett.checked = true;
    packRenderStore();
}

QChar tFrmNew::lineFrameLetter() const {
    return FrameColorLetter.isEmpty() ? QChar(u'W') : FrameColorLetter.front();
}

void tFrmNew::Image28_Click() {
    if (!m_open)
        return;
    edit().LineFrameCode = lineFrameLetter() + QStringLiteral("00");
    edit().FrameName = EditRecord::frameRemoved;
    packRenderStore();
}

void tFrmNew::Misgerett_Click(bool checked) {
    Misgerett.checked = checked;
    if (m_open)
        RenderPreview();
    Q_EMIT changed();
}

const std::optional<Bitmap>& tFrmNew::frame(const EditFields& fields) {
    const QString key = Misgerett.checked ? fields.FrameFolder + u'\\' + fields.FrameName : EditRecord::noFrame;
    if (key != m_frameKey) {
        m_frameKey = key;
        m_frame = Misgerett.checked ? loadFrame(hostOf(WorkspacePaths::misgarot(m_state)), fields, FrameUse::Preview)
                                    : std::nullopt;
    }
    return m_frame;
}

Bitmap tFrmNew::framePicture(int index) const {
    const QString path = index < 0 ? QString() : m_frames.listFile(Combo4.text, Combo2List.item(index));
    if (path.isEmpty())
        return {};
    const auto known = m_framePictures.find(path);
    if (known != m_framePictures.end())
        return known->second;
    const HostPath host = hostOf(path);
    Bitmap picture;
    if (const Result<PictureSize> size = readPictureSize(host)) {
        if (Result<Bitmap> small = loadPictureScaled(host, smallPictureSize(*size, framePictureSize)))
            picture = std::move(*small);
    }
    return m_framePictures[path] = picture;
}

// --- line frames: carried by the record, painted nowhere ---

void tFrmNew::stepLineStyle(int step) {
    const int next = Combo5List.currentIndex() + step;
    if (!m_open || Combo5List.isEmpty() || next < -1)
        return;
    // At either end the style stays and is taken once more.
    Combo5List.setCurrentIndex(std::clamp(next, 0, Combo5List.lastIndex()));
    Combo5.text = Combo5List.currentItem();
    FrameStyleDigits = Combo5.text.rightJustified(2, u'0');
    edit().LineFrameCode = lineFrameLetter() + FrameStyleDigits;
    packRenderStore();
}

void tFrmNew::Command9_Click() {
    stepLineStyle(1);
}

void tFrmNew::Command18_Click() {
    stepLineStyle(-1);
}

void tFrmNew::pic4Msgrt_MouseMove(QPointF at) {
    palette.moveTo(at);
    Label4.text = QString::number(palette.index());
    Q_EMIT changed();
}

void tFrmNew::PicInMsgrt_Click() {
    FrameColorLetter = palette.letter();
}

} // namespace lumora
