#include "FrameArt.h"

#include <QFont>
#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>
#include <QPolygonF>
#include <QRadialGradient>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>

namespace lumora::demo {

using namespace Qt::StringLiterals;

namespace {

constexpr double w = sheetWidth;
constexpr double h = sheetHeight;

// The darkest that is solid: three channels that add up to 24, where 11 times their sum reaches full.
constexpr QColor solidBlack{8, 8, 8};
constexpr int leastSolidSum = 24;

// The same at each run.
class Random {
public:
    explicit Random(std::uint32_t seed)
        : m_state(seed * 2654435761U | 1U) {}
    double within(double low, double high) {
        m_state ^= m_state << 13;
        m_state ^= m_state >> 17;
        m_state ^= m_state << 5;
        return low + (high - low) * (m_state / 4294967296.0);
    }
    template <class Values>
    auto oneOf(const Values& values) {
        return values[static_cast<std::size_t>(within(0, static_cast<double>(std::size(values)) - 0.001))];
    }

private:
    std::uint32_t m_state;
};

// The sheet less an opening.
QPainterPath around(const QPainterPath& opening) {
    QPainterPath sheet;
    sheet.addRect(0, 0, w, h);
    return sheet.subtracted(opening);
}

QPainterPath opening(double left, double top, double right, double bottom, double corner = 0) {
    QPainterPath path;
    path.addRoundedRect(QRectF(QPointF(left, top), QPointF(w - right, h - bottom)), corner, corner);
    return path;
}

void plainBorder(QPainter& painter, QColor colour) {
    painter.fillPath(around(opening(62, 62, 62, 62)), colour);
}
void whiteBorder(QPainter& painter) {
    plainBorder(painter, Qt::white);
}
void blackBorder(QPainter& painter) {
    plainBorder(painter, solidBlack);
}

void roundedMat(QPainter& painter) {
    painter.fillPath(around(opening(84, 84, 84, 84, 90)), QColor(252, 249, 242));
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(QColor(206, 192, 166), 4));
    painter.drawPath(opening(68, 68, 68, 68, 100));
}

QLinearGradient gold(QPointF from, QPointF to) {
    QLinearGradient gradient(from, to);
    for (int i = 0; i <= 8; ++i)
        gradient.setColorAt(i / 8.0, i % 2 == 0 ? QColor(166, 120, 34) : QColor(247, 217, 128));
    return gradient;
}

void goldLine(QPainter& painter) {
    painter.setBrush(Qt::NoBrush);
    const QBrush brush = gold({0, 0}, {w, h});
    painter.setPen(QPen(brush, 16));
    painter.drawPath(opening(46, 46, 46, 46));
    painter.setPen(QPen(brush, 5));
    painter.drawPath(opening(70, 70, 70, 70));
    for (const double x : {70.0, w - 70}) {
        for (const double y : {70.0, h - 70}) {
            const double inX = x < w / 2 ? 1 : -1;
            const double inY = y < h / 2 ? 1 : -1;
            QPainterPath curl;
            curl.moveTo(x, y + inY * 150);
            curl.cubicTo(x + inX * 70, y + inY * 130, x + inX * 20, y + inY * 20, x + inX * 34, y + inY * 34);
            curl.cubicTo(x + inX * 20, y + inY * 20, x + inX * 130, y + inY * 70, x + inX * 150, y);
            painter.setPen(QPen(brush, 6, Qt::SolidLine, Qt::RoundCap));
            painter.drawPath(curl);
            painter.setPen(Qt::NoPen);
            painter.setBrush(brush);
            painter.drawEllipse(QPointF(x + inX * 52, y + inY * 52), 15, 15);
            painter.drawEllipse(QPointF(x + inX * 84, y + inY * 30), 7, 7);
            painter.drawEllipse(QPointF(x + inX * 30, y + inY * 84), 7, 7);
            painter.setBrush(Qt::NoBrush);
        }
    }
}

// One plank along the x axis, length by width, its grain running along it.
void plank(QPainter& painter, double length, double width, Random& random) {
    QLinearGradient across(0, 0, 0, width);
    across.setColorAt(0, QColor(178, 120, 68));
    across.setColorAt(0.12, QColor(150, 96, 50));
    across.setColorAt(0.85, QColor(134, 82, 42));
    across.setColorAt(1, QColor(92, 54, 26));
    painter.fillRect(QRectF(0, 0, length, width), across);
    for (int i = 0; i < 70; ++i) {
        const double y = random.within(0, width);
        const double wave = random.within(2, 9);
        QPainterPath grain(QPointF(0, y));
        for (double x = 0; x < length; x += 60)
            grain.quadTo(x + 30, y + random.within(-wave, wave), x + 60, y + random.within(-2, 2));
        const bool light = i % 3 == 0;
        painter.setPen(QPen(light ? QColor(206, 150, 96, 90) : QColor(72, 40, 18, 80), random.within(1, 3.4)));
        painter.drawPath(grain);
    }
    for (int knot = 0; knot < 2; ++knot) {
        const QPointF at(random.within(0.2, 0.8) * length, random.within(0.3, 0.7) * width);
        for (int ring = 4; ring > 0; --ring) {
            painter.setPen(QPen(QColor(70, 38, 16, 150), 2));
            painter.setBrush(QColor(96, 56, 28, 70));
            painter.drawEllipse(at, ring * 7.0, ring * 3.6);
        }
    }
}

void wood(QPainter& painter) {
    constexpr double width = 104;
    Random random(5);
    const std::array<double, 4> lengths = {w, h, w, h};
    for (std::size_t side = 0; side < 4; ++side) {
        painter.save();
        painter.translate(w / 2, h / 2);
        painter.rotate(90.0 * static_cast<double>(side));
        const double length = lengths[side];
        painter.translate(-length / 2, -(side % 2 == 0 ? h : w) / 2);
        QPainterPath mitred;
        mitred.addPolygon(
            QPolygonF({QPointF(0, 0), QPointF(length, 0), QPointF(length - width, width), QPointF(width, width)}));
        painter.setClipPath(mitred);
        plank(painter, length, width, random);
        painter.restore();
    }
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(QColor(62, 34, 14), 3));
    for (const double x : {0.0, w}) {
        for (const double y : {0.0, h})
            painter.drawLine(QPointF(x, y), QPointF(x < w / 2 ? width : w - width, y < h / 2 ? width : h - width));
    }
    painter.setPen(QPen(QColor(226, 178, 118), 5));
    painter.drawPath(opening(width, width, width, width));
}

void filmStrip(QPainter& painter) {
    constexpr double band = 128;
    painter.fillPath(around(opening(34, band, 34, band, 18)), QColor(22, 20, 19));
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(240, 236, 226));
    constexpr int holes = 14;
    for (int i = 0; i < holes; ++i) {
        const double x = (i + 0.5) * w / holes;
        for (const double y : {66.0, h - 66})
            painter.drawRoundedRect(QRectF(x - 24, y - 30, 48, 60), 12, 12);
    }
    QFont font;
    font.setPixelSize(22);
    font.setBold(true);
    painter.setFont(font);
    painter.setPen(QColor(242, 169, 59));
    for (int i = 0; i < 4; ++i) {
        const double x = 120 + i * w / 4;
        painter.drawText(QPointF(x, 28), u"LUMORA 400"_s);
        painter.drawText(QPointF(x, h - 12), u"%1     %1A"_s.arg(24 + i));
    }
}

void instantPrint(QPainter& painter) {
    painter.fillPath(around(opening(58, 62, 58, 215, 6)), QColor(252, 251, 247));
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(QColor(214, 209, 198), 3));
    painter.drawPath(opening(57, 61, 57, 214, 6));
}

QPainterPath heart(QPointF at, double size) {
    QPainterPath path(QPointF(0, 0.42));
    path.cubicTo(-0.9, -0.12, -0.42, -0.72, 0, -0.26);
    path.cubicTo(0.42, -0.72, 0.9, -0.12, 0, 0.42);
    return QTransform::fromTranslate(at.x(), at.y()).scale(size, size).map(path);
}

void hearts(QPainter& painter) {
    painter.fillPath(around(opening(76, 76, 76, 76, 46)), QColor(255, 232, 236));
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(QColor(240, 150, 168), 4, Qt::DashLine, Qt::RoundCap));
    painter.drawPath(opening(62, 62, 62, 62, 50));
    constexpr std::array reds = {QColor(214, 40, 72), QColor(236, 92, 122), QColor(248, 158, 176), QColor(176, 24, 60)};
    Random random(11);
    painter.setPen(Qt::NoPen);
    const auto place = [&](QPointF at, double size) {
        painter.save();
        painter.translate(at);
        painter.rotate(random.within(-24, 24));
        const QPainterPath shape = heart({}, size);
        painter.fillPath(shape, random.oneOf(reds));
        painter.fillPath(heart(QPointF(-size * 0.2, -size * 0.14), size * 0.24), QColor(255, 235, 240, 190));
        painter.restore();
    };
    for (int i = 0; i < 15; ++i) {
        for (const double y : {38.0, h - 38})
            place({(i + 0.5) * w / 15, y + random.within(-8, 8)}, random.within(38, 66));
    }
    for (int i = 1; i < 12; ++i) {
        for (const double x : {38.0, w - 38})
            place({x + random.within(-8, 8), (i + 0.2) * h / 12}, random.within(38, 66));
    }
    for (const double x : {88.0, w - 88}) {
        for (const double y : {92.0, h - 92})
            place({x, y}, 150);
    }
}

void confetti(QPainter& painter) {
    constexpr std::array colours = {QColor(237, 60, 92),  QColor(250, 186, 44), QColor(60, 178, 226),
                                    QColor(98, 190, 92),  QColor(164, 98, 214), QColor(255, 126, 52),
                                    QColor(255, 240, 120)};
    Random random(21);
    painter.setBrush(Qt::NoBrush);
    for (int i = 0; i < 14; ++i) {
        const bool top = i % 2 == 0;
        const QPointF from(random.within(0, w), top ? -10 : h + 10);
        QPainterPath streamer(from);
        QPointF at = from;
        const double down = top ? 1 : -1;
        const double lean = random.within(-30, 30);
        for (int curl = 0; curl < 4; ++curl) {
            const QPointF next = at + QPointF(lean, down * 34);
            streamer.cubicTo(at + QPointF(46, down * 4), next + QPointF(46, -down * 4), next);
            at = next + QPointF(-18, 0);
            streamer.lineTo(at);
        }
        painter.setPen(QPen(random.oneOf(colours), 8, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        painter.drawPath(streamer);
    }
    painter.setPen(Qt::NoPen);
    for (int i = 0; i < 620; ++i) {
        // Dense at the edges and thin towards the picture.
        const double depth = std::pow(random.within(0, 1), 2.3) * 190;
        const double along = random.within(0, 1);
        const int side = static_cast<int>(random.within(0, 3.999));
        const QPointF at = side == 0   ? QPointF(along * w, depth)
                           : side == 1 ? QPointF(along * w, h - depth)
                           : side == 2 ? QPointF(depth, along * h)
                                       : QPointF(w - depth, along * h);
        painter.save();
        painter.translate(at);
        painter.rotate(random.within(0, 180));
        painter.setBrush(random.oneOf(colours));
        const double size = random.within(7, 16);
        if (i % 3 == 0)
            painter.drawEllipse(QPointF(), size * 0.7, size * 0.7);
        else
            painter.drawRect(QRectF(-size, -size * 0.45, size * 2, size * 0.9));
        painter.restore();
    }
}

void leaf(QPainter& painter, QPointF at, double angle, double length) {
    painter.save();
    painter.translate(at);
    painter.rotate(angle);
    QPainterPath shape(QPointF(0, 0));
    shape.quadTo(length * 0.5, -length * 0.42, length, 0);
    shape.quadTo(length * 0.5, length * 0.42, 0, 0);
    QLinearGradient green(0, -length * 0.3, 0, length * 0.3);
    green.setColorAt(0, QColor(136, 184, 96));
    green.setColorAt(1, QColor(66, 122, 62));
    painter.fillPath(shape, green);
    painter.setPen(QPen(QColor(48, 98, 50), 2));
    painter.drawLine(QPointF(4, 0), QPointF(length * 0.9, 0));
    painter.restore();
}

void flower(QPainter& painter, QPointF at, double radius, QColor petal, int petals = 7) {
    painter.save();
    painter.translate(at);
    painter.setPen(QPen(petal.darker(128), 2));
    for (int layer = 0; layer < 2; ++layer) {
        const double reach = radius * (layer == 0 ? 1 : 0.68);
        for (int i = 0; i < petals; ++i) {
            painter.save();
            painter.rotate(360.0 / petals * (i + layer * 0.5));
            QRadialGradient shade(QPointF(reach * 0.25, 0), reach);
            shade.setColorAt(0, petal.darker(118));
            shade.setColorAt(0.9, layer == 0 ? petal : petal.lighter(112));
            painter.setBrush(shade);
            QPainterPath shape(QPointF(0, 0));
            shape.cubicTo(reach * 0.35, -reach * 0.5, reach * 0.95, -reach * 0.42, reach, 0);
            shape.cubicTo(reach * 0.95, reach * 0.42, reach * 0.35, reach * 0.5, 0, 0);
            painter.drawPath(shape);
            painter.restore();
        }
    }
    QRadialGradient heartOfIt(QPointF(-radius * 0.06, -radius * 0.06), radius * 0.28);
    heartOfIt.setColorAt(0, QColor(255, 226, 110));
    heartOfIt.setColorAt(1, QColor(214, 142, 30));
    painter.setBrush(heartOfIt);
    painter.setPen(Qt::NoPen);
    painter.drawEllipse(QPointF(), radius * 0.24, radius * 0.24);
    painter.restore();
}

void flowers(QPainter& painter) {
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(QColor(84, 138, 70), 7, Qt::SolidLine, Qt::RoundCap));
    for (const double y : {34.0, h - 34}) {
        QPainterPath vine(QPointF(0, y));
        for (double x = 0; x < w; x += 100)
            vine.cubicTo(x + 33, y - 18, x + 66, y + 18, x + 100, y);
        painter.drawPath(vine);
    }
    for (const double x : {34.0, w - 34}) {
        QPainterPath vine(QPointF(x, 0));
        for (double y = 0; y < h; y += 100)
            vine.cubicTo(x - 18, y + 33, x + 18, y + 66, x, y + 100);
        painter.drawPath(vine);
    }
    for (double x = 200; x < w - 150; x += 50) {
        leaf(painter, {x, 34}, static_cast<int>(x / 50) % 2 == 0 ? 50 : -50, 48);
        leaf(painter, {x, h - 34}, static_cast<int>(x / 50) % 2 == 0 ? -50 : 50, 48);
    }
    for (double y = 200; y < h - 150; y += 50) {
        leaf(painter, {34, y}, static_cast<int>(y / 50) % 2 == 0 ? 40 : 140, 48);
        leaf(painter, {w - 34, y}, static_cast<int>(y / 50) % 2 == 0 ? 140 : 40, 48);
    }
    constexpr QColor rose(236, 112, 140);
    constexpr QColor cream(255, 240, 214);
    constexpr QColor violet(166, 132, 214);
    constexpr QColor coral(250, 150, 108);
    for (const double x : {0.0, w}) {
        for (const double y : {0.0, h}) {
            painter.save();
            painter.translate(x, y);
            painter.scale(x > 0 ? -1 : 1, y > 0 ? -1 : 1);
            for (const double angle : {8.0, 30.0, 60.0, 82.0})
                leaf(painter, {70, 70}, angle, 150);
            flower(painter, {176, 58}, 54, violet, 6);
            flower(painter, {58, 176}, 54, coral, 6);
            flower(painter, {140, 140}, 44, cream);
            flower(painter, {78, 78}, 84, rose, 8);
            painter.restore();
        }
    }
    for (const double x : {w / 2 - 100, w / 2 + 100}) {
        flower(painter, {x, 36}, 32, cream, 6);
        flower(painter, {x, h - 36}, 32, cream, 6);
    }
}

void balloons(QPainter& painter) {
    constexpr std::array colours = {QColor(232, 62, 84), QColor(250, 182, 46), QColor(66, 166, 222),
                                    QColor(110, 190, 96), QColor(168, 104, 210)};
    struct Balloon {
        double x, y, size;
    };
    std::size_t next = 0;
    for (const double side : {1.0, -1.0}) {
        painter.save();
        painter.translate(side > 0 ? 0 : w, 0);
        painter.scale(side, 1);
        constexpr std::array<Balloon, 6> bunch = {
            {{60, 250, 62}, {170, 60, 66}, {48, 118, 70}, {128, 172, 74}, {250, 52, 50}, {52, 372, 48}}};
        for (const Balloon& balloon : bunch) {
            painter.setBrush(Qt::NoBrush);
            painter.setPen(QPen(QColor(120, 112, 104), 4, Qt::SolidLine, Qt::RoundCap));
            QPainterPath string(QPointF(balloon.x, balloon.y + balloon.size * 1.2));
            string.cubicTo(balloon.x + 20, balloon.y + 240, 10, balloon.y + 380, 26, h + 20);
            painter.drawPath(string);
        }
        for (const Balloon& balloon : bunch) {
            const QColor colour = colours[next++ % colours.size()];
            QRadialGradient shine(QPointF(balloon.x - balloon.size * 0.35, balloon.y - balloon.size * 0.45),
                                  balloon.size * 1.7);
            shine.setColorAt(0, colour.lighter(165));
            shine.setColorAt(0.35, colour);
            shine.setColorAt(1, colour.darker(150));
            painter.setPen(Qt::NoPen);
            painter.setBrush(shine);
            const double foot = balloon.y + balloon.size * 1.12;
            painter.drawEllipse(QPointF(balloon.x, balloon.y), balloon.size, balloon.size * 1.14);
            painter.setBrush(colour.darker(130));
            painter.drawPolygon(QPolygonF({QPointF(balloon.x, foot - 8), QPointF(balloon.x - 12, foot + 14),
                                           QPointF(balloon.x + 12, foot + 14)}));
        }
        painter.restore();
    }
}

// How much shadow the art throws on each pixel, 0 to 1: its own shape, shifted and blurred.
std::vector<float> shadowOf(const QImage& art) {
    constexpr int shift = 7;
    constexpr int reach = 6;
    constexpr float strength = 0.55F;
    std::vector<float> shade(static_cast<std::size_t>(art.width() * art.height()));
    const auto at = [&](int x, int y) -> float& {
        return shade[static_cast<std::size_t>(std::clamp(y, 0, art.height() - 1) * art.width() +
                                              std::clamp(x, 0, art.width() - 1))];
    };
    for (int y = 0; y < art.height(); ++y) {
        for (int x = 0; x < art.width(); ++x)
            at(x, y) =
                static_cast<float>(qAlpha(art.pixel(std::max(0, x - shift), std::max(0, y - shift)))) / 255 * strength;
    }
    const auto blur = [&](int length, int lines, const auto& pixel) {
        std::vector<float> line(static_cast<std::size_t>(length));
        for (int n = 0; n < lines; ++n) {
            float sum = 0;
            for (int i = -reach; i <= reach; ++i)
                sum += pixel(i, n);
            for (int i = 0; i < length; ++i) {
                line[static_cast<std::size_t>(i)] = sum / (2 * reach + 1);
                sum += pixel(i + reach + 1, n) - pixel(i - reach, n);
            }
            for (int i = 0; i < length; ++i)
                pixel(i, n) = line[static_cast<std::size_t>(i)];
        }
    };
    for (int pass = 0; pass < 2; ++pass) {
        blur(art.width(), art.height(), [&](int i, int n) -> float& { return at(i, n); });
        blur(art.height(), art.width(), [&](int i, int n) -> float& { return at(n, i); });
    }
    return shade;
}

QRgb solid(QRgb colour) {
    int sum = qRed(colour) + qGreen(colour) + qBlue(colour);
    if (sum >= leastSolidSum)
        return colour | 0xff000000U;
    const int lift = (leastSolidSum - sum + 2) / 3;
    return qRgb(qRed(colour) + lift, qGreen(colour) + lift, qBlue(colour) + lift);
}

} // namespace

std::vector<FrameCategory> frameCategories() {
    return {
        {u"קלאסי",
         {{"001", whiteBorder, false},
          {"002", blackBorder, false},
          {"011", roundedMat, true},
          {"012", goldLine, true},
          {"013", wood, true},
          {"014", filmStrip, false},
          {"015", instantPrint, false}}},
        {u"חגיגה",
         {{"001", whiteBorder, false},
          {"002", blackBorder, false},
          {"021", hearts, true},
          {"022", confetti, true},
          {"023", flowers, true},
          {"024", balloons, true}}},
    };
}

QImage asFrameFile(const FrameArt& art) {
    QImage drawn(sheetWidth, sheetHeight, QImage::Format_ARGB32_Premultiplied);
    drawn.fill(Qt::transparent);
    {
        QPainter painter(&drawn);
        painter.setRenderHint(QPainter::Antialiasing);
        art.draw(painter);
    }
    const QImage colours = drawn.convertToFormat(QImage::Format_ARGB32);
    const std::vector<float> shade = art.shadow ? shadowOf(drawn) : std::vector<float>();
    QImage file(drawn.size(), QImage::Format_RGB32);
    for (int y = 0; y < file.height(); ++y) {
        auto* row = reinterpret_cast<QRgb*>(file.scanLine(y));
        const auto* pixels = reinterpret_cast<const QRgb*>(colours.constScanLine(y));
        for (int x = 0; x < file.width(); ++x) {
            if (qAlpha(pixels[x]) >= 128) {
                row[x] = solid(pixels[x]);
                continue;
            }
            const int sum =
                shade.empty()
                    ? 0
                    : static_cast<int>(std::lround(shade[static_cast<std::size_t>(y * file.width() + x)] * 23));
            row[x] = qRgb((sum + 2) / 3, (sum + 1) / 3, sum / 3);
        }
    }
    return file;
}

} // namespace lumora::demo
