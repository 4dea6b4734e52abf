#include "views/kit/Painting.h"

#include <QPainterPath>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

QRectF fitted(const QRectF& place, QSizeF shape, double share) {
    QRectF box(QPointF(), shape.scaled(place.size() * share, Qt::KeepAspectRatio));
    box.moveCenter(place.center());
    return box;
}

void drawImage(QPainter& painter, const QRectF& place, const QImage& image) {
    painter.drawImage(fitted(place, image.size()), image);
}

void drawIcon(QPainter& painter, QPointF centre, const QPixmap& icon) {
    const QSizeF size = icon.deviceIndependentSize();
    painter.drawPixmap(centre - QPointF(size.width() / 2, size.height() / 2), icon);
}

QRectF drawCard(QPainter& painter, const QRect& place, QColor edge, QColor fill, double thick, double corner,
                Qt::PenStyle style) {
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    const QRectF card = QRectF(place).adjusted(thick / 2, thick / 2, -thick / 2, -thick / 2);
    painter.setPen(QPen(edge, thick, style));
    painter.setBrush(fill);
    painter.drawRoundedRect(card, corner, corner);
    return card;
}

void drawMark(QPainter& painter, const Theme& theme, const QRectF& card, const Mark& mark) {
    const double radius = theme.px(mark.radius);
    const double in = radius + theme.px(mark.inset);
    const bool rightToLeft = painter.layoutDirection() == Qt::RightToLeft;
    const QPointF at(rightToLeft ? card.left() + in : card.right() - in, card.top() + in);
    painter.setPen(mark.rim > 0 ? QPen(Qt::white, theme.px(mark.rim)) : QPen(Qt::NoPen));
    painter.setBrush(mark.disc);
    painter.drawEllipse(at, radius, radius);
    drawIcon(painter, at, theme.icon(mark.icon, theme.px(mark.radius * 1.36), mark.ink));
}

QString withoutIsolation(QString text) {
    return text.remove(QChar(0x2066)).remove(QChar(0x2069));
}

void drawThinLine(QPainter& painter, const QRectF& box) {
    painter.setPen(QPen(Theme::Colour::Edge, 1));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(box);
}

void drawSamplePicture(QPainter& painter, const QRectF& box) {
    painter.save();
    painter.setPen(Qt::NoPen);
    painter.setClipRect(box, Qt::IntersectClip);
    QLinearGradient sky(box.topLeft(), box.bottomLeft());
    sky.setColorAt(0, QColor(0xBF, 0xDD, 0xE6));
    sky.setColorAt(1, QColor(0xF7, 0xE9, 0xCF));
    painter.fillRect(box, sky);
    painter.setBrush(Theme::Colour::Sun);
    const double unit = std::min(box.width(), box.height());
    painter.drawEllipse(QPointF(box.left() + box.width() * 0.30, box.top() + box.height() * 0.34), unit * 0.12,
                        unit * 0.12);
    const auto hill = [&](QColor colour, double a, double b, double c) {
        QPainterPath path(box.bottomLeft());
        path.lineTo(box.left(), box.top() + box.height() * a);
        path.quadTo(box.left() + box.width() * 0.45, box.top() + box.height() * b, box.right(),
                    box.top() + box.height() * c);
        path.lineTo(box.bottomRight());
        path.closeSubpath();
        painter.setBrush(colour);
        painter.drawPath(path);
    };
    hill(QColor(0x6F, 0xA6, 0xA0), 0.72, 0.34, 0.60);
    hill(QColor(0x2F, 0x7A, 0x77), 0.66, 0.88, 0.74);
    painter.restore();
}

void drawSamplePrint(QPainter& painter, const QRectF& paper, PaperFinish finish) {
    drawSamplePicture(painter, paper);
    painter.save();
    painter.setClipRect(paper, Qt::IntersectClip);
    switch (finish) {
    case PaperFinish::Matte:
        painter.fillRect(paper, QColor(255, 255, 255, 70));
        break;
    case PaperFinish::Glossy: {
        QPainterPath shine(paper.topLeft() + QPointF(paper.width() * 0.52, 0));
        shine.lineTo(paper.left() + paper.width() * 0.80, paper.top());
        shine.lineTo(paper.left() + paper.width() * 0.46, paper.bottom());
        shine.lineTo(paper.left() + paper.width() * 0.18, paper.bottom());
        shine.closeSubpath();
        painter.fillPath(shine, QColor(255, 255, 255, 110));
        break;
    }
    case PaperFinish::Silk: {
        // Woven: two sets of fine lines across one another.
        painter.setPen(QPen(QColor(255, 255, 255, 95), 1));
        const double pace = paper.height() / 28;
        for (double at = paper.left() - paper.height(); at < paper.right(); at += pace) {
            painter.drawLine(QPointF(at, paper.top()), QPointF(at + paper.height(), paper.bottom()));
            painter.drawLine(QPointF(at + paper.height(), paper.top()), QPointF(at, paper.bottom()));
        }
        break;
    }
    }
    painter.restore();
}

void drawBorderSample(QPainter& painter, const QRectF& room, const QString& code) {
    const QRectF paper = fitted(room, {3, 2});
    const double unit = paper.height();
    painter.save();
    painter.fillRect(paper, Qt::white);
    QRectF picture = paper;
    const auto inset = [&](double share) {
        picture = paper.adjusted(unit * share, unit * share, -unit * share, -unit * share);
    };
    const auto frame = [&](double share, QColor colour) {
        painter.fillRect(paper, colour);
        inset(share);
    };
    const QColor black(0x22, 0x22, 0x22);
    if (code == u"WB"_s) {
        inset(0.08);
    } else if (code == u"B7"_s) {
        frame(0.07, black);
    } else if (code == u"BB"_s) {
        frame(0.11, black);
    } else if (code == u"BB1"_s || code == u"BB2"_s) {
        inset(code == u"BB1"_s ? 0.10 : 0.14);
        const double line = unit * (code == u"BB1"_s ? 0.015 : 0.035);
        painter.fillRect(picture.adjusted(-line, -line, line, line), black);
    } else if (code == u"CA1"_s || code == u"CA9"_s) {
        frame(0.10, code == u"CA1"_s ? QColor(0xF0, 0xE4, 0xCB) : QColor(0x8B, 0x5E, 0x3C));
    } else if (code == u"BL1"_s) {
        frame(0.08, QColor(0x2F, 0x5F, 0xA8));
    } else if (code == u"FA9"_s) {
        inset(0.10);
        for (int i = 0; i < 3; ++i) {
            const double out = unit * (0.02 + 0.03 * i);
            painter.setPen(QPen(QColor(0xB8, 0x8A, 0x3A), unit * 0.012));
            painter.setBrush(Qt::NoBrush);
            painter.drawRect(picture.adjusted(-out, -out, out, out));
        }
    }
    drawSamplePicture(painter, picture);
    drawThinLine(painter, paper);
    painter.restore();
}

} // namespace lumora
