#include "Scenes.h"

#include <QLinearGradient>
#include <QRadialGradient>

#include <algorithm>
#include <array>
#include <vector>

namespace lumora::demo {
namespace {

// Lights far behind, as a lens draws them that looks at something near.
void bokeh(Sheet& sheet, const QRectF& area, int count, double smallest, double largest,
           std::initializer_list<QColor> colours, double strength) {
    Dice& dice = sheet.dice();
    sheet.soft(
        area, 3,
        [&](QPainter& p) {
            for (int i = 0; i < count; ++i) {
                const QPointF at(dice.in(area.left(), area.right()), dice.in(area.top(), area.bottom()));
                const double size = dice.in(smallest, largest);
                const QColor colour = colours.begin()[dice.upTo(static_cast<int>(colours.size()))];
                QRadialGradient disc(at, size);
                disc.setColorAt(0, withAlpha(colour, strength * 0.6));
                disc.setColorAt(0.86, withAlpha(colour, strength * 0.75));
                disc.setColorAt(0.94, withAlpha(mixed(colour, Qt::white, 0.4), strength));
                disc.setColorAt(1, withAlpha(colour, 0));
                p.setBrush(disc);
                p.drawEllipse(at, size, size);
            }
        },
        1, QPainter::CompositionMode_Screen);
}

// A round thing in the light from the upper left.
void ball(QPainter& painter, QPointF at, double radius, const QColor& colour, double shine = 0.7) {
    QRadialGradient body(at, radius * 1.05, at + QPointF(-radius * 0.4, -radius * 0.45));
    body.setColorAt(0, mixed(colour, QColor(255, 250, 230), 0.35));
    body.setColorAt(0.35, colour);
    body.setColorAt(0.8, mixed(colour, QColor(40, 16, 20), 0.45));
    body.setColorAt(1, mixed(colour, QColor(20, 8, 16), 0.65));
    painter.setBrush(body);
    painter.drawEllipse(at, radius, radius);
    airbrush(painter, at + QPointF(-radius * 0.36, -radius * 0.42), radius * 0.3, radius * 0.22, Qt::white, shine, -35);
}

void boards(Sheet& sheet, const QRectF& area, const QColor& wood, int count) {
    Dice& dice = sheet.dice();
    QPainter& painter = sheet.painter();
    sheet.dots(area, 2, [&](float x, float y) {
        const float fibre = layeredNoise(x / 160, y / 2.6F, 4, 91);
        const Tint plain{static_cast<float>(wood.red()), static_cast<float>(wood.green()),
                         static_cast<float>(wood.blue())};
        return mixed(plain, {plain.r * 0.45F, plain.g * 0.4F, plain.b * 0.36F}, 1.1F * std::abs(fibre - 0.42F) + 0.1F);
    });
    for (int i = 1; i <= count; ++i) {
        const double y = area.top() + area.height() * i * (i + 1.0) / (count * (count + 1.0));
        stroke(painter, curve({area.left(), y}, {600, y + dice.in(-1, 1)}, {area.right(), y}),
               withAlpha(QColor(20, 8, 4), 0.6), 2);
        stroke(painter, curve({area.left(), y + 2.4}, {600, y + 2.4}, {area.right(), y + 2.4}),
               withAlpha(QColor(255, 230, 190), 0.18), 1.4);
    }
}

} // namespace

void drawCake(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    sheet.gradient({0, 0, 1200, 900}, {{0, {58, 32, 30}}, {0.55, {104, 58, 40}}, {1, {40, 20, 18}}});
    sheet.glow({600, 330}, 760, QColor(190, 110, 60), 0.5);
    bokeh(sheet, {-40, 20, 1280, 440}, 46, 16, 58, {{255, 190, 100}, {255, 150, 90}, {250, 214, 150}, {220, 90, 80}},
          0.42);
    // Presents on the table behind.
    sheet.soft({0, 330, 1200, 320}, 11, [](QPainter& p) {
        p.fillRect(QRectF(66, 430, 210, 170), QColor(150, 46, 52));
        p.fillRect(QRectF(156, 430, 26, 170), QColor(240, 206, 140));
        p.fillRect(QRectF(216, 500, 150, 110), QColor(64, 96, 128));
        p.fillRect(QRectF(216, 540, 150, 20), QColor(232, 226, 216));
        p.fillRect(QRectF(900, 410, 190, 190), QColor(60, 110, 92));
        p.fillRect(QRectF(984, 410, 24, 190), QColor(246, 200, 110));
        p.setBrush(QColor(246, 200, 110));
        p.drawEllipse(QPointF(968, 396), 34, 18);
        p.drawEllipse(QPointF(1024, 396), 34, 18);
        p.fillRect(QRectF(1064, 500, 150, 104), QColor(178, 120, 60));
    });
    boards(sheet, {0, 590, 1200, 310}, {128, 76, 46}, 5);
    sheet.soft({0, 580, 1200, 40}, 9, [](QPainter& p) { p.fillRect(QRectF(-40, 574, 1280, 26), QColor(90, 50, 34)); });
    sheet.glow({600, 690}, 560, QColor(255, 176, 90), 0.4);
    // The stand.
    sheet.soft({250, 720, 700, 130}, 12, [](QPainter& p) {
        p.setBrush(QColor(14, 4, 4, 190));
        p.drawEllipse(QPointF(610, 796), 300, 38);
    });
    const QColor china(238, 230, 220);
    painter.fillPath(outline({{520, 806},
                              {540, 780},
                              {566, 770},
                              {568, 740},
                              {590, 740},
                              {610, 740},
                              {632, 740},
                              {634, 770},
                              {660, 780},
                              {680, 806},
                              {660, 826},
                              {540, 826},
                              {520, 806}}),
                     mixed(china, QColor(90, 50, 30), 0.35));
    airbrush(painter, {556, 796}, 26, 20, Qt::white, 0.6);
    painter.setBrush(mixed(china, QColor(90, 50, 30), 0.4));
    painter.drawEllipse(QPointF(600, 724), 348, 62);
    painter.setBrush(china);
    painter.drawEllipse(QPointF(600, 712), 350, 62);
    airbrush(painter, {600, 722}, 330, 48, QColor(110, 66, 40), 0.75);
    airbrush(painter, {380, 730}, 120, 16, Qt::white, 0.7, 8);
    // Two layers of cake with cream between, chocolate over the edge.
    QPainterPath side(QPointF(316, 470));
    side.lineTo(316, 676);
    side.cubicTo(QPointF(340, 752), QPointF(860, 752), QPointF(884, 676));
    side.lineTo(884, 470);
    side.closeSubpath();
    QLinearGradient sponge(316, 0, 884, 0);
    sponge.setColorAt(0, QColor(150, 98, 58));
    sponge.setColorAt(0.3, QColor(240, 196, 134));
    sponge.setColorAt(0.6, QColor(226, 176, 114));
    sponge.setColorAt(1, QColor(110, 64, 40));
    painter.fillPath(side, sponge);
    painter.save();
    painter.setClipPath(side);
    for (int i = 0; i < 1500; ++i) {
        const QPointF at(dice.in(316, 884), dice.in(480, 740));
        airbrush(painter, at, dice.in(1.5, 5), dice.in(1, 3), i % 3 == 0 ? QColor(255, 226, 176) : QColor(130, 78, 40),
                 0.45);
    }
    for (const double y : {556.0, 634.0}) {
        QPainterPath cream(QPointF(300, y));
        cream.cubicTo(QPointF(340, y + 62), QPointF(860, y + 62), QPointF(900, y));
        stroke(painter, cream, QColor(252, 242, 226), 24);
        stroke(painter, cream.translated(0, 9), QColor(206, 170, 140, 190), 6);
        for (int i = 0; i < 26; ++i) {
            const double t = dice.in(0.06, 0.94);
            ball(painter, cream.pointAtPercent(t) + QPointF(0, dice.in(-4, 5)), dice.in(6, 10), QColor(190, 34, 48),
                 0.6);
        }
    }
    airbrush(painter, {860, 620}, 130, 210, QColor(40, 14, 10), 0.75);
    airbrush(painter, {322, 620}, 60, 210, QColor(50, 20, 12), 0.6);
    painter.restore();
    const QColor chocolate(74, 36, 22);
    QPainterPath glaze(QPointF(312, 462));
    for (int i = 0; i < 15; ++i) {
        const double a = 3.14159 * (1 - i / 15.0), b = 3.14159 * (1 - (i + 1) / 15.0), m = (a + b) / 2;
        const double drop = dice.in(26, 84);
        const auto edge = [](double angle, double down) {
            return QPointF(600 + 288 * std::cos(angle), 462 + 56 * std::sin(angle) + down);
        };
        glaze.cubicTo(edge(a, 16), edge(a * 0.7 + m * 0.3, drop), edge(m, drop));
        glaze.cubicTo(edge(m * 0.3 + b * 0.7, drop), edge(b, 16), edge(b, 8));
    }
    glaze.lineTo(888, 462);
    glaze.cubicTo(QPointF(880, 388), QPointF(320, 388), QPointF(312, 462));
    QLinearGradient dark(312, 0, 888, 0);
    dark.setColorAt(0, mixed(chocolate, Qt::black, 0.35));
    dark.setColorAt(0.3, mixed(chocolate, QColor(255, 190, 140), 0.22));
    dark.setColorAt(1, mixed(chocolate, Qt::black, 0.55));
    painter.fillPath(glaze, dark);
    painter.setBrush(mixed(chocolate, QColor(255, 190, 130), 0.16));
    painter.drawEllipse(QPointF(600, 458), 286, 56);
    airbrush(painter, {600, 462}, 270, 46, QColor(255, 190, 110), 0.42);
    for (int i = 0; i < 9; ++i)
        airbrush(painter, {360 + 52.0 * i, 520 + 22 * std::sin(i / 8.0 * 3.14)}, 5, 17, QColor(255, 226, 200), 0.4);
    // Cream and berries round the edge, candles in the middle: what is far first.
    struct Thing {
        QPointF at;
        int kind;
    };
    std::vector<Thing> things;
    for (int i = 0; i < 20; ++i) {
        const double angle = 6.283 * i / 20;
        things.push_back({{600 + 252 * std::cos(angle), 452 + 45 * std::sin(angle)}, i % 2});
    }
    for (int i = 0; i < 7; ++i) {
        const double angle = 6.283 * (i + 0.25) / 7;
        things.push_back({{600 + 150 * std::cos(angle), 454 + 27 * std::sin(angle)}, 2 + i});
    }
    std::sort(things.begin(), things.end(), [](const Thing& a, const Thing& b) { return a.at.y() < b.at.y(); });
    for (const Thing& thing : things) {
        const QPointF at = thing.at;
        airbrush(painter, at + QPointF(6, 5), 34, 10, QColor(20, 6, 4), 0.6);
        if (thing.kind == 0) {
            for (int ring = 0; ring < 5; ++ring)
                ball(painter, at + QPointF(0, -8.0 * ring), 27 - 5 * ring, QColor(250, 238, 220), 0.5);
        } else if (thing.kind == 1) {
            ball(painter, at + QPointF(0, -14), 24, QColor(206, 30, 44));
            for (int seed = 0; seed < 26; ++seed) {
                const QPointF dot(dice.in(-19, 19), dice.in(-19, 19));
                if (std::hypot(dot.x(), dot.y()) < 21)
                    airbrush(painter, at + QPointF(0, -14) + dot, 1.6, 2.2, QColor(255, 214, 120), 0.9);
            }
            for (int leaf = -2; leaf <= 2; ++leaf)
                stroke(painter, curve(at + QPointF(0, -36), at + QPointF(6 * leaf, -42), at + QPointF(9 * leaf, -32)),
                       QColor(70, 126, 48), 4);
        } else {
            const QColor wax = std::array{QColor(236, 110, 120), QColor(246, 204, 96), QColor(120, 178, 206),
                                          QColor(150, 196, 120)}[static_cast<std::size_t>(thing.kind) % 4];
            const double tall = 142;
            QLinearGradient round(at.x() - 9, 0, at.x() + 9, 0);
            round.setColorAt(0, mixed(wax, Qt::black, 0.3));
            round.setColorAt(0.35, mixed(wax, Qt::white, 0.45));
            round.setColorAt(1, mixed(wax, QColor(60, 20, 20), 0.5));
            const QRectF candle(at.x() - 9, at.y() - tall, 18, tall);
            painter.setBrush(round);
            painter.drawRoundedRect(candle, 7, 5);
            painter.save();
            painter.setClipRect(candle);
            for (double y = candle.top() - 10; y < candle.bottom() + 10; y += 26)
                stroke(painter,
                       curve({candle.left(), y + 12}, candle.center() + QPointF(0, y - candle.center().y() + 6),
                             {candle.right(), y}),
                       QColor(255, 250, 240, 170), 6);
            painter.restore();
            const QPointF wick(at.x(), candle.top());
            airbrush(painter, wick + QPointF(0, 8), 12, 22, QColor(255, 226, 160), 0.9);
            stroke(painter, curve(wick, wick + QPointF(1, -6), wick + QPointF(3, -11)), QColor(40, 22, 16), 2.4);
        }
    }
    for (const Thing& thing : things) {
        if (thing.kind < 2)
            continue;
        const QPointF foot = thing.at + QPointF(2, -147);
        const double lean = dice.in(-4, 4), tall = dice.in(44, 54);
        sheet.glow(foot + QPointF(0, -20), 130, QColor(255, 170, 70), 0.5);
        sheet.glow(foot + QPointF(0, -20), 46, QColor(255, 190, 90), 0.8);
        const auto flame = [&](double wide, double high) {
            return outline({foot, foot + QPointF(-wide, -2), foot + QPointF(-wide * 1.1, -high * 0.36),
                            foot + QPointF(-wide * 0.5, -high * 0.62), foot + QPointF(-wide * 0.1, -high * 0.8),
                            foot + QPointF(lean, -high * 0.86), foot + QPointF(lean, -high),
                            foot + QPointF(lean, -high * 0.86), foot + QPointF(wide * 0.3, -high * 0.8),
                            foot + QPointF(wide * 0.6, -high * 0.6), foot + QPointF(wide * 1.1, -high * 0.36),
                            foot + QPointF(wide, -2), foot});
        };
        sheet.soft({foot.x() - 20, foot.y() - 64, 40, 70}, 1.6, [&](QPainter& p) {
            p.fillPath(flame(10, tall), QColor(255, 168, 50, 235));
            p.fillPath(flame(7.4, tall * 0.82), QColor(255, 222, 120));
            p.fillPath(flame(5, tall * 0.6), QColor(255, 252, 224));
            airbrush(p, foot + QPointF(0, -3), 7, 6, QColor(90, 120, 255), 0.5);
        });
    }
    // Crumbs, confetti and a fork before it.
    for (int i = 0; i < 60; ++i) {
        const QPointF at(dice.in(90, 1110), dice.in(800, 892));
        const QColor paper = std::array{QColor(226, 84, 84), QColor(246, 200, 90), QColor(110, 170, 200),
                                        QColor(236, 230, 220)}[static_cast<std::size_t>(dice.upTo(4))];
        airbrush(painter, at + QPointF(2, 3), 9, 4, QColor(10, 4, 2), 0.6);
        painter.setBrush(paper);
        painter.drawEllipse(at, dice.in(3, 6), dice.in(1.6, 3.4));
    }
    sheet.glow({600, 360}, 520, QColor(255, 170, 80), 0.22);
}

void drawMarket(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    sheet.gradient({0, 0, 1200, 900}, {{0, {206, 214, 216}}, {0.4, {236, 222, 196}}, {1, {110, 88, 70}}});
    // The lane behind: other stalls, people.
    sheet.soft({0, 100, 1200, 420}, 10, [&](QPainter& p) {
        p.fillPath(polygon({{-20, 120}, {300, 210}, {300, 520}, {-20, 520}}), QColor(176, 140, 110));
        p.fillPath(polygon({{1220, 100}, {850, 214}, {850, 520}, {1220, 520}}), QColor(196, 160, 126));
        for (int i = 0; i < 4; ++i) {
            p.fillRect(QRectF(20 + 66 * i, 200 + 16 * i, 34, 60), QColor(92, 104, 116));
            p.fillRect(QRectF(1130 - 70 * i, 196 + 18 * i, 36, 62), QColor(98, 104, 112));
        }
        p.fillPath(polygon({{-20, 330}, {260, 300}, {330, 350}, {-20, 400}}), QColor(66, 120, 96));
        p.fillPath(polygon({{1220, 330}, {940, 296}, {860, 350}, {1220, 402}}), QColor(200, 140, 60));
        p.fillRect(QRectF(-20, 400, 340, 120), QColor(120, 90, 60));
        p.fillRect(QRectF(870, 400, 340, 120), QColor(126, 92, 60));
        const QColor coats[] = {{150, 60, 60},  {60, 80, 120}, {210, 196, 170}, {70, 100, 80},
                                {120, 80, 120}, {50, 54, 66},  {196, 150, 90}};
        for (int i = 0; i < 12; ++i) {
            const double x = 330 + 50 * i + dice.in(-16, 16), y = 310 + dice.in(-14, 30), size = dice.in(0.8, 1.15);
            p.setBrush(mixed(coats[dice.upTo(7)], QColor(236, 222, 196), 0.2));
            p.drawRoundedRect(QRectF(x - 26 * size, y + 14, 52 * size, 200), 22, 22);
            p.setBrush(QColor(206, 160, 130));
            p.drawEllipse(QPointF(x, y), 14 * size, 17 * size);
            p.setBrush(mixed(QColor(60, 40, 30), QColor(170, 150, 130), dice.in(0, 1)));
            p.drawEllipse(QPointF(x, y - 7 * size), 15 * size, 13 * size);
        }
    });
    sheet.glow({600, 240}, 420, QColor(255, 240, 206), 0.6);

    // Four heaps behind, four before; each in its crate, seen from a little above.
    enum { Orange, Lemon, Tomato, Apple, Plum, Pepper, Lettuce, Aubergine };
    const auto crate = [&](const QRectF& at, int fruit, double size) {
        const QColor wood(176, 132, 84);
        painter.fillRect(at, QColor(60, 38, 24));
        painter.save();
        painter.setClipRect(
            QRectF(at.left() + 6, at.top() - size * 2.2, at.width() - 12, at.height() + size * 2.2 - 30));
        const int rows = 6;
        for (int row = 0; row < rows; ++row) {
            const double t = row / (rows - 1.0), near = 0.78 + 0.22 * t;
            const double y = at.top() + (at.height() - 34) * t - size * 0.9 * std::sin(3.14159 * (0.35 + 0.6 * t));
            for (double x = at.left() + size * (row % 2 == 0 ? 0.3 : 1.1) * near; x < at.right();
                 x += size * 1.72 * near) {
                const QPointF centre(x + dice.in(-3, 3), y + dice.in(-3, 3));
                const double r = size * near * dice.in(0.92, 1.06);
                airbrush(painter, centre + QPointF(r * 0.2, r * 0.5), r * 1.3, r * 1.1, QColor(20, 8, 4), 0.55);
                switch (fruit) {
                case Orange:
                    ball(painter, centre, r, mixed(QColor(240, 134, 22), QColor(250, 168, 40), dice.in(0, 1)), 0.5);
                    for (int i = 0; i < 14; ++i)
                        airbrush(painter, centre + QPointF(dice.in(-0.6, 0.6) * r, dice.in(-0.6, 0.6) * r), 1.2, 1.2,
                                 QColor(160, 70, 0), 0.4);
                    if (dice.upTo(3) == 0)
                        airbrush(painter, centre + QPointF(dice.in(-0.4, 0.4) * r, dice.in(-0.5, 0.1) * r), 3, 2.4,
                                 QColor(60, 90, 30), 1);
                    break;
                case Lemon:
                    painter.save();
                    painter.translate(centre);
                    painter.rotate(dice.in(-60, 60));
                    painter.scale(1.16, 0.86);
                    airbrush(painter, {r, 0}, r * 0.3, r * 0.26, QColor(220, 180, 30), 1);
                    ball(painter, {0, 0}, r, mixed(QColor(246, 214, 50), QColor(250, 228, 90), dice.in(0, 1)), 0.5);
                    painter.restore();
                    break;
                case Tomato:
                    ball(painter, centre, r, mixed(QColor(206, 34, 26), QColor(226, 70, 36), dice.in(0, 1)), 0.85);
                    for (int leaf = 0; leaf < 5; ++leaf) {
                        const double angle = leaf * 1.257 + dice.in(0, 0.5);
                        stroke(
                            painter,
                            curve(centre + QPointF(0, -r * 0.35),
                                  centre + QPointF(std::cos(angle) * r * 0.25, -r * 0.4 + std::sin(angle) * r * 0.12),
                                  centre + QPointF(std::cos(angle) * r * 0.48, -r * 0.32 + std::sin(angle) * r * 0.24)),
                            QColor(66, 112, 40), r * 0.09);
                    }
                    break;
                case Apple: {
                    ball(painter, centre, r, mixed(QColor(112, 160, 40), QColor(160, 190, 70), dice.in(0, 1)), 0.7);
                    airbrush(painter, centre + QPointF(r * dice.in(-0.4, 0.4), r * 0.1), r * 0.6, r * 0.66,
                             QColor(206, 60, 40), 0.55);
                    airbrush(painter, centre + QPointF(0, -r * 0.5), r * 0.28, r * 0.14, QColor(50, 50, 10), 0.8);
                    stroke(painter,
                           curve(centre + QPointF(0, -r * 0.5), centre + QPointF(1, -r * 0.8),
                                 centre + QPointF(r * 0.2, -r)),
                           QColor(80, 54, 30), r * 0.08);
                    break;
                }
                case Plum:
                    ball(painter, centre, r, mixed(QColor(74, 38, 92), QColor(110, 50, 96), dice.in(0, 1)), 0.4);
                    airbrush(painter, centre + QPointF(-r * 0.2, -r * 0.2), r * 0.6, r * 0.6, QColor(170, 170, 220),
                             0.28);
                    break;
                case Pepper:
                    painter.save();
                    painter.translate(centre);
                    painter.rotate(dice.in(-25, 25));
                    for (const double lobe : {-0.45, 0.45, 0.0})
                        ball(painter, {lobe * r, 0}, r * 0.72,
                             dice.upTo(2) == 0 && lobe == 0 ? QColor(216, 44, 30) : QColor(206, 36, 28), 0.9);
                    stroke(painter, curve({0, -r * 0.6}, {2, -r * 0.9}, {r * 0.2, -r * 1.1}), QColor(70, 120, 44),
                           r * 0.2);
                    painter.restore();
                    break;
                case Lettuce:
                    for (int leaf = 0; leaf < 16; ++leaf) {
                        const double angle = dice.in(0, 6.283), out = r * (1.1 - leaf / 18.0);
                        const QPointF tip = centre + QPointF(std::cos(angle), std::sin(angle) * 0.8) * out;
                        airbrush(painter, (centre + tip * 2) / 3, out * 0.62, out * 0.46,
                                 mixed(QColor(60, 112, 40), QColor(180, 210, 96), leaf / 16.0), 0.95, angle * 57.3);
                        stroke(painter, curve(centre, (centre + tip) / 2 + QPointF(2, -2), tip),
                               QColor(214, 232, 160, 150), 1.6);
                    }
                    break;
                default:
                    painter.save();
                    painter.translate(centre);
                    painter.rotate(dice.in(20, 50));
                    painter.scale(1.5, 0.8);
                    ball(painter, {0, 0}, r, QColor(66, 30, 78), 1);
                    painter.restore();
                    break;
                }
            }
        }
        painter.restore();
        // The crate's front.
        for (int slat = 0; slat < 2; ++slat) {
            const QRectF board(at.left() - 4, at.bottom() - 42 + 24 * slat, at.width() + 8, 20);
            QLinearGradient light(board.topLeft(), board.bottomLeft());
            light.setColorAt(0, mixed(wood, Qt::white, 0.3));
            light.setColorAt(1, mixed(wood, Qt::black, 0.25));
            painter.fillRect(board, light);
            QPainterPath grain;
            grain.addRect(board);
            sheet.texture(grain, 8, 0.7, 0.16);
            for (const double x : {board.left() + 9, board.right() - 9})
                airbrush(painter, {x, board.center().y()}, 3, 3, QColor(40, 30, 30), 0.9);
        }
        stroke(painter,
               curve(at.bottomLeft() + QPointF(-4, 0), {at.center().x(), at.bottom() + 1},
                     at.bottomRight() + QPointF(4, 0)),
               QColor(40, 24, 16, 190), 3);
    };
    const auto sign = [&](QPointF at, const QColor& ink) {
        painter.save();
        painter.translate(at);
        painter.rotate(dice.in(-6, 6));
        stroke(painter, curve({0, 0}, {1, 36}, {0, 74}), QColor(150, 116, 80), 4);
        airbrush(painter, {6, 6}, 70, 40, QColor(20, 10, 6), 0.4);
        painter.fillRect(QRectF(-50, -32, 100, 62), QColor(250, 246, 234));
        // Somebody's quick hand.
        stroke(painter,
               outline({{-30, -14},
                        {-10, -26},
                        {-6, -10},
                        {-24, 6},
                        {-30, 16},
                        {-20, 16},
                        {-8, 14},
                        {-20, 16},
                        {-28, 16},
                        {-30, 14},
                        {-14, -2},
                        {-10, -24},
                        {-30, -14}}),
               ink, 4);
        painter.setBrush(Qt::NoBrush);
        stroke(painter, curve({6, 14}, {6, -18}, {18, -16}), ink, 4);
        stroke(painter, curve({18, -16}, {36, 0}, {8, 12}), ink, 4);
        painter.setPen(Qt::NoPen);
        painter.restore();
    };
    painter.fillPath(polygon({{-10, 470}, {1210, 470}, {1210, 910}, {-10, 910}}), QColor(84, 58, 40));
    const int back[] = {Lettuce, Lemon, Apple, Plum}, front[] = {Orange, Tomato, Pepper, Orange};
    for (int i = 0; i < 4; ++i)
        crate({32 + 288.0 * i, 468, 270, 150}, back[i], back[i] == Lettuce ? 34 : 25);
    sign({460, 452}, QColor(30, 60, 120));
    sign({1040, 456}, QColor(150, 30, 40));
    sheet.soft({-20, 610, 1240, 60}, 8,
               [](QPainter& p) { p.fillRect(QRectF(-30, 612, 1260, 26), QColor(30, 16, 10, 150)); });
    for (int i = 0; i < 4; ++i)
        crate({-40 + 326.0 * i, 668, 304, 196}, front[i], i == 3 ? 30 : 35);
    sign({330, 660}, QColor(160, 30, 30));
    sign({640, 664}, QColor(30, 90, 50));
    painter.fillRect(QRectF(0, 866, 1200, 40), QColor(60, 40, 28));
    // The awning above, with the sun through the cloth.
    for (int i = 0; i < 15; ++i) {
        const double a = -30 + 84.0 * i, c = a + 84;
        const QColor cloth = i % 2 == 0 ? QColor(198, 54, 46) : QColor(250, 240, 220);
        const auto low = [](double x) { return 600 + (x - 600) * 1.12; };
        QPainterPath panel(QPointF(a, -10));
        panel.lineTo(c, -10);
        panel.lineTo(low(c), 124);
        panel.lineTo(low(c), 150);
        panel.cubicTo(QPointF(low(c) - 12, 178), QPointF(low(a) + 12, 178), QPointF(low(a), 150));
        panel.lineTo(low(a), 124);
        panel.closeSubpath();
        QLinearGradient light(0, 0, 0, 176);
        light.setColorAt(0, mixed(cloth, QColor(60, 30, 20), 0.22));
        light.setColorAt(0.66, mixed(cloth, QColor(255, 246, 220), 0.25));
        light.setColorAt(0.72, mixed(cloth, QColor(40, 20, 20), 0.18));
        light.setColorAt(1, mixed(cloth, QColor(40, 20, 20), 0.38));
        painter.fillPath(panel, light);
    }
    stroke(painter, curve({-10, 124}, {600, 128}, {1210, 124}), QColor(60, 30, 24, 160), 2.5);
    QPainterPath cloth;
    cloth.addRect(0, 0, 1200, 165);
    sheet.texture(cloth, 0.8, 0.8, 0.06);
    for (const double x : {24.0, 1176.0})
        stroke(painter, curve({x, 140}, {x, 340}, {x, 640}), QColor(110, 84, 62), 12);
    // Scales on their chain, bulbs of garlic.
    for (int i = 0; i < 9; ++i)
        ball(painter, {1090 + (i % 2) * 22.0, 190 + 18.0 * i}, 17, QColor(238, 226, 214), 0.4);
    stroke(painter, curve({1100, 130}, {1101, 160}, {1100, 186}), QColor(150, 116, 80), 4);
    const QColor iron(120, 124, 128);
    stroke(painter, curve({150, 150}, {150, 170}, {150, 206}), iron, 4);
    ball(painter, {150, 236}, 34, QColor(206, 206, 200), 0.6);
    painter.setBrush(QColor(246, 244, 236));
    painter.drawEllipse(QPointF(150, 236), 25, 25);
    stroke(painter, curve({150, 236}, {156, 226}, {164, 220}), QColor(190, 30, 30), 2.4);
    for (const double dx : {-52.0, 52.0})
        stroke(painter, curve({150, 268}, {150 + dx * 0.5, 300}, {150 + dx, 334}), iron, 2);
    painter.fillPath(outline({{88, 332},
                              {96, 366},
                              {120, 374},
                              {150, 374},
                              {180, 374},
                              {204, 366},
                              {212, 332},
                              {180, 340},
                              {120, 340},
                              {88, 332}}),
                     QColor(176, 180, 182));
    airbrush(painter, {120, 348}, 24, 16, Qt::white, 0.7);
}

void drawBouquet(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    sheet.gradient({0, 0, 900, 1200}, {{0, {196, 200, 196}}, {0.7, {222, 216, 204}}, {1, {180, 160, 140}}});
    // The light of a window falls on the wall.
    sheet.soft({0, 0, 900, 900}, 26, [](QPainter& p) {
        for (int pane = 0; pane < 2; ++pane)
            p.fillPath(polygon({{500 + 180.0 * pane, 60},
                                {650 + 180.0 * pane, 20},
                                {560 + 180.0 * pane, 640},
                                {410 + 180.0 * pane, 680}}),
                       QColor(255, 248, 226, 170));
    });
    airbrush(painter, {60, 300}, 420, 700, QColor(90, 96, 104), 0.35);
    boards(sheet, {0, 960, 900, 240}, {182, 140, 100}, 3);
    sheet.soft({0, 950, 900, 20}, 5, [](QPainter& p) { p.fillRect(QRectF(-20, 952, 940, 14), QColor(120, 96, 76)); });
    sheet.soft({180, 1040, 720, 120}, 14, [](QPainter& p) {
        p.setBrush(QColor(56, 34, 24, 150));
        p.drawEllipse(QPointF(560, 1104), 270, 30);
    });
    // The vase: glass with water and stems.
    const QPainterPath vase = outline({{366, 740},
                                       {376, 800},
                                       {340, 850},
                                       {330, 930},
                                       {322, 1010},
                                       {340, 1090},
                                       {372, 1104},
                                       {410, 1112},
                                       {490, 1112},
                                       {528, 1104},
                                       {560, 1090},
                                       {578, 1010},
                                       {570, 930},
                                       {560, 850},
                                       {524, 800},
                                       {534, 740},
                                       {500, 752},
                                       {400, 752},
                                       {366, 740}});
    painter.fillPath(vase, QColor(196, 214, 216, 150));
    painter.save();
    painter.setClipPath(vase);
    painter.fillRect(QRectF(300, 836, 300, 290), QColor(150, 182, 180, 130));
    for (int i = 0; i < 22; ++i) {
        const double x = dice.in(390, 510);
        stroke(painter, curve({x, 700}, {450 + (x - 450) * 0.4, 880}, {450 - (x - 450) * dice.in(0.4, 1.6), 1090}),
               mixed(QColor(58, 92, 44), QColor(132, 164, 84), dice.in(0, 1)), dice.in(6, 11));
    }
    painter.fillRect(QRectF(300, 832, 300, 7), QColor(236, 246, 244, 150));
    painter.fillRect(QRectF(300, 839, 300, 4), QColor(70, 100, 100, 110));
    airbrush(painter, {340, 960}, 40, 150, QColor(40, 70, 76), 0.5);
    airbrush(painter, {560, 960}, 36, 150, QColor(50, 76, 80), 0.45);
    airbrush(painter, {520, 930}, 13, 110, Qt::white, 0.75, 4);
    airbrush(painter, {372, 900}, 7, 90, Qt::white, 0.6, -3);
    airbrush(painter, {450, 1098}, 100, 14, QColor(236, 246, 240), 0.7);
    painter.restore();
    painter.setPen(QPen(QColor(236, 246, 246, 190), 3));
    painter.setBrush(Qt::NoBrush);
    painter.drawPath(vase);
    painter.setPen(Qt::NoPen);

    const auto leaf = [&](QPointF from, double angle, double length, const QColor& green) {
        painter.save();
        painter.translate(from);
        painter.rotate(angle);
        const double half = length * dice.in(0.14, 0.2);
        QLinearGradient blade(0, -half, 0, half);
        blade.setColorAt(0, mixed(green, QColor(226, 240, 170), 0.35));
        blade.setColorAt(0.5, green);
        blade.setColorAt(1, mixed(green, QColor(10, 30, 16), 0.45));
        painter.fillPath(outline({{0, 0},
                                  {length * 0.25, -half * 1.3},
                                  {length * 0.7, -half},
                                  {length, 0},
                                  {length * 0.7, half},
                                  {length * 0.25, half * 1.3},
                                  {0, 0}}),
                         blade);
        stroke(painter, curve({0, 0}, {length * 0.5, -1}, {length * 0.94, 0}), withAlpha(QColor(220, 236, 170), 0.5),
               1.6);
        for (int vein = 1; vein < 8; ++vein)
            for (const double side : {-1.0, 1.0})
                stroke(painter,
                       curve({length * vein / 9.0, 0}, {length * (vein + 0.6) / 9.0, side * half * 0.4},
                             {length * (vein + 1.1) / 9.0, side * half * 0.75}),
                       withAlpha(QColor(200, 224, 150), 0.25), 0.8);
        painter.restore();
    };
    for (int i = 0; i < 70; ++i) {
        const double angle = dice.in(-200, 20), out = dice.in(60, 190);
        leaf({450 + out * std::cos(angle * 0.01745), 560 + out * std::sin(angle * 0.01745)}, angle + dice.in(-25, 25),
             dice.in(110, 190), mixed(QColor(46, 84, 44), QColor(104, 138, 70), dice.in(0, 1)));
    }
    const auto petal = [&](double length, double wide, const QColor& inner, const QColor& outer) {
        QLinearGradient colour(0, 0, length, 0);
        colour.setColorAt(0, inner);
        colour.setColorAt(1, outer);
        const QPainterPath shape = outline({{0, 0},
                                            {length * 0.2, -wide},
                                            {length * 0.85, -wide * 1.1},
                                            {length, -wide * 0.1},
                                            {length * 0.98, wide},
                                            {length * 0.3, wide},
                                            {0, 0}});
        painter.fillPath(shape, colour);
        stroke(painter, curve({length * 0.1, 0}, {length * 0.5, wide * 0.1}, {length * 0.9, 0}), withAlpha(inner, 0.35),
               1);
        painter.strokePath(shape, QPen(withAlpha(mixed(outer, Qt::white, 0.5), 0.45), 0.9));
    };
    const auto daisy = [&](QPointF at, double size) {
        for (int ring = 0; ring < 2; ++ring) {
            for (int i = 0; i < 17; ++i) {
                painter.save();
                painter.translate(at);
                painter.scale(1, 0.92);
                painter.rotate(i * 21.2 + ring * 10 + dice.in(-4, 4));
                petal(size * (1 - 0.12 * ring) * dice.in(0.92, 1.05), size * 0.12, QColor(206, 206, 196),
                      QColor(252, 250, 244));
                painter.restore();
            }
        }
        ball(painter, at, size * 0.3, QColor(236, 176, 36), 0.3);
        for (int i = 0; i < 60; ++i) {
            const double angle = dice.in(0, 6.283), out = size * 0.28 * std::sqrt(dice.in(0, 1));
            airbrush(painter, at + QPointF(out * std::cos(angle), out * std::sin(angle)), 1.8, 1.8,
                     i % 2 == 0 ? QColor(150, 84, 10) : QColor(255, 226, 110), 0.8);
        }
    };
    const auto rose = [&](QPointF at, double size, const QColor& colour) {
        airbrush(painter, at + QPointF(6, 14), size * 1.25, size * 1.2, QColor(20, 20, 16), 0.55);
        // Leaves of the flower from the outermost to the bud, each with its own shadow.
        const int rings = 7;
        for (int ring = 0; ring < rings; ++ring) {
            const double t = ring / (rings - 1.0), out = size * (1 - 0.86 * t);
            const int count = 7 - ring / 2;
            for (int i = 0; i < count; ++i) {
                const double angle = 360.0 / count * i + ring * 37 + dice.in(-9, 9);
                const QPointF centre = at + QPointF(std::cos(angle * 0.01745), std::sin(angle * 0.01745)) * out * 0.42 +
                                       QPointF(0, -size * 0.1 * t);
                const double light = 0.5 - 0.5 * std::sin((angle + 45) * 0.01745);
                painter.save();
                painter.translate(centre);
                painter.rotate(angle);
                QRadialGradient fill(QPointF(-out * 0.5, 0), out * 1.15);
                fill.setColorAt(0, mixed(colour, QColor(50, 4, 20), 0.62));
                fill.setColorAt(0.55, mixed(colour, QColor(70, 6, 26), 0.25 - 0.15 * light));
                fill.setColorAt(0.9, mixed(colour, QColor(255, 240, 232), 0.12 + 0.4 * light));
                fill.setColorAt(1, mixed(colour, QColor(255, 240, 232), 0.3 + 0.4 * light));
                const QPainterPath shape = outline({{-out * 0.4, 0},
                                                    {-out * 0.3, -out * 0.62},
                                                    {out * 0.34, -out * 0.7},
                                                    {out * 0.56, -out * 0.2},
                                                    {out * 0.66, out * 0.16},
                                                    {out * 0.4, out * 0.66},
                                                    {-out * 0.1, out * 0.6},
                                                    {-out * 0.3, out * 0.5},
                                                    {-out * 0.4, out * 0.2},
                                                    {-out * 0.4, 0}});
                painter.fillPath(shape, fill);
                painter.strokePath(shape, QPen(withAlpha(mixed(colour, QColor(50, 4, 20), 0.6), 0.35), 1.2));
                painter.restore();
            }
        }
        airbrush(painter, at + QPointF(0, -size * 0.1), size * 0.16, size * 0.14, mixed(colour, QColor(50, 4, 20), 0.7),
                 0.9);
    };
    const auto lavender = [&](QPointF foot, double angle, double tall) {
        painter.save();
        painter.translate(foot);
        painter.rotate(angle);
        stroke(painter, curve({0, 0}, {4, -tall * 0.5}, {0, -tall}), QColor(92, 122, 84), 3.4);
        for (int i = 0; i < 46; ++i) {
            const double t = i / 45.0;
            airbrush(painter, {dice.in(-11, 11) * (1 - 0.6 * t), -tall * (0.5 + 0.5 * t)}, 7, 9,
                     mixed(QColor(92, 74, 160), QColor(180, 160, 226), dice.in(0, 1)), 0.95, dice.in(-40, 40));
        }
        painter.restore();
    };
    for (int i = 0; i < 15; ++i)
        lavender({450 + dice.in(-90, 90), 500}, -62 + 8.9 * i + dice.in(-3, 3), dice.in(300, 390));
    for (int i = 0; i < 10; ++i) {
        const double angle = 3.3 + 0.35 * i;
        daisy({450 + 250 * std::cos(angle) + dice.in(-14, 14), 520 + 230 * std::sin(angle) + dice.in(-14, 14)},
              dice.in(54, 66));
    }
    for (int i = 0; i < 26; ++i)
        leaf({450 + dice.in(-210, 210), 470 + dice.in(-150, 190)}, dice.in(0, 360), dice.in(80, 120),
             mixed(QColor(46, 84, 44), QColor(96, 130, 66), dice.in(0, 1)));
    const struct {
        double x, y, size;
        QColor colour;
    } roses[] = {{330, 330, 82, {236, 150, 160}}, {560, 318, 84, {206, 40, 60}},   {224, 486, 80, {206, 40, 60}},
                 {676, 470, 82, {240, 176, 130}}, {446, 250, 70, {246, 214, 190}}, {320, 560, 88, {244, 206, 178}},
                 {590, 574, 90, {232, 140, 156}}, {452, 440, 104, {214, 48, 66}},  {446, 640, 84, {240, 170, 126}}};
    for (const auto& flower : roses)
        rose({flower.x, flower.y}, flower.size, flower.colour);
    daisy({380, 440 + 20}, 50);
    daisy({560, 450}, 54);
    daisy({520, 680}, 46);
    daisy({250, 630}, 50);
    for (int i = 0; i < 12; ++i)
        leaf({450 + dice.in(-150, 150), 690 + dice.in(-10, 40)}, dice.in(20, 160), dice.in(90, 150),
             mixed(QColor(40, 76, 40), QColor(96, 130, 66), dice.in(0, 1)));
    // Petals that have fallen.
    for (int i = 0; i < 6; ++i) {
        const QPointF at(dice.in(140, 760), dice.in(1090, 1170));
        airbrush(painter, at + QPointF(8, 7), 34, 10, QColor(50, 30, 20), 0.6);
        painter.save();
        painter.translate(at);
        painter.rotate(dice.in(-30, 210));
        painter.scale(1, 0.6);
        petal(42, 20, QColor(170, 30, 52), QColor(236, 130, 140));
        painter.restore();
    }
}

void drawCat(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    sheet.gradient({0, 0, 1200, 900}, {{0, {54, 44, 42}}, {1, {36, 28, 26}}});
    // The garden behind the panes, far out of focus.
    painter.save();
    painter.setClipRect(QRectF(190, 0, 820, 690));
    sheet.gradient({190, 0, 820, 690},
                   {{0, {214, 232, 240}}, {0.45, {236, 240, 214}}, {0.75, {150, 182, 104}}, {1, {96, 134, 70}}});
    sheet.soft({190, 0, 820, 700}, 22, [&](QPainter& p) {
        for (int i = 0; i < 90; ++i) {
            const double x = dice.in(170, 1030), y = dice.in(90, 560);
            p.setBrush(withAlpha(mixed(QColor(70, 116, 56), QColor(206, 220, 120), dice.in(0, 1)), 0.75));
            p.drawEllipse(QPointF(x, y), dice.in(20, 56), dice.in(18, 46));
        }
        p.fillRect(QRectF(330, 240, 34, 380), QColor(110, 86, 66));
        p.fillRect(QRectF(860, 200, 44, 420), QColor(104, 82, 64));
        for (int i = 0; i < 24; ++i) {
            p.setBrush(i % 2 == 0 ? QColor(232, 110, 120) : QColor(250, 206, 90));
            p.drawEllipse(QPointF(dice.in(190, 1010), dice.in(560, 680)), 13, 12);
        }
    });
    bokeh(sheet, {190, 60, 820, 420}, 40, 14, 40, {{255, 246, 206}, {236, 246, 170}, {255, 232, 160}}, 0.34);
    painter.restore();
    // The frame and the sill.
    const auto bar = [&](const QRectF& at, bool upright) {
        QLinearGradient paint(at.topLeft(), upright ? at.topRight() : at.bottomLeft());
        paint.setColorAt(0, QColor(236, 232, 222));
        paint.setColorAt(0.5, QColor(176, 168, 158));
        paint.setColorAt(1, QColor(104, 94, 88));
        painter.fillRect(at, paint);
    };
    bar({176, 0, 30, 700}, true);
    bar({994, 0, 30, 700}, true);
    bar({588, 0, 26, 690}, true);
    bar({176, 250, 848, 18}, false);
    QLinearGradient sill(0, 690, 0, 800);
    sill.setColorAt(0, QColor(252, 246, 230));
    sill.setColorAt(0.62, QColor(206, 194, 176));
    sill.setColorAt(0.63, QColor(120, 106, 96));
    sill.setColorAt(1, QColor(70, 60, 56));
    painter.fillRect(QRectF(60, 690, 1080, 110), sill);
    QPainterPath board;
    board.addRect(60, 690, 1080, 110);
    sheet.texture(board, 6, 0.7, 0.05);
    // Curtains, lit from behind in their folds.
    for (const double side : {-1.0, 1.0}) {
        QPainterPath cloth(QPointF(600 + side * 640, -10));
        cloth.lineTo(600 + side * 330, -10);
        cloth.cubicTo(QPointF(600 + side * 350, 300), QPointF(600 + side * 410, 500), QPointF(600 + side * 470, 640));
        cloth.cubicTo(QPointF(600 + side * 440, 760), QPointF(600 + side * 420, 820), QPointF(600 + side * 410, 910));
        cloth.lineTo(600 + side * 640, 910);
        cloth.closeSubpath();
        painter.fillPath(cloth, QColor(206, 176, 146, 232));
        painter.save();
        painter.setClipPath(cloth);
        for (int fold = 0; fold < 11; ++fold) {
            const double x = 600 + side * (350 + 28 * fold);
            airbrush(painter, {x, 260}, 10, 520, QColor(255, 240, 206), 0.5, side * (fold < 4 ? -10 + fold : -2));
            airbrush(painter, {x + side * 13, 300}, 11, 560, QColor(70, 40, 30), 0.55,
                     side * (fold < 4 ? -10 + fold : -2));
        }
        airbrush(painter, {600 + side * 620, 500}, 190, 620, QColor(20, 12, 10), 0.75);
        painter.restore();
        sheet.texture(cloth, 0.8, 0.8, 0.07);
        stroke(painter, curve({600 + side * 452, 640}, {600 + side * 540, 668}, {600 + side * 650, 650}),
               QColor(150, 96, 70), 15);
    }
    // A pot with a plant.
    painter.save();
    painter.translate(800, 0);
    airbrush(painter, {14, 704}, 90, 13, QColor(50, 36, 30), 0.6);
    for (int i = 0; i < 34; ++i) {
        const double angle = dice.in(-2.7, -0.45), length = dice.in(70, 170);
        const QPointF tip(std::cos(angle) * length, 590 + std::sin(angle) * length);
        const QColor green = mixed(QColor(40, 78, 40), QColor(150, 186, 84), dice.in(0, 1));
        stroke(painter, curve({0, 606}, {tip.x() * 0.3, tip.y() + 40}, tip), mixed(green, Qt::black, 0.2), 2.4);
        airbrush(painter, tip, 24, 13, green, 1, angle * 57.3);
        painter.save();
        painter.translate(tip);
        painter.rotate(angle * 57.3);
        painter.fillPath(outline({{-26, 0}, {-10, -15}, {14, -14}, {28, 0}, {14, 14}, {-10, 15}, {-26, 0}}), green);
        stroke(painter, curve({-26, 0}, {0, -1}, {26, 0}), QColor(226, 240, 160, 150), 1.2);
        painter.restore();
    }
    QLinearGradient clay(-60, 0, 60, 0);
    clay.setColorAt(0, QColor(214, 128, 88));
    clay.setColorAt(0.6, QColor(150, 78, 52));
    clay.setColorAt(1, QColor(86, 42, 32));
    painter.fillPath(polygon({{-56, 620}, {56, 620}, {42, 704}, {-42, 704}}), clay);
    painter.fillRect(QRectF(-62, 602, 124, 24), clay);
    airbrush(painter, {0, 628}, 60, 6, QColor(40, 16, 12), 0.6);
    painter.restore();

    // The cat, from behind, looking out; the light draws its edge.
    sheet.soft({280, 690, 330, 60}, 8, [](QPainter& p) {
        p.setBrush(QColor(40, 28, 22, 190));
        p.drawEllipse(QPointF(452, 716), 150, 20);
    });
    const QColor coat(126, 78, 42);
    const QPainterPath body = outline({{330, 704},
                                       {296, 640},
                                       {312, 560},
                                       {350, 500},
                                       {376, 458},
                                       {384, 430},
                                       {396, 408},
                                       {416, 392},
                                       {466, 392},
                                       {486, 410},
                                       {500, 436},
                                       {508, 466},
                                       {530, 512},
                                       {560, 566},
                                       {580, 650},
                                       {548, 708},
                                       {520, 724},
                                       {360, 724},
                                       {330, 704}});
    const QPainterPath skull = outline({{346, 362},
                                        {344, 314},
                                        {386, 284},
                                        {440, 284},
                                        {494, 284},
                                        {536, 314},
                                        {534, 362},
                                        {530, 408},
                                        {490, 432},
                                        {440, 432},
                                        {390, 432},
                                        {350, 408},
                                        {346, 362}});
    const QPainterPath ears = outline({{352, 340},
                                       {344, 292},
                                       {346, 258},
                                       {358, 238},
                                       {380, 250},
                                       {404, 276},
                                       {416, 296},
                                       {400, 306},
                                       {376, 318},
                                       {352, 340}})
                                  .united(outline({{528, 340},
                                                   {536, 292},
                                                   {534, 258},
                                                   {522, 238},
                                                   {500, 250},
                                                   {476, 276},
                                                   {464, 296},
                                                   {480, 306},
                                                   {504, 318},
                                                   {528, 340}}));
    // The tail hangs over the sill.
    QPainterPath tail(QPointF(540, 690));
    tail.cubicTo(QPointF(610, 720), QPointF(640, 760), QPointF(628, 830));
    tail.cubicTo(QPointF(620, 876), QPointF(580, 880), QPointF(574, 850));
    for (int i = 0; i <= 60; ++i) {
        const double t = i / 60.0;
        painter.setBrush(mixed(coat, QColor(40, 20, 12), std::sin(t * 34) > 0.2 ? 0.55 : 0.15));
        painter.drawEllipse(tail.pointAtPercent(t), 24 - 7 * t, 24 - 7 * t);
    }
    const QPainterPath cat = body.united(skull).united(ears);
    QLinearGradient fur(0, 230, 0, 720);
    fur.setColorAt(0, mixed(coat, QColor(255, 220, 160), 0.22));
    fur.setColorAt(0.5, coat);
    fur.setColorAt(1, mixed(coat, Qt::black, 0.35));
    painter.fillPath(cat, fur);
    painter.save();
    painter.setClipPath(cat);
    airbrush(painter, {440, 600}, 110, 150, mixed(coat, Qt::black, 0.6), 0.75);
    airbrush(painter, {440, 424}, 84, 26, mixed(coat, Qt::black, 0.7), 0.7);
    airbrush(painter, {440, 350}, 60, 60, mixed(coat, Qt::black, 0.5), 0.55);
    painter.restore();
    // Hairs all over, in darker stripes across the back.
    for (int i = 0; i < 20000; ++i) {
        const QPointF at(dice.in(290, 590), dice.in(220, 722));
        if (!cat.contains(at))
            continue;
        const bool head = at.y() < 420;
        const double dx = at.x() - 440;
        const double band =
            head ? std::sin(dx * 0.14)
                 : std::sin((at.y() - 0.0011 * dx * dx * (at.y() - 380) / 60) * 0.115 + 0.8 * std::sin(dx * 0.03));
        const double dark = smoothStep(0.25F, 0.75F, static_cast<float>(band)) * 0.62;
        const double rim = std::min(1.0, std::pow(std::abs(dx) / (head ? 92 : 70 + (at.y() - 420) * 0.24), 4));
        const QColor tone = mixed(mixed(mixed(coat, QColor(214, 160, 100), dice.in(0, 0.55)), QColor(34, 18, 12), dark),
                                  QColor(255, 232, 184), 0.6 * rim);
        const QPointF along = head ? QPointF(dx * 0.1, (at.y() - 330) * 0.08 + 5) : QPointF(dx * 0.05, 15);
        sheet.strand(at, at + along * 0.8 + QPointF(1, 0), at + along * 1.5 + QPointF(dice.in(-4, 4), dice.in(-2, 2)),
                     dice.in(0.9, 2.2), withAlpha(tone, 0.7));
    }
    for (int i = 0; i < 5200; ++i) {
        const double t = dice.in(0, 1);
        const QPointF at = cat.pointAtPercent(t);
        if (at.y() > 712)
            continue;
        const QPointF away = at - QPointF(440, at.y() < 420 ? 350 : 600);
        const double length = dice.in(5, 16) / std::hypot(away.x(), away.y());
        sheet.strand(at - away * length * 0.3, at + away * length * 0.3 + QPointF(0, 2),
                     at + away * length + QPointF(dice.in(-2, 2), 6), dice.in(0.8, 1.8),
                     withAlpha(mixed(QColor(255, 236, 196), coat, dice.in(0, 0.8)), 0.7));
    }
    for (const double side : {-1.0, 1.0}) {
        airbrush(painter, {440 + side * 72, 284}, 15, 30, QColor(236, 150, 120), 0.55, side * 14);
        for (int i = 0; i < 4; ++i)
            stroke(painter,
                   curve({440 + side * 90, 380.0 + 6 * i}, {440 + side * 118, 372.0 + 9 * i},
                         {440 + side * 142, 376.0 + 14 * i}),
                   QColor(255, 250, 236, 170), 1.1);
    }
    for (int i = 0; i < 500; ++i) {
        const double t = dice.in(0, 1);
        const QPointF at = tail.pointAtPercent(t) + QPointF(dice.in(-20, 20), dice.in(-8, 8));
        stroke(painter, curve(at, at + QPointF(2, 5), at + QPointF(dice.in(-5, 5), 11)),
               withAlpha(mixed(coat, QColor(240, 200, 140), dice.in(0, 0.8)), 0.45), 1.1);
    }
    // Light spills over everything.
    sheet.glow({600, 260}, 620, QColor(255, 246, 220), 0.32);
    sheet.glow({300, 200}, 240, QColor(255, 250, 230), 0.25);
}

} // namespace lumora::demo
