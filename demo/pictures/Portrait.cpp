#include "Portrait.h"

#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>
#include <QRadialGradient>

#include <algorithm>
#include <cstdint>

namespace lumora::demo {
namespace {

// On a sheet of 900 by 1200.
constexpr double sheetWidth = 900;
constexpr double sheetHeight = 1200;

QPainterPath closed(std::initializer_list<QPointF> curve) {
    const auto* at = curve.begin();
    QPainterPath path(*at++);
    for (; curve.end() - at >= 3; at += 3)
        path.cubicTo(at[0], at[1], at[2]);
    path.closeSubpath();
    return path;
}

void background(QPainter& painter) {
    QLinearGradient wall(0, 0, sheetWidth, sheetHeight);
    wall.setColorAt(0, QColor(84, 104, 118));
    wall.setColorAt(1, QColor(38, 48, 60));
    painter.fillRect(QRectF(0, 0, sheetWidth, sheetHeight), wall);
    // Lights of the party behind, out of focus.
    constexpr std::array<std::array<double, 3>, 8> lights = {{{90, 170, 60},
                                                              {210, 330, 34},
                                                              {760, 130, 74},
                                                              {850, 360, 48},
                                                              {60, 560, 42},
                                                              {660, 60, 30},
                                                              {330, 70, 46},
                                                              {840, 640, 36}}};
    for (std::size_t i = 0; i < lights.size(); ++i) {
        const auto [x, y, radius] = lights[i];
        QRadialGradient glow(QPointF(x, y), radius);
        const QColor colour = i % 2 == 0 ? QColor(250, 206, 130) : QColor(244, 160, 150);
        glow.setColorAt(0, QColor(colour.red(), colour.green(), colour.blue(), 150));
        glow.setColorAt(0.85, QColor(colour.red(), colour.green(), colour.blue(), 110));
        glow.setColorAt(1, QColor(colour.red(), colour.green(), colour.blue(), 0));
        painter.fillRect(QRectF(x - radius, y - radius, 2 * radius, 2 * radius), glow);
    }
}

void body(QPainter& painter) {
    painter.fillPath(closed({{210, 560},
                             {130, 420},
                             {170, 150},
                             {450, 140},
                             {730, 150},
                             {770, 420},
                             {690, 560},
                             {760, 800},
                             {740, 930},
                             {690, 960},
                             {560, 1000},
                             {340, 1000},
                             {210, 960},
                             {160, 930},
                             {140, 800},
                             {210, 560}}),
                     QColor(72, 44, 28));
    QLinearGradient cloth(0, 960, 0, sheetHeight);
    cloth.setColorAt(0, QColor(58, 128, 136));
    cloth.setColorAt(1, QColor(34, 86, 98));
    painter.fillPath(closed({{60, 1210},
                             {80, 1020},
                             {230, 970},
                             {360, 930},
                             {420, 1020},
                             {480, 1020},
                             {540, 930},
                             {670, 970},
                             {820, 1020},
                             {840, 1210},
                             {600, 1210},
                             {300, 1210},
                             {60, 1210}}),
                     cloth);
    painter.fillPath(closed({{370, 800},
                             {372, 880},
                             {360, 930},
                             {350, 945},
                             {410, 1035},
                             {490, 1035},
                             {550, 945},
                             {540, 930},
                             {528, 880},
                             {530, 800},
                             {480, 840},
                             {420, 840},
                             {370, 800}}),
                     QColor(214, 158, 128));
}

void face(QPainter& painter) {
    QRadialGradient skin(QPointF(430, 500), 420);
    skin.setColorAt(0, QColor(244, 202, 174));
    skin.setColorAt(0.6, QColor(230, 180, 150));
    skin.setColorAt(1, QColor(196, 140, 112));
    for (const double x : {236.0, 664.0}) {
        painter.setBrush(QColor(216, 160, 132));
        painter.drawEllipse(QPointF(x, 545), 30, 58);
    }
    painter.fillPath(closed({{450, 240},
                             {610, 240},
                             {672, 360},
                             {668, 520},
                             {664, 680},
                             {580, 860},
                             {450, 864},
                             {320, 860},
                             {236, 680},
                             {232, 520},
                             {228, 360},
                             {290, 240},
                             {450, 240}}),
                     skin);
    // Hair over the forehead, cheeks, nose, mouth.
    painter.fillPath(closed({{216, 500},
                             {210, 280},
                             {330, 180},
                             {470, 184},
                             {620, 180},
                             {700, 300},
                             {684, 500},
                             {668, 400},
                             {620, 340},
                             {560, 318},
                             {460, 372},
                             {330, 360},
                             {290, 350},
                             {246, 390},
                             {230, 440},
                             {216, 500}}),
                     QColor(88, 54, 34));
    for (const double x : {310.0, 590.0}) {
        QRadialGradient blush(QPointF(x, 640), 80);
        blush.setColorAt(0, QColor(232, 132, 118, 110));
        blush.setColorAt(1, QColor(232, 132, 118, 0));
        painter.fillRect(QRectF(x - 80, 560, 160, 160), blush);
    }
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(QColor(178, 118, 92), 7, Qt::SolidLine, Qt::RoundCap));
    QPainterPath nose(QPointF(446, 520));
    nose.cubicTo(432, 590, 404, 628, 424, 648);
    nose.cubicTo(440, 664, 470, 660, 482, 646);
    painter.drawPath(nose);
    painter.setPen(Qt::NoPen);
    painter.fillPath(closed({{352, 722}, {410, 740}, {490, 740}, {548, 722}, {524, 806}, {376, 806}, {352, 722}}),
                     QColor(150, 52, 52));
    painter.fillPath(closed({{370, 730}, {420, 744}, {480, 744}, {530, 730}, {512, 762}, {388, 762}, {370, 730}}),
                     QColor(252, 248, 242));
}

void eyes(QPainter& painter) {
    for (const QPointF& share : redPupils) {
        const QPointF at(share.x() * sheetWidth, share.y() * sheetHeight);
        const double radius = pupilRadius * sheetWidth;
        const QPainterPath lid =
            closed({at + QPointF(-62, 4), at + QPointF(-34, -36), at + QPointF(30, -38), at + QPointF(62, 2),
                    at + QPointF(32, 30), at + QPointF(-32, 32), at + QPointF(-62, 4)});
        painter.save();
        painter.setClipPath(lid);
        painter.fillPath(lid, QColor(248, 246, 242));
        painter.setPen(Qt::NoPen);
        QRadialGradient iris(at, radius * 2.5);
        iris.setColorAt(0.35, QColor(104, 72, 44));
        iris.setColorAt(1, QColor(58, 40, 26));
        painter.setBrush(iris);
        painter.drawEllipse(at, radius * 2.5, radius * 2.5);
        QRadialGradient red(at, radius);
        red.setColorAt(0, QColor(236, 44, 48));
        red.setColorAt(0.8, QColor(206, 26, 34));
        red.setColorAt(1, QColor(150, 18, 26));
        painter.setBrush(red);
        painter.drawEllipse(at, radius, radius);
        painter.setBrush(QColor(255, 252, 250));
        painter.drawEllipse(at + QPointF(-radius * 0.42, -radius * 0.46), radius * 0.2, radius * 0.2);
        painter.restore();
        painter.setBrush(Qt::NoBrush);
        painter.setPen(QPen(QColor(66, 40, 28), 6, Qt::SolidLine, Qt::RoundCap));
        QPainterPath lash(at + QPointF(-64, 6));
        lash.cubicTo(at + QPointF(-34, -38), at + QPointF(30, -40), at + QPointF(64, 2));
        painter.drawPath(lash);
        painter.setPen(QPen(QColor(78, 48, 30), 13, Qt::SolidLine, Qt::RoundCap));
        QPainterPath brow(at + QPointF(-66, -62));
        brow.cubicTo(at + QPointF(-30, -88), at + QPointF(30, -88), at + QPointF(66, -60));
        painter.drawPath(brow);
        painter.setPen(Qt::NoPen);
    }
}

void grain(QImage& image) {
    std::uint32_t state = 77;
    for (int y = 0; y < image.height(); ++y) {
        auto* row = reinterpret_cast<QRgb*>(image.scanLine(y));
        for (int x = 0; x < image.width(); ++x) {
            state ^= state << 13;
            state ^= state >> 17;
            state ^= state << 5;
            const int noise = static_cast<int>(state & 7) + static_cast<int>((state >> 3) & 7) - 7;
            const auto with = [noise](int channel) { return std::clamp(channel + noise, 0, 255); };
            row[x] = qRgb(with(qRed(row[x])), with(qGreen(row[x])), with(qBlue(row[x])));
        }
    }
}

} // namespace

Bitmap portrait(int width) {
    Bitmap picture(width, width * 4 / 3, Qt::black);
    {
        QPainter painter(&picture.image());
        painter.setRenderHint(QPainter::Antialiasing);
        painter.scale(width / sheetWidth, width / sheetWidth);
        painter.setPen(Qt::NoPen);
        background(painter);
        body(painter);
        face(painter);
        eyes(painter);
    }
    grain(picture.image());
    return picture;
}

} // namespace lumora::demo
