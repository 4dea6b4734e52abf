// The editor: frames and line frames.
#include "editing/editor/tFrmNew.h"
#include "editing/render/EditedPicture.h"
#include "imaging/files/PictureFile.h"
#include "order/EditRecord.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

using namespace Qt::StringLiterals;

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

// The customer looks at another category; the frame on the picture stays.
void tFrmNew::chooseCategory(int index) {
    Combo4List.setCurrentIndex(index);
    Combo4.text = Combo4List.currentItem();
    fillFrames(FrameLists::ListFile::Bmp);
    Q_EMIT changed();
}

void tFrmNew::fillFramesIfEmpty() {
    if (Combo2List.isEmpty() && !Combo4List.isEmpty())
        chooseCategory(std::max(Combo4List.currentIndex(), 0));
}

void tFrmNew::chooseFrame(int index) {
    Combo2List.setCurrentIndex(index);
    if (Combo2List.currentIndex() < 0)
        return;
    Combo2.text = Combo2List.currentItem();
    Label6.text = QString::number(index + 1) + u"  / "_s;
    Q_EMIT changed();
    if (!m_open || Combo4.text.isEmpty())
        return;
    takeFrame();
    packRenderStore();
}

void tFrmNew::takeFrame() {
    m_edit.FrameFolder = Combo4.text;
    m_edit.FrameName = Combo2.text;
    Misgerett.checked = m_seenFrame.ticked(Misgerett.checked);
}

void tFrmNew::nextFrame() {
    fillFramesIfEmpty();
    if (Combo2List.currentIndex() < Combo2List.lastIndex())
        chooseFrame(Combo2List.currentIndex() + 1);
}

void tFrmNew::previousFrame() {
    fillFramesIfEmpty();
    if (Combo2List.currentIndex() >= 1)
        chooseFrame(Combo2List.currentIndex() - 1);
}

void tFrmNew::useFrame() {
    fillFramesIfEmpty();
    if (!m_open)
        return;
    takeFrame();
    if (m_edit.FrameName == EditRecord::noFrame && !Combo2List.isEmpty())
        chooseFrame(0);
    Misgerett.checked = true;
    packRenderStore();
}

void tFrmNew::removeFrame() {
    if (!m_open)
        return;
    m_edit.LineFrameCode = m_lineFrame.removedCode();
    m_edit.FrameName = EditRecord::frameRemoved;
    packRenderStore();
}

void tFrmNew::showFrames(bool on) {
    Misgerett.checked = on;
    const bool takenOut = m_open && !on && m_seenFrame.takeOut(m_edit);
    if (takenOut) {
        packRenderStore();
        tellFrameTakenOut();
    }
    if (m_open && !takenOut)
        RenderPreview();
    Q_EMIT changed();
}

const std::optional<Bitmap>& tFrmNew::frame(const EditFields& fields) {
    const QString key = Misgerett.checked ? fields.FrameFolder + u'\\' + fields.FrameName : EditRecord::noFrame;
    if (key != m_frameKey) {
        m_frameKey = key;
        m_frame = Misgerett.checked ? loadFrame(hostOf(WorkspacePaths::misgarot(m_state)), fields, m_seenFrame.use())
                                    : std::nullopt;
    }
    return m_frame;
}

int tFrmNew::frameOnPicture() const {
    const EditFields& fields = m_edit;
    const bool ofCategory = m_open && fields.FrameFolder.trimmed() == Combo4.text;
    return ofCategory ? Combo2List.find(fields.FrameName.trimmed()) : -1;
}

Bitmap tFrmNew::framePicture(int index) const {
    const DrivePath path = index < 0 ? DrivePath() : m_frames.listFile(Combo4.text, Combo2List.item(index));
    if (path.isEmpty())
        return {};
    const auto known = m_framePictures.find(path.text());
    if (known != m_framePictures.end())
        return known->second;
    const HostPath host = hostOf(path);
    Bitmap picture;
    if (const Result<PictureSize> size = readPictureSize(host)) {
        if (Result<Bitmap> small = loadPictureScaled(host, smallPictureSize(*size, framePictureSize)))
            picture = std::move(*small);
    }
    return m_framePictures[path.text()] = picture;
}

// --- line frames: the record carries them to the lab, and nothing here draws them ---

void tFrmNew::stepLineStyle(int places) {
    if (!m_open || !m_lineFrame.step(places))
        return;
    Combo5List.setCurrentIndex(m_lineFrame.style());
    Combo5.text = Combo5List.currentItem();
    m_edit.LineFrameCode = m_lineFrame.code();
    packRenderStore();
}

void tFrmNew::chooseLineStyle(int index) {
    stepLineStyle(index - m_lineFrame.style());
}

void tFrmNew::moveMarker(QPointF at) {
    palette.moveTo(at);
    Label4.text = QString::number(palette.index());
    Q_EMIT changed();
}

void tFrmNew::takeLineColour() {
    m_lineFrame.takeColour(palette.letter());
}

} // namespace lumora
