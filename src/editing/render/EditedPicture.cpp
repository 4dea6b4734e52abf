#include "editing/render/EditedPicture.h"

#include "imaging/Stopwatch.h"
#include "imaging/drawing/ColourMatrix.h"
#include "imaging/scaling/Resample.h"
#include "order/EditRecord.h"
#include "platform/files/HostPath.h"
#include "session/SessionState.h"

#include <QPainter>
#include <QPolygonF>

#include <algorithm>
#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

namespace fs = std::filesystem;

constexpr float crossGain = 1.0F / 1000.0F;
constexpr int printQuality = 90;

ColourMatrix coloursOf(const EditFields& edit) {
    return ColourMatrix::fromGains(edit.GainR, edit.GainG, edit.GainB, crossGain);
}

// The caption as the record stores it, so that a preview never shows more than the print.
PictureCaption captionOf(const EditFields& edit) {
    namespace R = EditRecord;
    const auto channel = [](std::int16_t value) { return std::clamp<int>(value, 0, 255); };
    PictureCaption caption;
    caption.text = R::stored(R::TextBody, edit.TextBody);
    caption.family = edit.TextFont;
    caption.emSize = R::stored(R::TextFontSize, edit.TextFontSize);
    caption.bold = (edit.TextStyle & 1) != 0;
    caption.italic = (edit.TextStyle & 2) != 0;
    caption.align = edit.TextAlign == R::alignCentre ? PictureCaption::Align::Centre
                    : edit.TextAlign == R::alignFar  ? PictureCaption::Align::Far
                                                     : PictureCaption::Align::Near;
    caption.run = edit.TextVertical == R::runsDown ? PictureCaption::Run::Down : PictureCaption::Run::Across;
    caption.colour = QColor(channel(edit.TextRed), channel(edit.TextGreen), channel(edit.TextBlue));
    caption.x = R::stored(R::TextX, edit.TextX);
    caption.y = R::stored(R::TextY, edit.TextY);
    return caption;
}

// Draws what lies over the picture, in preview and print alike. An empty frame or caption is left out.
void drawOver(Bitmap& paper, const KeyedFrame& frame, const CaptionInk& ink) {
    drawKeyedFrame(paper, frame);
    drawInk(paper, ink);
}

// A view of the picture's own pixels; the picture must outlive it.
Bitmap within(const Bitmap& picture, const QRect& part) {
    const QImage& image = picture.image();
    const QRect area = part & image.rect();
    return Bitmap(QImage(image.constScanLine(area.top()) + std::ptrdiff_t{area.left()} * 4, area.width(), area.height(),
                         image.bytesPerLine(), image.format()));
}

PictureSize scaledSize(PictureSize size, double scale) {
    const auto side = [scale](int pixels) { return std::max(1, static_cast<int>(std::lround(pixels * scale))); };
    return {side(size.width), side(size.height)};
}

bool touches(const Placement& placement, PictureSize paper) {
    const PictureSize size = placement.zoomed();
    double left = 1e9;
    double top = 1e9;
    double right = -1e9;
    double bottom = -1e9;
    for (const int x : {0, size.width}) {
        for (const int y : {0, size.height}) {
            const Placement::Point corner = placement.onPaper(x, y);
            left = std::min(left, corner.x);
            right = std::max(right, corner.x);
            top = std::min(top, corner.y);
            bottom = std::max(bottom, corner.y);
        }
    }
    return right > -1 && bottom > -1 && left < paper.width + 1 && top < paper.height + 1;
}

// True for a plain name that can't lead out of the folder.
bool isPlainName(const QString& name) {
    return !name.contains(u'/') && !name.contains(u'\\') && !name.contains(u':') && !name.contains(u".."_s) &&
           !name.contains(QChar(0)) && name != u"."_s;
}

// Frame files are found whatever their letter case.
fs::path fileNamed(const fs::path& folder, const QString& leaf) {
    const fs::path exact = folder / toHostPath(leaf);
    std::error_code error;
    if (fs::exists(exact, error))
        return exact;
    for (fs::directory_iterator at(folder, error), end; !error && at != end; at.increment(error)) {
        if (toText(at->path().filename()).compare(leaf, Qt::CaseInsensitive) == 0)
            return at->path();
    }
    return exact;
}

// The work picture: a larger file is shrunk by the averaging cubic, a smaller one is enlarged linearly.
Result<Bitmap> loadWork(const fs::path& file, PictureSize fileSize, PictureSize wanted) {
    if (wanted.width <= fileSize.width && wanted.height <= fileSize.height)
        return loadPictureScaled(file, wanted);
    auto small = loadPicture(file);
    if (!small)
        return small;
    Bitmap enlarged(wanted.width, wanted.height, Qt::white);
    if (!enlarged.isNull()) {
        QPainter painter(&enlarged.image());
        painter.setRenderHint(QPainter::SmoothPixmapTransform);
        painter.drawImage(QRect(0, 0, wanted.width, wanted.height), small->image());
    }
    return enlarged;
}

Failure noRoom(const fs::path& file, PictureSize size) {
    return {Failure::Kind::TooLarge,
            u"%1: no memory for a picture of %2 x %3"_s.arg(toText(file)).arg(size.width).arg(size.height)};
}

Result<Bitmap> loadGreyPart(const EditedPrint& print, PictureSize wanted, const QRect& part) {
    Result<Bitmap> whole = print.grey.isNull() ? loadGrey(print.file) : Result<Bitmap>(print.grey);
    if (!whole)
        return whole;
    Bitmap scaled = resampledPart(*whole, wanted, part);
    if (scaled.isNull())
        return noRoom(print.file, wanted);
    return scaled;
}

} // namespace

std::optional<Bitmap> loadFrame(const fs::path& framesFolder, const EditFields& edit, FrameUse use) {
    const QString name = edit.FrameName.trimmed();
    const QString folder = edit.FrameFolder.trimmed();
    if (framesFolder.empty() || name.isEmpty() || name == EditRecord::noFrame || name == EditRecord::frameRemoved ||
        !isPlainName(name) || !isPlainName(folder))
        return std::nullopt;
    const auto load = [&](const QString& leaf) -> std::optional<Bitmap> {
        auto frame = loadPicture(fileNamed(framesFolder / toHostPath(folder), leaf + u".bmp"_s));
        return frame ? std::optional(*frame) : std::nullopt;
    };
    const QString seen = u'k' + name;
    const QStringList leaves = use == FrameUse::Preview            ? QStringList{seen}
                               : use == FrameUse::PreviewElsePrint ? QStringList{seen, name}
                                                                   : QStringList{name, seen};
    for (const QString& leaf : leaves) {
        if (auto frame = load(leaf))
            return frame;
    }
    return std::nullopt;
}

Result<EditedPreview> EditedPreview::open(const fs::path& file, PaperSize paper, int zoomPercent, Tone tone,
                                          double largestScale) {
    const auto size = readPictureSize(file);
    if (!size)
        return size.failure();
    const auto workSize = workPictureSize(*size, zoomPercent);
    if (!workSize)
        return Failure{Failure::Kind::TooLarge, u"%1: a picture of %2 x %3 is too slim to be edited"_s.arg(toText(file))
                                                    .arg(size->width)
                                                    .arg(size->height)};
    const PictureSize most = scaledSize(*workSize, largestScale);
    const PictureSize sharp{std::clamp(most.width, workSize->width, std::max(workSize->width, size->width)),
                            std::clamp(most.height, workSize->height, std::max(workSize->height, size->height))};
    const auto loaded = loadWork(file, *size, sharp);
    if (!loaded)
        return loaded.failure();
    EditedPreview preview;
    preview.m_file = *size;
    preview.m_paper = paper;
    preview.m_box = previewBox(paper, orientationOf(*size));
    preview.m_work = onWhite(*loaded);
    if (sharp != *workSize) {
        preview.m_sharp = preview.m_work;
        preview.m_work = resampled(preview.m_sharp, *workSize);
    }
    if (preview.m_work.isNull())
        return noRoom(file, *workSize);
    if (tone == Tone::Grey)
        preview.turnGrey();
    return preview;
}

void EditedPreview::turnGrey() {
    const ColourMatrix grey = ColourMatrix::grey(greyWeight);
    m_work = grey.applied(m_work);
    if (!m_sharp.isNull())
        m_sharp = grey.applied(m_sharp);
    m_overlay = {};
}

bool EditedPreview::coversPaper(const EditFields& edit) const {
    return previewPlacement({m_work.width(), m_work.height()}, m_box, edit).covers(m_box);
}

bool EditedPreview::touchesPaper(const EditFields& edit) const {
    const Placement placement = previewPlacement({m_work.width(), m_work.height()}, m_box, edit);
    const PictureSize size = placement.zoomed();
    QPolygonF picture;
    for (const QPoint corner : {QPoint(0, 0), {size.width, 0}, {size.width, size.height}, {0, size.height}}) {
        const Placement::Point at = placement.onPaper(corner.x(), corner.y());
        picture += QPointF(at.x, at.y);
    }
    // Touching edges share no pixel.
    return picture.intersects(QPolygonF(QRectF(1, 1, m_box.width - 2, m_box.height - 2)));
}

std::int16_t EditedPreview::coveringZoom(EditFields edit) const {
    const PrintGeometry print = printGeometry(m_paper, orientationOf(m_file));
    for (; edit.ZoomPercent < largestCoveringZoom; ++edit.ZoomPercent) {
        if (coversPaper(edit) && printPlacement(m_file, print, edit).covers(print.size))
            return edit.ZoomPercent;
    }
    return largestCoveringZoom;
}

void EditedPreview::setBackground(QColor colour) {
    m_colour = colour;
    m_overlay = {};
}

void EditedPreview::prepareOverlay(const EditFields& edit, const std::optional<Bitmap>& frame, double scale) {
    const PictureSize size = scaledSize(m_box, scale);
    if (m_overlay.scale != scale) {
        m_overlay = {};
        m_overlay.scale = scale;
    }
    if (!frame) {
        m_overlay.frame = {};
        m_overlay.frameKey = 0;
    } else if (m_overlay.frameKey != frame->image().cacheKey()) {
        m_overlay.frame = keyedFrame(*frame, size);
        m_overlay.frameKey = frame->image().cacheKey();
    }
    m_overlay.ink = edit.TextOn == 1 ? m_overlay.inks.inkOf(captionOf(edit), size, {scale, scale}) : CaptionInk();
}

Bitmap EditedPreview::render(const EditFields& edit, const std::optional<Bitmap>& frame, double scale) {
    prepareOverlay(edit, frame, scale);
    Placement placement = previewPlacement({m_work.width(), m_work.height()}, m_box, edit);
    placement.drawWidth *= scale;
    placement.drawHeight *= scale;
    placement.panX *= scale;
    placement.panY *= scale;
    const PictureSize size = scaledSize(m_box, scale);
    const bool uncovered = !placement.covers(size);
    if (uncovered && m_overlay.background.isNull())
        m_overlay.background =
            m_colour ? Bitmap(size.width, size.height, *m_colour) : resampled(sourceFor(scale), size);
    // The stretched picture takes longest, so it is made only where something of it shows.
    Bitmap paper = uncovered ? m_overlay.background : Bitmap(size.width, size.height, Qt::white);
    drawPlaced(paper, sourceFor(scale), placement, coloursOf(edit));
    drawOver(paper, m_overlay.frame, m_overlay.ink);
    return paper;
}

Result<Bitmap> loadGrey(const fs::path& file) {
    auto picture = loadPicture(file);
    if (!picture)
        return picture;
    const PictureSize size{picture->width(), picture->height()};
    if (picture->image().format() != QImage::Format_RGB32)
        *picture = onWhite(*picture);
    if (picture->isNull())
        return noRoom(file, size);
    ColourMatrix::grey(greyWeight).apply(*picture);
    return picture;
}

std::int64_t renderingMemory(const EditedPrint& print, const EditFields& edit) {
    const std::int64_t decode = decodingMemory(print.file, edit.ToneFlag == 1 ? Decode::Whole : Decode::Rows);
    const auto size = readPictureSize(print.file);
    if (!size)
        return decode;
    const auto bitmap = [](PictureSize pixels) { return std::int64_t{4} * pixels.width * pixels.height; };
    const PrintGeometry geometry = printGeometry(print.paper, orientationOf(*size));
    // The reduced picture, the paper, and the frame that lies over it.
    return decode + bitmap(reducedSize(*size, printPlacement(*size, geometry, edit))) + 2 * bitmap(geometry.size);
}

Result<Bitmap> renderEditedPrint(const EditedPrint& print, const EditFields& edit, PictureTimes* times) {
    Stopwatch watch(times);
    const auto size = readPictureSize(print.file);
    if (!size)
        return size.failure();
    const PrintGeometry geometry = printGeometry(print.paper, orientationOf(*size));
    const Placement placement = printPlacement(*size, geometry, edit);
    const bool shows = touches(placement, geometry.size);
    const bool stretched = !print.background && !(shows && placement.covers(geometry.size));

    // One decode serves the placed picture and the stretched one behind it.
    PictureSize wanted = shows ? reducedSize(*size, placement) : PictureSize{1, 1};
    QRect part = shows ? neededPart(wanted, placement, geometry.size) : QRect(0, 0, 1, 1);
    if (stretched) {
        if (!shows)
            wanted = geometry.size;
        wanted = {std::max(wanted.width, std::min(size->width, geometry.size.width)),
                  std::max(wanted.height, std::min(size->height, geometry.size.height))};
        part |= QRect(0, 0, wanted.width, wanted.height);
    }
    auto loaded = edit.ToneFlag == 1 ? loadGreyPart(print, wanted, part) : loadPicturePart(print.file, wanted, part);
    if (!loaded)
        return loaded.failure();
    watch.add(&PictureTimes::decode);

    Bitmap& picture = *loaded;
    if (picture.image().format() != QImage::Format_RGB32)
        picture = onWhite(picture);
    const Bitmap whole = within(picture, QRect(-part.topLeft(), QSize(wanted.width, wanted.height)));
    Bitmap paper(geometry.size.width, geometry.size.height, print.background.value_or(Qt::white));
    if (paper.isNull())
        return noRoom(print.file, geometry.size);
    if (stretched) {
        for (const QRect& bare : placement.uncovered(geometry.size))
            drawStretched(paper, whole, bare);
    }
    if (shows && wanted == reducedSize(*size, placement)) {
        coloursOf(edit).apply(picture);
        drawPlacedPart(paper, picture, part, wanted, placement);
    } else if (shows) {
        drawPlaced(paper, whole, placement, coloursOf(edit));
    }
    const auto frame = loadFrame(print.framesFolder, edit, FrameUse::Print);
    drawOver(paper, frame ? keyedFrame(*frame, geometry.size) : KeyedFrame(),
             edit.TextOn == 1 ? inkOf(captionOf(edit), geometry.size, {geometry.scaleX, geometry.scaleY})
                              : CaptionInk());
    watch.add(&PictureTimes::draw);
    return paper;
}

Result<QByteArray> renderEditedPrintToJpeg(const EditedPrint& print, const EditFields& edit, PictureTimes* times) {
    const auto paper = renderEditedPrint(print, edit, times);
    if (!paper)
        return paper.failure();
    Stopwatch watch(times);
    auto bytes = encodeJpeg(*paper, printQuality);
    watch.add(&PictureTimes::encode);
    return bytes;
}

} // namespace lumora
