// The page of pictures: finding folders, turning pages, drawing small pictures and the large view.
#include "common/DrivePathText.h"
#include "editing/editor/Form3.h"
#include "editing/render/StoredSmallView.h"
#include "imaging/files/PictureFile.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "selection/PrintQuality.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <QTransform>

#include <algorithm>
#include <cmath>

namespace lumora {

namespace {
// Drawn between two pumps: as many as a small machine has cores.
constexpr int drawnAtOnce = 2;
constexpr int smallScreen = 700;

HostPath hostOf(const Platform& platform, const QString& path) {
    return platform.files.drives().toHost(path).value_or(HostPath());
}
} // namespace

void kyoskNew::setScreenHeight(int pixels) {
    const int size = pixels < smallScreen ? 90 : 115;
    if (size == cellSize)
        return;
    cellSize = size;
    Label4FontSize = pixels < smallScreen ? 12 : 0;
    Q_EMIT changed();
}

void kyoskNew::setCellPixels(int pixels) {
    if (pixels < 1 || pixels == m_cellPixels)
        return;
    m_cellPixels = pixels;
    // A view may tell its resolution while it renders; drawing pumps and has to wait for the next turn.
    QMetaObject::invokeMethod(
        this,
        [this] {
            if (m_handedOver)
                return;
            if (!Picture2.bitmap.isNull())
                showLarge(Label2.text);
            drawCells();
        },
        Qt::QueuedConnection);
}

void kyoskNew::turnPage(const std::function<void()>& step) {
    for (CellPicture& picture : Picture1)
        picture.visible = false;
    setKeysPlain();
    step();
    for (CellPicture& picture : Picture1)
        picture.visible = true;
    Q_EMIT changed();
}

void kyoskNew::setKeysPlain() {
    for (KeyCaption& key : Command12)
        key.colour = KeyColour::System;
    for (KeyCaption& key : Command13)
        key.colour = KeyColour::System;
}

void kyoskNew::Image5_Click() {
    if (m_picking || m_handedOver)
        return;
    m_picking = true;
    turnPage([this] { pickFolder(); });
    m_picking = false;
}

void kyoskNew::Image16_Click() {
    turnPage([this] { ShowPage(); });
}

void kyoskNew::Image15_Click() {
    turnPage([this] {
        List4.PageBack();
        ShowPage();
    });
}

void kyoskNew::Command14_Click() {
    turnPage([this] {
        FillChosenPage();
        drawPage();
    });
}

void kyoskNew::pickFolder() {
    Pic4Brose.visible = true;
    Q_EMIT changed();
    m_platform.pump.pump();
    const QString prompt =
        m_state.wording(QStringLiteral("בחר תמונה אחת בלבד "), QStringLiteral("Select one image only"));
    const QString picture = m_platform.dialogs.pickFile(prompt, m_state.DiskRoot, QStringLiteral("Open"));
    Pic4Brose.visible = false;
    Q_EMIT changed();

    if (plain() && HasQuestionMark(picture)) {
        m_platform.dialogs.message(
            QStringLiteral("File Coold not Be Rcognized\nPleas Rename Folder Name \nTo English"));
        return;
    }
    if (picture.isEmpty()) {
        if (!List4.isEmpty())
            drawPage();
        return;
    }
    showFolderOf(picture);
}

void kyoskNew::showFolderOf(const QString& picture) {
    takeFolderOf(picture);
    if (List4.isEmpty())
        return;
    Frame1.visible = true;
    if (m_state.Optint == OrderKind::Sequence || m_state.Optint == OrderKind::Album)
        showFolderOffer();
    showGuide(Guide::PicturesShown);
    ShowPage();
}

void kyoskNew::takeFolderOf(const QString& picture) {
    QString folder = picture.left(std::max<qsizetype>(picture.lastIndexOf(u'\\'), 0));
    if (folder.size() <= 2)
        folder += u'\\'; // a drive root: its path alone ends in a backslash
    File1.setFolder(folder);
    List4.addFolder(folder, File1.names());
    Label34.text = QString::number(List4.count());
    Label29.text = folder;
    if (File1.count() == 0)
        say(QStringLiteral("לא נמצאו תמונות JPG בתיקייה\n") + folder + QStringLiteral("\nבחר תמונה מתיקייה אחרת"),
            QStringLiteral("There are no JPG pictures in the folder\n") + folder +
                QStringLiteral("\nSelect a picture of another folder"));
}

void kyoskNew::showFolderOffer() {
    Picture66.visible = true;
    for (Caption* part : {&Label35, &Label36, &Image19, &Image20})
        part->visible = true;
    label35Left = 0;
    Timer1.start();
    Timer2.start();
}

void kyoskNew::Timer1_Tick() {
    label35Left = std::min(label35Left + 10, 300);
    if (label35Left == 300)
        Timer1.stop();
    Q_EMIT changed();
}

void kyoskNew::Timer2_Tick() {
    pointerStep = (pointerStep + 1) % 4;
    Q_EMIT changed();
}

void kyoskNew::ShowPage() {
    List2.clear();
    List2.append(List4.FillPageList());
    drawPage();
}

void kyoskNew::FillChosenPage() {
    // The list of a basket that was never paged stands before its first line; a page of chosen pictures begins with it.
    int index = std::max(List1.currentIndex(), 0);
    const int column = BasketLine::pathColumn(List1.form());
    const QStringList page = FillPage(List1.lines().items(), index, [column](const QString& line) {
        return line.trimmed().isEmpty() ? QString() : line.mid(column);
    });
    List1.setCurrentIndex(index);
    List2.clear();
    List2.append(page);
}

void kyoskNew::drawPage() {
    clearCells();
    markChosen();
    drawCells();
}

void kyoskNew::clearCells() {
    for (std::size_t cell = 0; cell < cellsOfPage; ++cell) {
        Picture1[cell].bitmap = Bitmap();
        Picture4[cell].visible = false;
        Label4[cell].text = QStringLiteral("0");
        Label5[cell].text = QStringLiteral("*");
    }
}

// Each line is looked at by itself: the fields of the picture that is open in the editor stay what they are.
void kyoskNew::markChosen() {
    for (int i = 0; i < List2.count(); ++i) {
        const auto cell = static_cast<std::size_t>(i);
        Label5[cell].text = RightPart(List2.item(i), 20);
        if (const int index = List1.FindByPath(List2.item(i)); index >= 0) {
            Picture4[cell].visible = true;
            Label4[cell].text = QString::number(PrintCode::copiesOf(List1.item(index)));
        }
    }
}

QString kyoskNew::pictureToDraw(int cell) const {
    const QString path = List2.item(cell);
    if (!plain() && List1.FindByPath(path) >= 0) {
        const QString stored = StoredSmallView::path(m_state, path);
        if (m_platform.files.fileExists(stored))
            return stored;
    }
    return path;
}

void kyoskNew::drawCells() {
    const unsigned drawing = ++m_drawing;
    for (int first = 0; first < List2.count(); first += drawnAtOnce) {
        const int behind = std::min(first + drawnAtOnce, List2.count());
        std::vector<HostPath> paths;
        for (int cell = first; cell < behind; ++cell)
            paths.push_back(hostOf(m_platform, pictureToDraw(cell)));
        std::vector<Result<Bitmap>> pictures = loadSmallPictures(paths, m_cellPixels);
        for (int cell = first; cell < behind; ++cell) {
            // A file that can't be read leaves its cell empty, and the page goes on.
            CellPicture& shown = Picture1[static_cast<std::size_t>(cell)];
            Result<Bitmap>& picture = pictures[static_cast<std::size_t>(cell - first)];
            shown.bitmap = picture ? std::move(*picture) : Bitmap();
            shown.visible = true;
        }
        Q_EMIT changed();
        m_platform.pump.pump();
        if (drawing != m_drawing)
            return;
    }
    Q_EMIT changed();
}

void kyoskNew::repaintStored(const QString& path) {
    for (int cell = 0; cell < List2.count(); ++cell) {
        if (List2.item(cell) != path)
            continue;
        std::vector<Result<Bitmap>> pictures =
            loadSmallPictures({hostOf(m_platform, pictureToDraw(cell))}, m_cellPixels);
        if (pictures.front())
            Picture1[static_cast<std::size_t>(cell)].bitmap = std::move(*pictures.front());
    }
}

void kyoskNew::showLarge(const QString& path) {
    const HostPath host = hostOf(m_platform, path);
    const Result<PictureSize> size = readPictureSize(host);
    if (!size)
        return;
    const PictureSize view = largeViewSize(*size);
    const double scale = static_cast<double>(m_cellPixels) / cellSize;
    const auto pixels = [scale](int units) { return std::max(1, static_cast<int>(std::lround(units * scale))); };
    // A quarter turn exchanges the sides of the view; the picture keeps its proportions.
    const Result<Bitmap> picture = loadPictureScaled(host, {pixels(view.width), pixels(view.height)});
    if (!picture)
        return;
    Picture2.bitmap =
        m_rotation == 0 ? *picture : Bitmap(picture->image().transformed(QTransform().rotate(m_rotation)));
    m_guide = Guide::None;
    Picture2.guide.clear();

    const PrintGrade grade = printGrade(*size);
    Picture2.warning = grade == PrintGrade::Borderline || grade == PrintGrade::VeryLow;
    if (grade != PrintGrade::Unmarked) {
        m_grade = grade;
        m_gradedSize = *size;
        showGrade();
    }
}

void kyoskNew::showGrade() {
    Label6.text = printGradeText(m_grade, m_gradedSize, m_state.english());
}

void kyoskNew::Image4_Click() {
    m_rotation = (m_rotation + 90) % 360;
    showLarge(Label2.text);
    Q_EMIT changed();
}

void kyoskNew::Picture2_Click() {
    if (Picture2.bitmap.isNull())
        return;
    m_chain.load<Form3>().open(Label2.text);
    m_chain.follow(PageId::kyoskNew, Outcome::TurnedWanted);
}

void kyoskNew::Image6_Click() {
    Frame2.visible = !Frame2.visible;
    Q_EMIT changed();
}

void kyoskNew::Image11_Click() {
    m_platform.shell.openWebPage(m_state.profile.PriceListUrl);
}

void kyoskNew::Image17_Click() {
    Image11_Click();
}

} // namespace lumora
