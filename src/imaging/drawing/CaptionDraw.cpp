#include "imaging/drawing/CaptionDraw.h"

#include "imaging/drawing/Drawing.h"

#include <QFont>
#include <QFontMetricsF>
#include <QGlyphRun>
#include <QPainter>
#include <QRawFont>
#include <QTextLayout>
#include <QTextOption>
#include <QTransform>

#include <algorithm>
#include <cmath>
#include <optional>

namespace lumora {
namespace {

// Letters are laid out at this pixel size and scaled as outlines, so that preview and print have the same line widths
// whatever their size.
constexpr int layoutSize = 256;

// One line of text: its outlines from the left end of the base line, and its advance, in layout pixels.
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

// The outlines of the whole caption with its anchor at (0, 0), in layout pixels.
QPainterPath outlinesOf(const PictureCaption& caption) {
    QPainterPath block;
    const QString family = installedFamily(caption.family);
    if (family.isEmpty())
        return block;
    QFont font(family);
    font.setPixelSize(layoutSize);
    font.setBold(caption.bold);
    font.setItalic(caption.italic);
    font.setHintingPreference(QFont::PreferNoHinting);
    const QFontMetricsF metrics(font);
    const double em = layoutSize;
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
    block.setFillRule(Qt::WindingFill); // overlapping letters must not cut holes
    return block;
}

bool sameOutlines(const PictureCaption& a, const PictureCaption& b) {
    return a.text == b.text && a.family == b.family && a.bold == b.bold && a.italic == b.italic && a.align == b.align;
}

// Draws shadow and text; pixels outside limit are left out. anchor is the point where the shadow stands.
CaptionInk painted(const PictureCaption& caption, const QPainterPath& outlines, QPointF anchor, PaperScale scale,
                   const std::optional<QRect>& limit) {
    const double size = std::max(8, caption.emSize) * scale.x / layoutSize;
    const auto placed = [&](QPointF at) {
        QTransform place = QTransform::fromTranslate(at.x(), at.y());
        if (caption.run == PictureCaption::Run::Down)
            place.rotate(90);
        place.scale(size, size);
        return place.map(outlines);
    };
    const QPainterPath shadow = placed(anchor);
    const QPainterPath text = placed(anchor - QPointF(2 * scale.x, 2 * scale.y));
    QRect shown = (shadow.controlPointRect() | text.controlPointRect()).toAlignedRect().adjusted(-1, -1, 1, 1);
    if (limit)
        shown &= *limit;
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

} // namespace

CaptionInk inkOf(const PictureCaption& caption, PictureSize paper, PaperScale scale) {
    const QPainterPath outlines = outlinesOf(caption);
    if (outlines.isEmpty())
        return {};
    return painted(caption, outlines, {caption.x * scale.x, caption.y * scale.y}, scale,
                   QRect(0, 0, paper.width, paper.height));
}

CaptionInk CaptionInks::inkOf(const PictureCaption& caption, PictureSize paper, PaperScale scale) {
    if (!sameOutlines(caption, m_caption) || m_outlines.isEmpty()) {
        m_outlines = outlinesOf(caption);
        m_around = {};
    }
    const QPointF anchor(caption.x * scale.x, caption.y * scale.y);
    const QPoint pixel(static_cast<int>(std::floor(anchor.x())), static_cast<int>(std::floor(anchor.y())));
    const QPointF part = anchor - pixel;
    PictureCaption moved = m_caption;
    moved.x = caption.x;
    moved.y = caption.y;
    const bool asBefore = moved == caption && m_scale == scale && m_part == part;
    m_caption = caption;
    m_scale = scale;
    m_part = part;
    if (m_outlines.isEmpty())
        return {};
    if (!asBefore || m_around.pixels.isNull()) {
        const double size = std::max(8, caption.emSize) * scale.x / layoutSize;
        const QSizeF extent = m_outlines.controlPointRect().size() * size;
        if (extent.width() * extent.height() > double(paper.width) * paper.height) {
            m_around = {};
            return painted(caption, m_outlines, anchor, scale, QRect(0, 0, paper.width, paper.height));
        }
        m_around = painted(caption, m_outlines, part, scale, std::nullopt);
    }
    return {m_around.pixels, m_around.at + pixel};
}

void drawInk(Bitmap& paper, const CaptionInk& ink) {
    if (!paper.isNull() && !ink.pixels.isNull())
        QPainter(&paper.image()).drawImage(ink.at, ink.pixels.image());
}

} // namespace lumora
