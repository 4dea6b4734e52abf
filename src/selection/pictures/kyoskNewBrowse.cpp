// The page of pictures: finding folders, turning pages, drawing small pictures and the large view.
#include "common/DrivePath.h"
#include "editing/editor/Form3.h"
#include "editing/render/StoredSmallView.h"
#include "imaging/files/PictureFile.h"
#include "order/KeptPictures.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "selection/PrintQuality.h"
#include "selection/door/PictureDoor.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <QTransform>

#include <algorithm>
#include <cmath>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {
// Small pictures drawn between two pumps: one for each core of a small machine.
constexpr int drawnAtOnce = 2;
} // namespace

HostPath kyoskNew::hostOf(const DrivePath& path) const {
    return KeptPictures(m_platform.files, m_state.keptFolder).hostOf(path).value_or(HostPath());
}

void kyoskNew::setCellPixels(int pixels, int large) {
    const bool largeGrew = std::exchange(m_largeScale, large / 400.0) < large / 400.0;
    const bool cellsChanged = pixels >= 1 && std::exchange(m_cellPixels, pixels) != pixels;
    if (!largeGrew && !cellsChanged)
        return;
    // A view may call this while it renders. Drawing pumps events, so it waits for the next turn of the event loop.
    QMetaObject::invokeMethod(
        this,
        [this, cellsChanged] {
            if (m_handedOver)
                return;
            if (!Picture2.bitmap.isNull())
                showLarge(m_largePath);
            if (cellsChanged)
                drawCells();
            else
                Q_EMIT changed();
        },
        Qt::QueuedConnection);
}

void kyoskNew::turnPage(const std::function<void()>& step) {
    for (CellPicture& picture : Picture1)
        picture.visible = false;
    m_openCell = -1;
    step();
    for (CellPicture& picture : Picture1)
        picture.visible = true;
    Q_EMIT changed();
}

void kyoskNew::addFolder() {
    if (m_picking || m_handedOver)
        return;
    m_picking = true;
    turnPage([this] { pickFolder(); });
    m_picking = false;
}

void kyoskNew::turnTo(void (PictureChoice::*page)()) {
    m_openWhenMade.clear();
    turnPage([&] {
        (m_choice.*page)();
        drawPage();
    });
}

void kyoskNew::pickFolder() {
    Pic4Brose.visible = true;
    Q_EMIT changed();
    m_platform.pump.pump();
    const QString prompt = m_state.wording(u"בחר תמונה אחת בלבד ", u"Select one image only");
    const DrivePath picture = m_platform.dialogs.pickFile(prompt, m_state.DiskRoot, u"Open"_s);
    Pic4Brose.visible = false;
    Q_EMIT changed();

    if (refusesName(picture))
        return;
    if (picture.isEmpty()) {
        if (!m_choice.folders().isEmpty()) {
            m_choice.markPage();
            drawPage();
        }
        return;
    }
    showFolderOf(picture);
}

// A picture whose own name is outside the code page fails alone, when the order is prepared.
bool kyoskNew::refusesName(const DrivePath& picture) {
    if (!plain() || m_door->isOpen() || !HasQuestionMark(m_state.Careful ? picture.folder().text() : picture.text()))
        return false;
    m_platform.dialogs.message(u"File Coold not Be Rcognized\nPleas Rename Folder Name \nTo English"_s);
    return true;
}

void kyoskNew::showFolderOf(const DrivePath& picture) {
    takeFolderOf(picture);
    if (m_choice.folders().isEmpty())
        return;
    Frame1.visible = true;
    if (m_state.Optint == OrderKind::Sequence || m_state.Optint == OrderKind::Album)
        showFolderOffer();
    showGuide(Guide::PicturesShown);
    m_choice.nextPage();
    focusOnFirstPicture();
    drawPage();
}

void kyoskNew::focusOnFirstPicture() {
    for (int cell = 0; cell < m_choice.page().count(); ++cell) {
        if (!m_door->isUnreadable(m_choice.path(cell)))
            return focusOn(u"Picture1(%1)"_s.arg(cell));
    }
}

void kyoskNew::takeFolderOf(const DrivePath& picture) {
    DrivePath folder = picture.folder();
    if (folder.text().size() <= 2)
        folder = folder / u""; // a drive root: its path alone ends in a backslash
    File1.setFolder(folder);
    m_choice.addFolder(folder, File1.names());
    Label29.text = folder.text();
    showPictureCount();
    if (File1.count() > 0)
        return;
    const QString none = m_state.door.everyFormat
                             ? m_state.wording(u"לא נמצאו תמונות בתיקייה\n%1\nנא לבחור תמונה מתיקייה אחרת",
                                               u"There are no pictures in the folder\n%1\n"
                                               u"Select a picture of another folder")
                             : m_state.wording(u"לא נמצאו תמונות JPG בתיקייה\n%1\nנא לבחור תמונה מתיקייה אחרת",
                                               u"There are no JPG pictures in the folder\n%1\n"
                                               u"Select a picture of another folder");
    m_platform.dialogs.message(none.arg(folder.text()));
}

void kyoskNew::showPictureCount() {
    m_countShown = true;
    const QString count = QString::number(m_choice.folders().count());
    Label34.text = count;
    pictureCount.text = m_state.wording(u"%1 תמונות", u"%1 pictures").arg(count);
}

void kyoskNew::showFolderOffer() {
    Picture66.visible = true;
    for (Caption* part : {&Label35, &Label36, &Image19, &Image20})
        part->visible = true;
    label35Left = 0;
    Timer1.start();
    Timer2.start();
}

void kyoskNew::drawPage() {
    clearCells();
    showChoice();
    drawCells();
}

void kyoskNew::clearCells() {
    for (CellPicture& picture : Picture1)
        picture.bitmap = Bitmap();
}

DrivePath kyoskNew::pictureToDraw(const QString& path) const {
    if (!plain() && m_choice.inBasket(path)) {
        const DrivePath stored = StoredSmallView::path(m_state, DrivePath(path));
        if (m_platform.files.fileExists(stored))
            return stored;
    }
    return DrivePath(path);
}

void kyoskNew::drawCells() {
    const unsigned drawing = ++m_drawing;
    m_small.stopReadingAhead();
    drawDrafts();
    if (drawing != m_drawing)
        return;
    for (int first = 0; first < List2.count(); first += drawnAtOnce) {
        const int behind = std::min(first + drawnAtOnce, List2.count());
        std::vector<HostPath> paths;
        for (int cell = first; cell < behind; ++cell)
            paths.push_back(hostOf(pictureToDraw(m_choice.path(cell))));
        std::vector<Result<Bitmap>> pictures = m_small.load(paths, m_cellPixels);
        for (int cell = first; cell < behind; ++cell) {
            // A file that can't be read leaves its cell empty, and the page goes on.
            CellPicture& shown = Picture1[static_cast<std::size_t>(cell)];
            Result<Bitmap>& picture = pictures[static_cast<std::size_t>(cell - first)];
            const bool waiting = m_door->isWaiting(m_choice.path(cell)); // its draft stays
            if (!picture && !waiting)
                findUnreadable(m_choice.path(cell), picture.failure());
            if (picture || !waiting)
                shown.bitmap = picture ? std::move(*picture) : Bitmap();
            shown.visible = true;
            m_resolution.look(m_choice.path(cell));
            showCell(cell);
        }
        Q_EMIT changed();
        m_platform.pump.pump();
        if (drawing != m_drawing)
            return;
    }
    tellTakenOut();
    Q_EMIT changed();
    readAhead();
}

// What the camera has put into the header shows at once, and goes when the picture itself is drawn.
void kyoskNew::drawDrafts() {
    bool drawn = false;
    for (int cell = 0; cell < List2.count(); ++cell) {
        CellPicture& shown = Picture1[static_cast<std::size_t>(cell)];
        const QString path = m_choice.path(cell);
        if (!shown.bitmap.isNull() || m_small.keeps(hostOf(pictureToDraw(path)), m_cellPixels))
            continue;
        shown.bitmap = m_door->draft(path, m_cellPixels);
        drawn = drawn || !shown.bitmap.isNull();
    }
    orderPictures(); // drafts that have to be decoded come first
    if (!drawn)
        return;
    Q_EMIT changed();
    m_platform.pump.pump();
}

// The next page while the customer looks at this one.
void kyoskNew::readAhead() {
    if (!m_choice.hasNextPage())
        return;
    const QStringList next = nextPictures();
    std::vector<HostPath> files;
    for (const QString& path : next)
        files.push_back(hostOf(pictureToDraw(path)));
    m_small.readAhead(files, m_cellPixels);
    orderPictures(next);
}

void kyoskNew::repaint(const QString& path) {
    for (int cell = 0; cell < List2.count(); ++cell) {
        if (List2.item(cell) != path)
            continue;
        std::vector<Result<Bitmap>> pictures = m_small.load({hostOf(pictureToDraw(path))}, m_cellPixels);
        if (pictures.front() || m_door->isUnreadable(path))
            Picture1[static_cast<std::size_t>(cell)].bitmap =
                pictures.front() ? std::move(*pictures.front()) : Bitmap();
    }
    Q_EMIT changed();
}

void kyoskNew::showLarge(const DrivePath& path) {
    const HostPath host = hostOf(path);
    const Result<PictureSize> size = readPictureSize(host);
    if (!size)
        return;
    const PictureSize view = largeViewSize(*size);
    const auto pixels = [this](int units) { return std::max(1, static_cast<int>(std::lround(units * m_largeScale))); };
    // A quarter turn exchanges the sides of the view; the picture keeps its proportions.
    const Result<Bitmap> picture = loadPictureScaled(host, {pixels(view.width), pixels(view.height)});
    if (!picture)
        return;
    Picture2.bitmap =
        m_rotation == 0 ? *picture : Bitmap(picture->image().transformed(QTransform().rotate(m_rotation)));
    Image4.visible = true;
    m_guide = Guide::None;
    Picture2.text.clear();
    Picture2.guide.clear();

    m_largeSize = *size;
    showPaper();

    const PrintGrade grade = printGrade(*size);
    Picture2.poor = grade == PrintGrade::Borderline || grade == PrintGrade::VeryLow;
    if (grade != PrintGrade::Unmarked) {
        m_grade = grade;
        m_gradedSize = *size;
        Label6.text = printGradeText(m_grade, m_gradedSize, m_state.english());
    }
}

// A quarter turn of the view turns the paper with the picture.
void kyoskNew::showPaper() {
    const std::optional<PaperSize> paper = Picture2.bitmap.isNull() ? std::nullopt : m_resolution.paper();
    Picture2.paper = paper ? paperOnPicture(m_largeSize, *paper, m_resolution.fit()) : QRectF();
    if (m_rotation % 180 != 0)
        Picture2.paper = {Picture2.paper.topLeft().transposed(), Picture2.paper.size().transposed()};
    setPaperTexts();
}

void kyoskNew::turnLargeView() {
    m_rotation = (m_rotation + 90) % 360;
    showLarge(m_largePath);
    Q_EMIT changed();
}

void kyoskNew::lookInLarge() {
    if (Picture2.bitmap.isNull())
        return;
    m_chain.load<Form3>().open(m_largePath);
    m_chain.follow(pageId, Outcome::TurnedWanted);
}

} // namespace lumora
