#include "views/nnn/PaperBesideHand.h"

#include "views/kit/Painting.h"

#include <QPainterPath>
#include <QTransform>

#include <algorithm>
#include <array>

namespace lumora {

namespace {

// In centimetres, of a grown person: the back of a hand, the thumb towards the left.
constexpr QSizeF handSize{9.6, 18.5};

QPainterPath handPath() {
    const auto rounded = [](const QRectF& box, double radius) {
        QPainterPath path;
        path.addRoundedRect(box, radius, radius);
        return path;
    };
    QPainterPath palm(QPointF(2.3, 9.5));
    palm.lineTo(9.5, 9.5);
    palm.cubicTo(9.7, 13.5, 9.0, 15.5, 8.3, 18.5);
    palm.lineTo(3.9, 18.5);
    palm.cubicTo(3.6, 16.5, 2.3, 15.0, 2.3, 12.5);
    palm.closeSubpath();
    const QTransform tilt = QTransform().translate(3.9, 16).rotate(-31);
    QPainterPath hand = palm.united(tilt.map(rounded({-1.1, -8.1, 2.1, 7.9}, 1.05)));
    constexpr std::array<QRectF, 4> fingers{QRectF(2.3, 1.5, 1.7, 10), QRectF(4.15, 0, 1.75, 11),
                                            QRectF(6.05, 0.9, 1.7, 11), QRectF(7.9, 3.7, 1.6, 8)};
    for (const QRectF& finger : fingers)
        hand = hand.united(rounded(finger, finger.width() / 2));
    return hand;
}

} // namespace

void drawPaperBesideHand(QPainter& painter, const QRectF& room, QSizeF paper, QSizeF largest) {
    constexpr double apart = 1.6;
    const double wide = apart + handSize.width();
    const double high = std::max(largest.height(), handSize.height());
    const double scale = 0.97 * std::min(room.width() / (largest.width() + wide), room.height() / high);
    const double ground = room.center().y() + high * scale / 2;
    const double left = room.center().x() - (paper.width() + wide) * scale / 2;
    const QSizeF size = paper * scale;
    const QRectF box(QPointF(left, ground - size.height()), size);
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(0, 0, 0, 28));
    painter.drawRect(box.translated(3, 3));
    drawSamplePicture(painter, box);
    drawThinLine(painter, box);
    painter.save();
    painter.translate(box.right() + apart * scale, ground - handSize.height() * scale);
    painter.scale(scale, scale);
    painter.setPen(QPen(Theme::Colour::Edge, 1 / scale));
    painter.setBrush(Theme::Colour::Sunken);
    static const QPainterPath hand = handPath();
    painter.drawPath(hand);
    painter.restore();
}

} // namespace lumora
