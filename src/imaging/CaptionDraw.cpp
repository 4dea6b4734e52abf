#include "imaging/CaptionDraw.h"

#include "imaging/Drawing.h"

#include <QFont>
#include <QFontMetricsF>
#include <QGlyphRun>
#include <QPainter>
#include <QPainterPath>
#include <QRawFont>
#include <QTextLayout>
#include <QTextOption>
#include <QTransform>

#include <algorithm>

namespace lumora {
namespace {

// Letters are laid out once at this size and scaled as outlines, so that preview and print break into the same places
// to the fraction of a pixel, whatever their size.
constexpr int layoutSize = 256;

// The line's outlines from its left end on the base line, and its advance.
struct OutlinedLine {
    QPainterPath path;
    double advance = 0;
};

OutlinedLine outlined(const QString& text, const QFont& font) {
    QTextLayout layout(text, font);
    QTextOption option;
    option.setTextDirection(Qt::LeftToRight);
    option.setWrapMode(QTextOption::NoWrap);
    layout.setTextOption(option);
    layout.beginLayout();
    const QTextLine line = layout.createLine();
    layout.endLayout();

    OutlinedLine result;
    if (!line.isValid())
        return result;
    result.advance = line.horizontalAdvance();
    for (const QGlyphRun& run : line.glyphRuns()) {
        const QRawFont face = run.rawFont();
        const auto glyphs = run.glyphIndexes();
        const auto places = run.positions();
        for (qsizetype i = 0; i < glyphs.size(); ++i)
            result.path.addPath(face.pathForGlyph(glyphs[i]).translated(places[i].x(), places[i].y() - line.ascent()));
    }
    return result;
}

} // namespace

CaptionInk inkOf(const PictureCaption& caption, PictureSize paper, PaperScale scale) {
    const QString family = installedFamily(caption.family);
    if (family.isEmpty() || caption.text.isEmpty())
        return {};
    QFont font(family);
    font.setPixelSize(layoutSize);
    font.setBold(caption.bold);
    font.setItalic(caption.italic);
    font.setHintingPreference(QFont::PreferNoHinting);
    const QFontMetricsF metrics(font);

    const double em = layoutSize;
    QPainterPath block;
    block.setFillRule(Qt::WindingFill); // letters that overlap must not cut holes
    double top = 0;
    for (QString text : caption.text.split(u'\n')) {
        text.remove(u'\r');
        const OutlinedLine line = outlined(text, font);
        const double length = line.advance + em / 3;
        const double left = caption.align == PictureCaption::Align::Far      ? -length
                            : caption.align == PictureCaption::Align::Centre ? -length / 2
                                                                             : 0.0;
        block.addPath(line.path.translated(left + em / 6, top + metrics.ascent()));
        top += metrics.lineSpacing();
    }
    block.setFillRule(Qt::WindingFill);

    const double size = std::max(8, caption.emSize) * scale.x / em;
    const auto placed = [&](double x, double y) {
        QTransform place = QTransform::fromTranslate(x * scale.x, y * scale.y);
        if (caption.run == PictureCaption::Run::Down)
            place.rotate(90);
        place.scale(size, size);
        return place.map(block);
    };
    const QPainterPath shadow = placed(caption.x, caption.y);
    const QPainterPath text = placed(caption.x - 2, caption.y - 2);
    const QRect shown = (shadow.controlPointRect() | text.controlPointRect()).toAlignedRect().adjusted(-1, -1, 1, 1) &
                        QRect(0, 0, paper.width, paper.height);
    CaptionInk ink{Bitmap(shown.width(), shown.height(), Qt::transparent), shown.topLeft()};
    if (ink.pixels.isNull())
        return {};
    QPainter painter(&ink.pixels.image());
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(-shown.topLeft());
    painter.fillPath(shadow, QColor(40, 40, 40, 180));
    painter.fillPath(text, caption.colour);
    return ink;
}

void drawInk(Bitmap& paper, const CaptionInk& ink) {
    if (!paper.isNull() && !ink.pixels.isNull())
        QPainter(&paper.image()).drawImage(ink.at, ink.pixels.image());
}

} // namespace lumora
