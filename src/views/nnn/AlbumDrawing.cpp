#include "views/nnn/AlbumDrawing.h"

#include <QPainter>
#include <QPainterPath>

#include <algorithm>

namespace lumora {

namespace {

constexpr QColor brownLeather{0x7A, 0x4E, 0x33};
constexpr QColor creamLeather{0xEF, 0xE4, 0xCC};
constexpr QColor inkCover{0x2F, 0x5C, 0x66};

void shadow(QPainter& painter, const QRectF& box) {
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(0, 0, 0, 30));
    const double away = box.height() * 0.03;
    painter.drawRoundedRect(box.translated(away, away), away, away);
}

void drawCover(QPainter& painter, const QRectF& book, QColor colour) {
    shadow(painter, book);
    // The pages show below and at the fore edge.
    const double page = book.height() * 0.035;
    painter.setPen(QPen(Theme::Colour::Line, 1));
    painter.setBrush(Qt::white);
    painter.drawRect(book.adjusted(book.width() * 0.05, book.height() * 0.05, 0, 0));
    const QRectF cover = book.adjusted(0, 0, -page, -page);
    QLinearGradient leather(cover.topLeft(), cover.bottomRight());
    leather.setColorAt(0, colour.lighter(112));
    leather.setColorAt(1, colour.darker(108));
    painter.setPen(QPen(colour.darker(130), 1));
    painter.setBrush(leather);
    painter.drawRoundedRect(cover, page, page);
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(0, 0, 0, 38));
    painter.drawRect(QRectF(cover.left() + cover.width() * 0.075, cover.top(), cover.width() * 0.014, cover.height()));
    painter.setPen(QPen(QColor(255, 255, 255, 70), 1, Qt::DashLine));
    painter.setBrush(Qt::NoBrush);
    painter.drawRoundedRect(cover.adjusted(cover.width() * 0.12, page * 1.6, -page * 1.6, -page * 1.6), page, page);
}

void drawBook(QPainter& painter, const QRectF& place, AlbumDrawing what, double share, double wireWidth) {
    const QRectF book = fitted(place, {4, 3}, share);
    const bool photo = what == AlbumDrawing::PhotoBook || what == AlbumDrawing::LargePhotoBook;
    drawCover(painter, book, photo ? Theme::Colour::Ink : inkCover);
    QRectF picture = fitted(book, {3, 2}, photo ? 0.78 : 0.5);
    picture.translate(book.width() * 0.03, 0);
    painter.fillRect(picture.adjusted(-2, -2, 2, 2), Qt::white);
    drawSamplePicture(painter, picture);
    if (what != AlbumDrawing::SpiralBook)
        return;
    painter.setBrush(Qt::NoBrush);
    for (int ring = 0; ring < 8; ++ring) {
        const double y = book.top() + book.height() * (ring + 0.7) / 8.4;
        const QRectF wire(book.left() - book.width() * 0.05, y, book.width() * 0.12, book.height() * 0.05);
        painter.setPen(QPen(Theme::Colour::Edge, wireWidth, Qt::SolidLine, Qt::RoundCap));
        painter.drawArc(wire, 0, 16 * 360);
    }
}

void drawSpread(QPainter& painter, const QRectF& place, const QString& words) {
    const QString size = withoutIsolation(words);
    const double high = std::max(1.0, size.section(u'/', 0, 0).toDouble());
    const double wide = std::max(1.0, size.section(u'/', 1, 1).toDouble());
    // All at one scale, the largest being 40 by 80.
    const QRectF open = fitted(place, {80, 40}, 0.98);
    QRectF spread(0, 0, open.width() * wide / 80, open.height() * high / 40);
    spread.moveCenter(place.center());
    shadow(painter, spread);
    painter.fillRect(spread, Qt::white);
    drawSamplePicture(painter, spread.adjusted(spread.width() * 0.04, spread.height() * 0.08, -spread.width() * 0.04,
                                               -spread.height() * 0.08));
    // The fold.
    const double fold = spread.width() * 0.06;
    QLinearGradient shade(spread.center().x() - fold, 0, spread.center().x() + fold, 0);
    shade.setColorAt(0, QColor(0, 0, 0, 0));
    shade.setColorAt(0.5, QColor(0, 0, 0, 80));
    shade.setColorAt(1, QColor(0, 0, 0, 0));
    painter.fillRect(QRectF(spread.center().x() - fold, spread.top(), fold * 2, spread.height()), shade);
    drawThinLine(painter, spread);
}

void drawPaper(QPainter& painter, const QRectF& paper, PaperFinish finish) {
    shadow(painter, paper);
    drawSamplePrint(painter, paper, finish);
    drawThinLine(painter, paper);
}

void drawExtra(QPainter& painter, const QRectF& box, AlbumDrawing what, const Theme& theme) {
    if (what == AlbumDrawing::Nothing) {
        const double radius = box.height() * 0.32;
        painter.setPen(QPen(Theme::Colour::Edge, theme.size(Space::Tight), Qt::SolidLine, Qt::RoundCap));
        painter.setBrush(Qt::NoBrush);
        painter.drawEllipse(box.center(), radius, radius);
        painter.drawLine(box.center() + QPointF(-radius * 0.7, radius * 0.7),
                         box.center() + QPointF(radius * 0.7, -radius * 0.7));
        return;
    }
    shadow(painter, box);
    if (what == AlbumDrawing::Canvas) {
        // Stretched over its frame: the sides show, darker.
        const double side = box.height() * 0.07;
        const QRectF front = box.adjusted(0, 0, -side, -side);
        QPolygonF right{front.topRight(), box.topRight() + QPointF(0, side), box.bottomRight(), front.bottomRight()};
        QPolygonF below{front.bottomLeft(), box.bottomLeft() + QPointF(side, 0), box.bottomRight(),
                        front.bottomRight()};
        painter.setPen(Qt::NoPen);
        painter.setBrush(QColor(0x4A, 0x5F, 0x5C));
        painter.drawPolygon(right);
        painter.setBrush(QColor(0x39, 0x4B, 0x49));
        painter.drawPolygon(below);
        drawSamplePicture(painter, front);
        drawThinLine(painter, front);
    } else if (what == AlbumDrawing::Plate) {
        const double corner = box.height() * 0.12;
        QPainterPath plate;
        plate.addRoundedRect(box, corner, corner);
        painter.save();
        painter.setClipPath(plate);
        drawSamplePicture(painter, box);
        painter.restore();
        painter.setPen(QPen(QColor(0xB9, 0xBE, 0xC4), theme.size(Space::Tight)));
        painter.setBrush(Qt::NoBrush);
        painter.drawRoundedRect(box, corner, corner);
    } else {
        drawSamplePicture(painter, box);
        painter.fillRect(box, QColor(255, 255, 255, 45));
        painter.setPen(QPen(QColor(255, 255, 255, 180), theme.thick()));
        painter.setBrush(Qt::NoBrush);
        painter.drawRect(box.adjusted(theme.thick(), theme.thick(), -theme.thick(), -theme.thick()));
        // The four bolts that hold it off the wall.
        const double in = box.height() * 0.14;
        for (const QPointF& at : {box.topLeft() + QPointF(in, in), box.topRight() + QPointF(-in, in),
                                  box.bottomLeft() + QPointF(in, -in), box.bottomRight() + QPointF(-in, -in)}) {
            painter.setPen(QPen(Theme::Colour::Edge, 1));
            painter.setBrush(QColor(0xDD, 0xE2, 0xE6));
            painter.drawEllipse(at, theme.size(Space::Tight), theme.size(Space::Tight));
        }
        drawThinLine(painter, box);
    }
}

void draw(QPainter& painter, const QRectF& place, const QString& words, AlbumDrawing what, const Theme& theme) {
    using enum AlbumDrawing;
    switch (what) {
    case SmallBook:
        return drawBook(painter, place, what, 0.62, theme.thick());
    case SpiralBook:
    case Book:
    case PhotoBook:
        return drawBook(painter, place, what, 0.82, theme.thick());
    case LargeBook:
    case LargePhotoBook:
        return drawBook(painter, place, what, 1.0, theme.thick());
    case Spread:
        return drawSpread(painter, place, words);
    case Brown:
        return drawCover(painter, fitted(place, {4, 3}, 0.95), brownLeather);
    case Cream:
        return drawCover(painter, fitted(place, {4, 3}, 0.95), creamLeather);
    case Glossy:
        return drawPaper(painter, fitted(place, {3, 2}, 0.95), PaperFinish::Glossy);
    case Matte:
        return drawPaper(painter, fitted(place, {3, 2}, 0.95), PaperFinish::Matte);
    case Silk:
        return drawPaper(painter, fitted(place, {3, 2}, 0.95), PaperFinish::Silk);
    case Nothing:
    case Canvas:
    case Plate:
    case Perspex:
        return drawExtra(painter, fitted(place, {3, 2}, 0.92), what, theme);
    }
}

} // namespace

DrawingCard* makeAlbumCard(const Theme& theme, QWidget* parent, AlbumDrawing what, QSizeF size) {
    return new DrawingCard(
        theme, parent,
        [&theme, what](QPainter& painter, const QRectF& place, const QString& words) {
            draw(painter, place, words, what, theme);
        },
        size, what == AlbumDrawing::Spread ? DrawingCard::Words::Size : DrawingCard::Words::Strong);
}

} // namespace lumora
