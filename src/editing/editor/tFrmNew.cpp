#include "editing/editor/tFrmNew.h"

#include "common/FixedText.h"
#include "common/PaperSize.h"
#include "editing/editor/BigPics.h"
#include "editing/render/EditedPicture.h"
#include "order/EditRecord.h"
#include "order/KeptPictures.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"
#include "session/Workspace.h"

#include <QBuffer>
#include <QPainter>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

tFrmNew::tFrmNew(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::tFrmNew)
    , m_state(state)
    , m_edit(state.edit)
    , m_platform(platform)
    , m_chain(chain)
    , m_frames(platform.files, WorkspacePaths::misgarot(state))
    , Timer2(holdMilliseconds, [this] { zoom(); })
    , Timer3(holdMilliseconds, [this] { brighten(); })
    , Timer6(holdMilliseconds, [this] { turn(); })
    , Timer7(holdMilliseconds, [this] { moveAcross(); })
    , Timer8(holdMilliseconds, [this] { moveDown(); })
    , m_limits(state)
    , m_coverZoom(state)
    , m_seenFrame(state)
    , m_correction(state, platform.files)
    , m_captionGuard(state) {
    // No button of this page is held once another page is in front.
    connect(&chain, &PageChain::shown, this, &tFrmNew::stopHolds);
}

tFrmNew::~tFrmNew() = default;

void tFrmNew::load() {
    // An order of mixed sizes, "zz/zz", has no paper size: the editor then shows 10/15.
    const QString code = SizeCode(m_state.shemot.ppr);
    if (PaperSize::ofDigits(code))
        PaperSizeCode = code;
    PicPicSize = previewBox(*PaperSize::ofDigits(PaperSizeCode), PaperOrientation::Landscape);

    for (Caption* operators : {&Frame5, &Label13})
        operators->visible = m_state.DegelEdit;

    Misgerett.checked = true;
    Combo5List.append(LineFrameChoice::styles());
    // A folder that can't be made only means that no frames are on offer.
    if (!m_platform.files.folderExists(WorkspacePaths::misgarot(m_state)))
        static_cast<void>(m_platform.files.makeFolder(WorkspacePaths::misgarot(m_state)));
    Combo4List.append(m_frames.categories());
    if (!Combo4List.isEmpty()) {
        m_edit.FrameFolder = Combo4List.item(0);
        Combo4.text = Combo4List.item(0);
        Combo4List.setCurrentIndex(0);
    }
    fillFrames(FrameLists::ListFile::Png);
    PackEditState();
    showNumbers();
}

BigPics& tFrmNew::surfaces() const {
    return m_chain.load<BigPics>();
}

EditedPreview* tFrmNew::workPicture() const {
    return surfaces().workPicture();
}

HostPath tFrmNew::hostOf(const DrivePath& path) const {
    return m_platform.files.drives().toHost(path).value_or(HostPath());
}

void tFrmNew::tell(const QString& hebrew, const QString& english, const QString& reason) const {
    m_platform.dialogs.message(m_state.wording(hebrew, english) + u'\n' + reason);
}

void tFrmNew::hidePanels() {
    if (m_panel != Panel::None)
        open(Panel::None);
}

// --- opening ---

void tFrmNew::openPicture() {
    OpenPictureInEditor();
    Q_EMIT changed();
}

void tFrmNew::OpenPictureInEditor() {
    dropHold();
    ++m_openings;
    m_open = false;
    m_frameKey.clear();
    crop.visible = false;
    surfaces().close();
    PicPic = Bitmap();
    m_coverZoom.forget();
    Misgerett.checked = m_seenFrame.ticked(Misgerett.checked);
    hidePanels();

    ResetEditorZoom();
    m_open = loadPictureOfRecord();
    Title.text = m_open ? m_edit.PicturePath.leaf() : QString();
    Picture3.visible = m_open;
    Image19.visible = !m_open;
    PlaceTextLabel();
    showNumbers();
    if (!m_open)
        return;
    if (m_edit.AutoMarker == EditRecord::levelled)
        surfaces().measureLevels();
    turnGreyIfToned();
    workPicture()->placeAtCentreIfUnset(m_edit);
    putHandle(QPointF(m_edit.PanX, m_edit.PanY));
    packRenderStore();
}

void tFrmNew::turnGreyIfToned() {
    if (m_edit.ToneFlag == 1)
        surfaces().turnGrey();
}

void tFrmNew::ResetEditorZoom() {
    PreviewZoom = m_edit.ZoomPercent;
}

bool tFrmNew::loadPictureOfRecord() {
    if (m_edit.RedMarker != EditRecord::corrected)
        return LoadWorkBitmap(m_edit.PicturePath);
    m_edit.TempRedName = MangleFileName(m_edit.PicturePath);
    const DrivePath copy = WorkspacePaths::corrected(m_state, m_edit.PicturePath);
    if (m_platform.files.fileExists(copy))
        return LoadWorkBitmap(copy);
    // The picture is then shown and printed without the correction.
    m_edit.RedMarker = EditRecord::notMarked;
    if (!LoadWorkBitmap(m_edit.PicturePath))
        return false;
    tell(u"תיקון העיניים האדומות של תמונה זו אבד. התמונה תוצג ותודפס בלעדיו"_s,
         u"The red-eye correction of this picture was lost. It is shown and printed without it"_s, copy.text());
    return true;
}

bool tFrmNew::LoadWorkBitmap(const DrivePath& path) {
    const PaperSize paper = *PaperSize::ofDigits(PaperSizeCode);
    const HostPath file = KeptPictures(m_platform.files, m_state.keptFolder).hostOf(path).value_or(HostPath());
    Result<EditedPreview> opened =
        EditedPreview::open(file, paper, PreviewZoom, EditedPreview::Tone::Colour, largestScale);
    if (!opened) {
        tell(u"לא ניתן לפתוח את התמונה לעריכה"_s, u"The picture can't be opened for editing"_s,
             warnedWords(m_state, opened.failure(), path));
        return false;
    }
    surfaces().open(std::move(*opened));
    PicPicSize = workPicture()->box();
    writeWorkFile();
    return true;
}

void tFrmNew::writeWorkFile() {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    workPicture()->workPicture().image().save(&buffer, "BMP");
    const Result<void> written = m_platform.files.writePassing(WorkspacePaths::previewCopy(m_state), bytes);
    // Editing needs no work file, so its failure is told once.
    if (!written && !m_workFileFailed)
        m_platform.dialogs.message(written.failure().message);
    m_workFileFailed = !written;
}

void tFrmNew::pickAnotherPicture() {
    stopHolds();
    const DrivePath picture = m_platform.dialogs.pickFile(
        m_state.wording(u"לחץ על תמונה אחת פעמיים וכל התמונות מהתיקייה תוצגנה "_s,
                        u"Double-click one picture and all the pictures of the folder will be shown"_s),
        m_state.DiskRoot,
        m_state.wording(u"בחר תמונה אחת וכל התמונות תוצגנה"_s,
                        u"Choose one picture and all the pictures will be shown"_s));
    if (picture.isEmpty())
        return;
    backToPictures();
    // The record of the picture that is left keeps its zoom and gains.
    m_open = false;
    m_edit.ZoomPercent = 100;
    m_edit.GainR = m_edit.GainG = m_edit.GainB = 1;
    ResetEditorZoom();
    Q_EMIT picked(picture);
}

void tFrmNew::backToPictures() {
    stopHolds();
    hidePanels();
    m_chain.unload(PageId::mikledet);
    Q_EMIT left();
    m_chain.follow(pageId, Outcome::EditingDone);
}

// --- the record ---

void tFrmNew::putHandle(QPointF position) {
    constexpr double low = -32768;
    constexpr double high = 32767;
    Image3.put({std::clamp(position.x(), low, high), std::clamp(position.y(), low, high)});
}

void tFrmNew::handleToFields() {
    m_edit.PanX = HoldIn16Bits(Image3.position().x());
    m_edit.PanY = HoldIn16Bits(Image3.position().y());
}

void tFrmNew::PackEditState() {
    // The handle has no place before a picture is open.
    if (m_open)
        handleToFields();
    m_limits.hold(m_edit);
    lumora::PackEditState(m_edit, LeftField(m_state.shemot.Bord, 2), Combo4.text);
    Label13.text = m_edit.EditState;
}

void tFrmNew::StoreCurrentEdit() {
    Q_EMIT stored();
}

Bitmap tFrmNew::drawn(const EditFields& fields) {
    return workPicture()->render(fields, frame(fields), m_scale);
}

Bitmap tFrmNew::takeSmallView() {
    if (!m_open || !m_drawnSinceTaken)
        return {};
    m_drawnSinceTaken = false;
    return workPicture()->render(m_edit, frame(m_edit));
}

void tFrmNew::RenderPreview() {
    m_limits.hold(m_edit);
    PicPic = drawn(m_edit);
    m_drawnSinceTaken = true;
    Q_EMIT changed();
}

void tFrmNew::packRenderStore() {
    PackEditState();
    RenderPreview();
    StoreCurrentEdit();
}

void tFrmNew::renderPackStore() {
    RenderPreview();
    PackEditState();
    StoreCurrentEdit();
}

void tFrmNew::keepRecord() {
    if (!m_open)
        return;
    PackEditState();
    StoreCurrentEdit();
    Q_EMIT changed();
}

void tFrmNew::takeCorrection() {
    keepRecord();
    if (!m_open || !m_correction.isSeen() || !loadPictureOfRecord())
        return;
    turnGreyIfToned();
    RenderPreview();
}

void tFrmNew::undoAllEdits() {
    if (!m_open)
        return;
    stopHolds();
    const std::int16_t zoomBefore = PreviewZoom;
    PreviewZoom = 100; // decides the size of the work picture
    if (!loadPictureOfRecord()) {
        PreviewZoom = zoomBefore;
        return;
    }
    ColourStep::undo(m_edit);
    m_coverZoom.forget();
    // The reload may have changed the paper, so the centre is that of the new one.
    putHandle(QPoint(PicPicSize.width / 2, PicPicSize.height / 2));
    handleToFields();
    renderPackStore();
    showNumbers();
}

// --- looking ---

void tFrmNew::showNumbers() {
    Label10.text = QString::number(m_edit.RotationCode);
    Label11.text = QString::number(PreviewZoom);
    showResolution();
}

void tFrmNew::showResolution() {
    const QString& paper = m_state.shemot.ppr;
    const std::optional<PaperSize> size = m_open ? PaperSize::ofText(paper) : std::nullopt;
    resolution.show(size ? std::optional(PrintResolution::ofEdited(workPicture()->fileSize(), *size, m_edit))
                         : std::nullopt,
                    paper, m_state.english());
}

// RotationCode is 180 for an upright picture.
int tFrmNew::turnDegrees() const {
    const int angle = (m_edit.RotationCode - 180 + 720) % 360;
    return angle > 180 ? angle - 360 : angle;
}

void tFrmNew::lookQuickly() {
    if (!m_open)
        return;
    const Bitmap& work = workPicture()->workPicture();
    const double z = std::max<int>(PreviewZoom, 1) / 100.0;
    const double width = work.width();
    const double height = work.height();
    const QRectF source(2 * width / z - width, 2 * height / z - height, width / z, height / z);
    QPainter painter(&PicPic.image());
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    painter.drawImage(QRectF(0, 0, PicPic.width(), PicPic.height()), work.image(), source);
    painter.end();
    Q_EMIT changed();
}

void tFrmNew::measureLevels() {
    if (!m_open)
        return;
    surfaces().measureLevels();
    m_edit.AutoMarker = EditRecord::levelled;
    packRenderStore();
}

void tFrmNew::setPreviewScale(double scale) {
    const double held = std::clamp(scale, 1.0, largestScale);
    if (held == m_scale)
        return;
    m_scale = held;
    if (m_open)
        RenderPreview();
}

void tFrmNew::turnHints() {
    hintsAsLabels = !hintsAsLabels;
    setTexts();
}

void tFrmNew::open(Panel panel) {
    m_panel = panel;
    Frame3.visible = panel == Panel::Tones;
    Frame4.visible = panel == Panel::Turns;
    Q_EMIT changed();
}

// --- the crop markers ---

void tFrmNew::markCorners() {
    crop.toCorners(PicPicSize);
    Q_EMIT changed();
}

void tFrmNew::markInset() {
    crop.toInset(PicPicSize);
    Q_EMIT changed();
}

void tFrmNew::widenMarkers(int pixels) {
    crop.widen(pixels);
    Q_EMIT changed();
}

void tFrmNew::takeCorner(CropFrame::Corner corner, QPointF at) {
    m_cropCorner = corner;
    m_cropHandle.press(at);
}

void tFrmNew::dragCorner(QPointF at) {
    if (!m_cropHandle.held())
        return;
    crop.drag(m_cropCorner, m_cropHandle.distance(at));
    Q_EMIT changed();
}

} // namespace lumora
