#include "Scenes.h"

#include <QLinearGradient>

#include <array>
#include <functional>
#include <vector>

namespace lumora::demo {
namespace {

Tint tint(const QColor& colour, float alpha = 1) {
    return {static_cast<float>(colour.red()), static_cast<float>(colour.green()), static_cast<float>(colour.blue()),
            alpha};
}

void sky(Sheet& sheet, double horizon, const QColor& high, const QColor& low, const QColor& cloud, float cover,
         std::uint32_t seed) {
    const Tint top = tint(high), bottom = tint(low), white = tint(cloud);
    const auto end = static_cast<float>(horizon);
    sheet.dots({0, 0, sheet.width(), horizon + 2}, 5, [&](float x, float y) {
        const float down = y / end;
        const Tint air = mixed(top, bottom, down * (1.4F - 0.4F * down));
        // Clouds lie flatter near the horizon.
        const float flat = 90 - 50 * down;
        const float mass = layeredNoise(x / 230, y / flat, 5, seed);
        const float lit = mass - layeredNoise(x / 230 + 0.05F, y / flat + 0.12F, 3, seed) + 0.5F;
        const float share = smoothStep(1 - cover, 1.25F - cover, mass) * 0.9F;
        return mixed(air, mixed(mixed(white, air, 0.35F), white, smoothStep(0.3F, 0.6F, lit)), share);
    });
}

// A range from edge to edge; rough is the height of its smallest rocks in units.
QPainterPath ridge(const Sheet& sheet, double base, double height, double wide, double rough, std::uint32_t seed) {
    QPainterPath path(QPointF(-20, sheet.height() + 20));
    for (double x = -20; x <= sheet.width() + 20; x += 2) {
        const auto at = static_cast<float>(x);
        const float body = layeredNoise(at / static_cast<float>(wide), 0.5F, 3, seed);
        const float rocks = layeredNoise(at / 18, 7.5F, 3, seed + 9);
        path.lineTo(x, base - height * body - rough * rocks);
    }
    path.lineTo(sheet.width() + 20, sheet.height() + 20);
    path.closeSubpath();
    return path;
}

void pine(Sheet& sheet, QPointF foot, double tall, const QColor& dark, const QColor& light) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    stroke(painter, curve(foot, foot - QPointF(0, tall / 2), foot - QPointF(0, tall)),
           mixed(dark, QColor(50, 34, 24), 0.5), tall * 0.018);
    const int rows = 44;
    for (int row = 0; row < rows; ++row) {
        const double t = (row + 0.5) / rows;
        const double reach = tall * (0.02 + 0.21 * std::pow(t, 0.85));
        const double y = foot.y() - tall * (1 - t * 0.94);
        for (int i = 0; i < 34; ++i) {
            const double out = dice.in(-1, 1) * reach;
            const QPointF from(foot.x() + out * 0.1, y);
            const QPointF to(foot.x() + out, y + std::abs(out) * 0.4 + dice.in(-0.01, 0.03) * tall);
            sheet.strand(from, {from.x() + out * 0.6, y - tall * 0.004}, to, tall * dice.in(0.006, 0.014),
                         mixed(dark, light, dice.in(0, out < 0 ? 0.8 : 0.3)));
        }
    }
}

void grass(Sheet& sheet, const QRectF& area, int count, double tall, const QColor& dark, const QColor& light) {
    Dice& dice = sheet.dice();
    for (int i = 0; i < count; ++i) {
        // From far to near.
        const double near = (i + dice.in(0, 1)) / count;
        const QPointF foot(dice.in(area.left(), area.right()), area.top() + area.height() * near);
        const double length = tall * (0.25 + 0.75 * near) * dice.in(0.5, 1.2);
        const double lean = dice.in(-0.5, 0.7) * length;
        sheet.strand(foot, foot - QPointF(lean * 0.2, length * 0.6), foot + QPointF(lean, -length), 0.8 + 2.4 * near,
                     mixed(dark, light, dice.in(0, 1)));
    }
}

void gull(QPainter& painter, QPointF at, double size) {
    QPainterPath wings(at + QPointF(-size, -size * 0.25));
    wings.quadTo(at + QPointF(-size * 0.4, -size * 0.55), at);
    wings.quadTo(at + QPointF(size * 0.45, -size * 0.6), at + QPointF(size, -size * 0.18));
    stroke(painter, wings, QColor(70, 78, 90, 220), size * 0.11);
}

} // namespace

void drawBeach(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    const double horizon = 352;
    sky(sheet, horizon, {70, 136, 206}, {206, 226, 236}, {255, 252, 246}, 0.56F, 3);
    // The sea: the colour of depth, waves that come closer, foam at the shore.
    const auto shore = [](float x) {
        return 588 + 16 * std::sin(x / 170) + 9 * std::sin(x / 61 + 1) + 22 * (smoothNoise(x / 90, 2, 4) - 0.5F);
    };
    const Tint deep{34, 98, 142}, shallow{96, 184, 188}, foam{246, 250, 250}, wet{176, 148, 114}, dry{228, 204, 164};
    sheet.dots({0, horizon, 1200, 300}, 2, [&](float x, float y) {
        const float down = y - 352, near = shore(x) - y;
        const float away = 1 + down * 0.09F;
        const float wave = layeredNoise(x / (9 * away) + 3, 26 * std::log(away + 0.6F), 3, 11);
        Tint water = mixed(deep, shallow, smoothStep(30, 235, down));
        water = mixed(water, {22, 74, 112}, 0.55F * smoothStep(0.52F, 0.3F, wave));
        water = mixed(water, {214, 236, 242}, 0.6F * smoothStep(0.62F, 0.8F, wave));
        // Two breakers and the edge of the last one.
        for (const float back : {6.0F, 52.0F, 118.0F}) {
            const float off = near - back - 10 * (smoothNoise(x / 70, back, 8) - 0.5F) * (1 + back / 60);
            const float lace = layeredNoise(x / 11, y / 5, 3, 21);
            const float band = smoothStep(-2, 3, off) * (1 - smoothStep(6, 26, off));
            water = mixed(water, {30, 92, 112},
                          0.5F * smoothStep(24, 30, off) * (1 - smoothStep(30, 48, off)) * (back > 10 ? 1.0F : 0.0F));
            water = mixed(water, foam, band * smoothStep(0.36F, 0.6F, lace));
        }
        water.a = smoothStep(-3, 2, near);
        return water;
    });
    painter.setCompositionMode(QPainter::CompositionMode_DestinationOver);
    painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
    sheet.dots({0, 560, 1200, 340}, 2, [&](float x, float y) {
        const float behind = y - shore(x);
        const float away = (y - 352) / 130;
        const float dune = layeredNoise(x / (60 * away), y / (13 * away), 3, 31) - 0.5F;
        Tint sand = mixed(dry, {188, 158, 118}, std::clamp(0.3F + 1.5F * dune, 0.0F, 1.0F));
        sand = mixed(sand, {255, 240, 214}, 0.4F * smoothStep(0.1F, 0.3F, -dune));
        const float moist = 1 - smoothStep(6, 52, behind);
        sand = mixed(sand, mixed(wet, {170, 190, 200}, 0.5F * smoothStep(0.4F, 0.7F, smoothNoise(x / 120, y / 9, 6))),
                     moist);
        sand.a = smoothStep(-7, -3, behind);
        return sand;
    });
    QPainterPath sand;
    sand.addRect(0, 640, 1200, 260);
    sheet.texture(sand, 1.2, 0.8, 0.12);
    // A boat far out, gulls.
    painter.fillPath(polygon({{318, 351}, {366, 351}, {358, 360}, {326, 360}}), QColor(236, 236, 232));
    painter.fillPath(outline({{343, 292},
                              {350, 310},
                              {366, 336},
                              {372, 346},
                              {360, 348},
                              {350, 348},
                              {343, 348},
                              {343, 330},
                              {343, 310},
                              {343, 292}}),
                     QColor(250, 248, 240));
    painter.fillPath(outline({{340, 300},
                              {334, 320},
                              {324, 338},
                              {318, 346},
                              {326, 348},
                              {334, 348},
                              {340, 348},
                              {340, 330},
                              {340, 310},
                              {340, 300}}),
                     QColor(214, 84, 66));
    for (const auto& [x, y, size] : {std::array{520.0, 150.0, 22.0}, {584.0, 190.0, 16.0}, {470.0, 214.0, 12.0}})
        gull(painter, {x, y}, size);

    // The parasol's shadow, the parasol, and grandmother below it.
    sheet.soft({520, 700, 520, 130}, 7, [](QPainter& p) {
        p.setBrush(QColor(92, 66, 52, 150));
        p.drawEllipse(QPointF(770, 772), 236, 34);
        p.drawRect(QRectF(820, 766, 170, 20));
    });
    stroke(painter, curve({868, 330}, {858, 560}, {846, 790}), QColor(206, 196, 180), 9);
    stroke(painter, curve({866, 330}, {856, 560}, {844, 790}), QColor(246, 242, 230), 3);
    const QPointF peak(872, 268);
    const auto rim = [](double t) {
        return QPointF(572 + 596 * t,
                       462 - 66 * t + 40 * (1 - std::pow(2 * t - 1, 2)) + 8 * std::abs(std::sin(t * 8 * 3.14159)));
    };
    for (int i = 0; i < 8; ++i) {
        const double a = i / 8.0, b = (i + 1) / 8.0;
        const auto side = [&](double t) {
            return peak + (rim(t) - peak) * 0.5 + QPointF((t - 0.5) * 100, -64 + 40 * std::pow(2 * t - 1, 2));
        };
        QPainterPath panel(peak);
        panel.quadTo(side(a), rim(a));
        panel.quadTo(rim((a + b) / 2) + QPointF(0, -7), rim(b));
        panel.quadTo(side(b), peak);
        QLinearGradient cloth(peak, rim((a + b) / 2));
        const QColor plain = i % 2 == 0 ? QColor(214, 62, 54) : QColor(250, 244, 232);
        const double light = 1 - 0.9 * a;
        cloth.setColorAt(0, mixed(plain, Qt::white, 0.35 * light));
        cloth.setColorAt(0.7, mixed(plain, QColor(60, 30, 50), 0.28 * (1 - light)));
        cloth.setColorAt(1, mixed(plain, QColor(60, 30, 50), 0.1 + 0.3 * (1 - light)));
        painter.fillPath(panel, cloth);
    }
    painter.setBrush(QColor(240, 236, 226));
    painter.drawEllipse(peak + QPointF(0, -5), 7, 9);

    // A deck chair seen from behind, grandmother's shoulders, arm and hat above it.
    const QColor wood(150, 104, 66), skin(220, 168, 138), dress(112, 108, 166);
    stroke(painter, curve({626, 792}, {650, 730}, {690, 690}), mixed(wood, Qt::black, 0.25), 9);
    stroke(painter, curve({822, 782}, {800, 730}, {770, 690}), mixed(wood, Qt::black, 0.3), 9);
    painter.fillPath(outline({{640, 640},
                              {640, 590},
                              {660, 566},
                              {694, 560},
                              {704, 552},
                              {702, 530},
                              {702, 516},
                              {738, 516},
                              {738, 530},
                              {736, 552},
                              {746, 560},
                              {780, 566},
                              {800, 590},
                              {800, 640},
                              {760, 680},
                              {680, 680},
                              {640, 640}}),
                     dress);
    painter.fillPath(outline({{700, 560},
                              {704, 550},
                              {702, 530},
                              {702, 510},
                              {738, 510},
                              {738, 530},
                              {736, 550},
                              {740, 560},
                              {728, 572},
                              {712, 572},
                              {700, 560}}),
                     skin);
    airbrush(painter, {720, 548}, 26, 22, mixed(skin, QColor(80, 30, 20), 0.6), 0.7);
    airbrush(painter, {664, 590}, 40, 26, Qt::white, 0.3);
    painter.fillPath(outline({{790, 584},
                              {816, 600},
                              {838, 640},
                              {838, 668},
                              {836, 680},
                              {818, 682},
                              {812, 670},
                              {806, 644},
                              {796, 626},
                              {786, 616},
                              {790, 584}}),
                     skin);
    airbrush(painter, {812, 620}, 14, 40, mixed(skin, QColor(80, 30, 20), 0.5), 0.5, -24);
    stroke(painter, curve({634, 600}, {642, 700}, {662, 800}), wood, 11);
    stroke(painter, curve({804, 600}, {796, 700}, {778, 794}), mixed(wood, Qt::black, 0.2), 11);
    const QPainterPath canvas = outline({{634, 606},
                                         {680, 634},
                                         {760, 634},
                                         {806, 606},
                                         {802, 660},
                                         {792, 724},
                                         {782, 766},
                                         {740, 784},
                                         {700, 784},
                                         {656, 768},
                                         {648, 724},
                                         {638, 660},
                                         {634, 606}});
    painter.fillPath(canvas, QColor(242, 236, 220));
    painter.save();
    painter.setClipPath(canvas);
    for (int i = 0; i < 7; ++i)
        painter.fillPath(
            polygon({{640.0 + 26 * i, 590}, {653.0 + 26 * i, 590}, {670.0 + 17 * i, 800}, {661.0 + 17 * i, 800}}),
            QColor(52, 104, 150));
    airbrush(painter, {720, 700}, 40, 66, Qt::white, 0.25);
    airbrush(painter, {796, 700}, 50, 140, QColor(40, 30, 60), 0.5);
    airbrush(painter, {720, 622}, 90, 16, QColor(40, 30, 60), 0.5);
    painter.restore();
    sheet.texture(canvas, 0.9, 0.9, 0.06);
    stroke(painter, curve({628, 604}, {720, 640}, {810, 604}), mixed(wood, Qt::white, 0.1), 7);
    airbrush(painter, {720, 508}, 44, 34, QColor(206, 200, 196), 1);
    airbrush(painter, {720, 520}, 30, 24, QColor(176, 168, 166), 0.9);
    const QColor straw(236, 206, 140);
    painter.setBrush(mixed(straw, QColor(120, 80, 40), 0.35));
    painter.drawEllipse(QPointF(722, 497), 90, 23);
    painter.setBrush(straw);
    painter.drawEllipse(QPointF(720, 492), 90, 22);
    painter.fillPath(outline({{674, 492},
                              {674, 446},
                              {696, 432},
                              {720, 432},
                              {744, 432},
                              {768, 446},
                              {768, 492},
                              {746, 506},
                              {698, 506},
                              {674, 492}}),
                     mixed(straw, Qt::white, 0.25));
    painter.fillPath(outline({{673, 492},
                              {673, 482},
                              {674, 476},
                              {675, 472},
                              {698, 486},
                              {744, 486},
                              {767, 472},
                              {768, 478},
                              {768, 484},
                              {768, 492},
                              {746, 506},
                              {698, 506},
                              {673, 492}}),
                     QColor(176, 62, 70));
    airbrush(painter, {754, 470}, 34, 46, QColor(120, 78, 40), 0.45);
    QPainterPath hat;
    hat.addEllipse(QPointF(720, 492), 90, 22);
    sheet.texture(hat, 0.8, 0.8, 0.12);
    // A ball and a bag.
    sheet.soft({380, 790, 140, 50}, 5, [](QPainter& p) {
        p.setBrush(QColor(92, 66, 52, 170));
        p.drawEllipse(QPointF(462, 822), 52, 12);
    });
    QPainterPath ball;
    ball.addEllipse(QPointF(440, 786), 42, 42);
    painter.fillPath(ball, QColor(246, 240, 226));
    painter.save();
    painter.setClipPath(ball);
    painter.fillPath(outline({{440, 744}, {400, 760}, {392, 800}, {420, 832}, {360, 830}, {380, 740}, {440, 744}}),
                     QColor(44, 128, 176));
    painter.fillPath(outline({{440, 744}, {470, 760}, {474, 800}, {452, 832}, {500, 830}, {500, 740}, {440, 744}}),
                     QColor(232, 178, 52));
    airbrush(painter, {466, 812}, 60, 50, QColor(60, 40, 50), 0.6);
    airbrush(painter, {424, 766}, 20, 16, Qt::white, 0.8);
    painter.restore();
    for (int i = 0; i < 9; ++i) {
        const QPointF step(80 + 34 * i + dice.in(-4, 4), 866 - 17 * i + (i % 2) * 12);
        airbrush(painter, step, 15 - 0.6 * i, 6 - 0.25 * i, QColor(120, 92, 62), 0.65, -26);
        airbrush(painter, step + QPointF(2, 5), 13, 3, QColor(255, 240, 214), 0.5, -26);
    }
    sheet.glow({60, 40}, 620, QColor(255, 246, 220), 0.4);
}

void drawSunset(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    const float sunX = 760, sunY = 470;
    const Tint high{46, 50, 104}, middle{150, 84, 130}, low{252, 150, 72};
    sheet.dots({0, 0, 1200, 660}, 4, [&](float x, float y) {
        const float down = y / 560;
        Tint air = down < 0.55F ? mixed(high, middle, down / 0.55F)
                                : mixed(middle, low, std::min(1.0F, (down - 0.55F) / 0.42F));
        const float far = std::hypot((x - sunX) / 1.5F, y - sunY);
        air = mixed(air, {255, 206, 120}, 0.85F * std::exp(-far / 130));
        const float lean = y - x * 0.06F;
        const float mass = layeredNoise(x / 300, lean / (62 - 34 * down), 5, 8);
        const float below = layeredNoise(x / 300, (lean + 9) / (62 - 34 * down), 4, 8);
        const float share = smoothStep(0.46F, 0.7F, mass) * (0.95F - 0.35F * down);
        const Tint dark = mixed({72, 56, 104}, {170, 84, 92}, down);
        const Tint lit = mixed({255, 132, 96}, {255, 206, 126}, std::exp(-far / 260));
        return mixed(air, mixed(dark, lit, smoothStep(-0.03F, 0.12F, mass - below + 0.16F * std::exp(-far / 300))),
                     share);
    });
    sheet.glow({sunX, sunY}, 300, QColor(255, 176, 84), 0.7);
    airbrush(painter, {sunX, sunY}, 62, 62, QColor(255, 248, 220), 1);
    painter.setBrush(QColor(255, 250, 226));
    painter.drawEllipse(QPointF(sunX, sunY), 33, 33);
    painter.fillPath(ridge(sheet, 600, 120, 380, 3, 5), QColor(176, 96, 104));
    sheet.glow({sunX, sunY + 30}, 260, QColor(255, 170, 80), 0.6);
    painter.fillPath(ridge(sheet, 624, 90, 240, 4, 15), QColor(132, 72, 96));

    // The town: rows of houses, the nearer the darker and the sharper.
    const auto row = [&](double base, double size, const QColor& wall, double lights) {
        for (double x = -size; x < 1200 + size;) {
            const double wide = size * dice.in(0.7, 1.5), tall = size * dice.in(0.7, 1.8), ground = base + size * 3;
            const QColor own = mixed(wall, Qt::black, dice.in(0, 0.2));
            const double top = base - tall;
            painter.fillRect(QRectF(x, top, wide, ground - top), own);
            // The roof; its edge towards the sun shines.
            const double roof = size * dice.in(0.25, 0.6);
            const QPointF left(x - size * 0.06, top), right(x + wide + size * 0.06, top),
                crest(x + wide * dice.in(0.35, 0.65), top - roof);
            painter.fillPath(polygon({left, crest, right}), mixed(own, Qt::black, 0.25));
            stroke(painter,
                   x + wide / 2 < sunX ? curve(crest, (crest + right) / 2, right)
                                       : curve(left, (crest + left) / 2, crest),
                   withAlpha(QColor(255, 170, 100), 0.35 + 0.3 * lights), size * 0.016);
            if (dice.upTo(3) > 0)
                painter.fillRect(QRectF(x + wide * 0.7, top - roof * 0.9, size * 0.1, roof * 0.8),
                                 mixed(own, Qt::black, 0.35));
            for (double wy = top + size * 0.2; wy < base + size * 2; wy += size * 0.34) {
                for (double wx = x + size * 0.14; wx < x + wide - size * 0.2; wx += size * 0.26) {
                    if (dice.in(0, 1) < lights) {
                        const QRectF pane(wx, wy, size * 0.1, size * 0.16);
                        painter.fillRect(pane, mixed(QColor(255, 190, 96), QColor(255, 226, 160), dice.in(0, 1)));
                        painter.fillRect(QRectF(pane.center().x() - size * 0.006, wy, size * 0.012, size * 0.16),
                                         withAlpha(own, 0.9));
                    } else if (dice.upTo(2) == 0) {
                        painter.fillRect(QRectF(wx, wy, size * 0.1, size * 0.16),
                                         mixed(own, QColor(180, 120, 140), 0.2));
                    }
                }
            }
            x += wide + size * dice.in(-0.05, 0.12);
        }
    };
    row(650, 26, {150, 84, 100}, 0.06);
    // A church between the houses.
    const QColor stone(104, 58, 84);
    painter.fillRect(QRectF(412, 486, 44, 240), stone);
    painter.fillPath(polygon({{406, 488}, {434, 356}, {462, 488}}), mixed(stone, Qt::black, 0.2));
    stroke(painter, curve({434, 330}, {434, 344}, {434, 360}), mixed(stone, Qt::black, 0.3), 3);
    stroke(painter, curve({426, 339}, {434, 339}, {442, 339}), mixed(stone, Qt::black, 0.3), 3);
    stroke(painter, curve({434, 358}, {448, 420}, {461, 486}), QColor(255, 170, 100, 190), 2);
    painter.fillRect(QRectF(428, 506, 12, 24), QColor(60, 32, 56));
    painter.fillRect(QRectF(456, 600, 130, 120), stone);
    painter.fillPath(polygon({{450, 602}, {480, 556}, {566, 556}, {594, 602}}), mixed(stone, Qt::black, 0.2));
    row(694, 42, {104, 58, 86}, 0.16);
    sheet.glow({sunX, 640}, 420, QColor(255, 140, 80), 0.35);
    row(752, 66, {70, 40, 68}, 0.24);
    row(836, 104, {38, 24, 46}, 0.3);
    // Aerials and a cat's worth of wires on the nearest roofs.
    for (const double x : {170.0, 1010.0}) {
        stroke(painter, curve({x, 600}, {x, 660}, {x, 740}), QColor(26, 16, 32), 2.4);
        for (int i = 0; i < 4; ++i)
            stroke(painter,
                   curve({x - 22 + 3 * i, 606.0 + 10 * i}, {x, 608.0 + 10 * i}, {x + 22 - 3 * i, 606.0 + 10 * i}),
                   QColor(26, 16, 32), 1.6);
    }
    stroke(painter, curve({170, 640}, {600, 716}, {1010, 640}), QColor(26, 16, 32, 210), 1.5);
    for (int i = 0; i < 7; ++i) {
        const double t = 0.3 + 0.03 * i + dice.in(0, 0.01);
        const QPointF at = curve({170, 640}, {600, 716}, {1010, 640}).pointAtPercent(t) + QPointF(0, -5);
        painter.setBrush(QColor(24, 14, 28));
        painter.drawEllipse(at, 5, 6);
        painter.drawEllipse(at + QPointF(3, -6), 3.4, 3.4);
    }
    for (const auto& [x, y, size] :
         {std::array{300.0, 230.0, 13.0}, {340.0, 250.0, 10.0}, {364.0, 222.0, 9.0}, {280.0, 262.0, 8.0}})
        gull(painter, {x, y}, size);
}

void drawMountains(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    const double shore = 556;
    sky(sheet, shore, {52, 112, 190}, {198, 220, 236}, {255, 253, 250}, 0.55F, 14);
    painter.fillPath(ridge(sheet, 420, 200, 300, 8, 61), QColor(150, 178, 206));
    // The massif: where the ground lies in its heights, turned to the light or away from it.
    const auto crest = [](float x) {
        const auto peak = [x](float at, float tall, float left, float right) {
            const float off = (x - at) / (x < at ? left : right);
            return tall / (1 + std::abs(off) + off * off * 0.6F);
        };
        return 536 -
               0.9F * std::max({peak(430, 440, 190, 260), peak(640, 330, 120, 150), peak(262, 270, 150, 120),
                                peak(90, 290, 260, 190), peak(980, 360, 170, 210), peak(836, 250, 120, 120),
                                peak(1130, 300, 120, 200)}) -
               70 * (layeredNoise(x / 70, 3.3F, 5, 71) - 0.45F);
    };
    std::vector<float> crests;
    for (int i = 0; i <= 2400; ++i)
        crests.push_back(crest(static_cast<float>(i) / 2));
    const auto ground = [&](float x, float y) {
        return 1 - std::abs(2 * layeredNoise(x / 105 + y / 300, y / 150 - x / 520, 5, 77) - 1);
    };
    sheet.dots({0, 60, 1200, shore - 58}, 2, [&](float x, float y) {
        const float below = y - crests[static_cast<std::size_t>(x * 2)];
        if (below < 0)
            return Tint{0, 0, 0, 0};
        const float lit = std::clamp(0.5F + 7 * (ground(x, y) - ground(x + 2.2F, y + 1.2F)), 0.0F, 1.0F);
        const Tint rock = mixed({58, 66, 88}, {158, 142, 128}, lit);
        const Tint snow = mixed({132, 158, 200}, {255, 252, 246}, smoothStep(0.2F, 0.7F, lit));
        const float line = 306 + 150 * (layeredNoise(x / 60, y / 60, 3, 91) - 0.5F);
        const float white =
            smoothStep(30, -50, y - line) * smoothStep(0.12F, 0.34F, lit + 0.25F * smoothNoise(x / 5, y / 7, 17));
        Tint face = mixed(rock, snow, white);
        face = mixed(face, {92, 118, 96}, 0.75F * smoothStep(390, 510, y + 90 * layeredNoise(x / 50, y / 40, 3, 33)));
        face = mixed(face, {176, 200, 222}, 0.16F + 0.36F * smoothStep(330, 570, y));
        face.a = smoothStep(0, 1.6F, below);
        return face;
    });
    // Woods down to the lake, and mist above it.
    for (int band = 0; band < 3; ++band) {
        const QColor dark = mixed(QColor(30, 58, 52), QColor(150, 180, 196), 0.42 - 0.17 * band);
        painter.fillPath(ridge(sheet, 548 + 6 * band, 34, 150, 4, static_cast<std::uint32_t>(51 + band)), dark);
        for (int i = 0; i < 330; ++i) {
            const double x = dice.in(-10, 1210);
            const double foot =
                534 + 12 * band - 26 * layeredNoise(static_cast<float>(x / 150), static_cast<float>(band), 3, 51);
            const double tall = dice.in(16, 30) * (1 + 0.25 * band);
            painter.fillPath(polygon({{x - tall * 0.2, foot + 30},
                                      {x - tall * 0.17, foot},
                                      {x, foot - tall},
                                      {x + tall * 0.17, foot},
                                      {x + tall * 0.2, foot + 30}}),
                             mixed(dark, QColor(90, 120, 80), dice.in(0, 0.35)));
        }
    }
    sheet.soft({0, 486, 1200, 80}, 14, [](QPainter& p) {
        p.setBrush(QColor(226, 236, 244, 120));
        p.drawEllipse(QPointF(420, 540), 420, 12);
        p.drawEllipse(QPointF(980, 528), 260, 10);
    });
    sheet.mirror(shore, 900, 12, QColor(40, 78, 104), 0.42);
    QPainterPath lake;
    lake.addRect(0, shore, 1200, 1.5);
    painter.fillPath(lake, QColor(220, 232, 238, 150));
    // The near shore: meadow, stones, flowers, two firs.
    QPainterPath meadow(QPointF(-10, 910));
    meadow.lineTo(-10, 770);
    meadow.cubicTo(QPointF(160, 770), QPointF(300, 836), QPointF(520, 850));
    meadow.cubicTo(QPointF(760, 866), QPointF(980, 850), QPointF(1210, 806));
    meadow.lineTo(1210, 910);
    meadow.closeSubpath();
    painter.fillPath(meadow.translated(0, -12), QColor(70, 92, 48));
    for (int i = 0; i < 26; ++i) {
        const double x = dice.in(120, 1180), size = dice.in(6, 20);
        const QPointF at(x, 838 + 14 * std::sin(x / 160) - (x > 760 ? (x - 760) * 0.06 : 0) -
                                (x < 400 ? (400 - x) * 0.16 : 0));
        QPainterPath stone;
        stone.addEllipse(at, size, size * 0.55);
        painter.fillPath(stone, QColor(108, 108, 106));
        airbrush(painter, at + QPointF(-size * 0.3, -size * 0.25), size * 0.7, size * 0.35, QColor(206, 202, 194), 0.8);
        airbrush(painter, at + QPointF(size * 0.1, size * 0.45), size, size * 0.3, QColor(20, 28, 26), 0.7);
    }
    grass(sheet, {-10, 786, 1220, 130}, 5200, 34, {38, 62, 28}, {150, 168, 78});
    for (int i = 0; i < 130; ++i) {
        const QPointF at(dice.in(0, 1200), dice.in(852, 900));
        const QColor petal = i % 3 == 0   ? QColor(250, 214, 70)
                             : i % 3 == 1 ? QColor(246, 244, 238)
                                          : QColor(150, 104, 190);
        painter.setBrush(petal);
        for (int leaf = 0; leaf < 5; ++leaf)
            painter.drawEllipse(at + QPointF(3 * std::cos(leaf * 1.257), 2.2 * std::sin(leaf * 1.257)), 2, 1.7);
        painter.setBrush(QColor(190, 130, 30));
        painter.drawEllipse(at, 1.3, 1.1);
    }
    pine(sheet, {96, 872}, 520, {16, 38, 30}, {78, 110, 62});
    pine(sheet, {22, 900}, 430, {14, 32, 26}, {66, 96, 56});
    pine(sheet, {1128, 880}, 440, {16, 38, 30}, {78, 110, 62});
    sheet.glow({80, 0}, 700, QColor(255, 244, 214), 0.3);
}

void drawSnow(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    sheet.gradient({0, 0, 1000, 620}, {{0, {128, 152, 190}}, {0.6, {196, 206, 224}}, {1, {242, 216, 206}}});
    // Woods in the haze.
    sheet.soft({0, 280, 1000, 300}, 5, [&](QPainter& p) {
        for (int i = 0; i < 110; ++i) {
            const double x = dice.in(-10, 1010), tall = dice.in(90, 210);
            p.fillPath(polygon({{x - tall * 0.14, 560}, {x, 560 - tall}, {x + tall * 0.14, 560}}),
                       mixed(QColor(150, 166, 194), QColor(196, 206, 222), dice.in(0, 1)));
        }
    });
    sheet.dots({0, 520, 1000, 480}, 2, [&](float x, float y) {
        const float edge = 548 + 16 * std::sin(x / 150) + 8 * std::sin(x / 57);
        const float away = (y - 440) / 160;
        const float drift = layeredNoise(x / (130 * away) + 2, y / (34 * away), 4, 9);
        const float turned = drift - layeredNoise(x / (130 * away) + 2.09F, y / (34 * away) + 0.14F, 4, 9);
        Tint snow = mixed({164, 184, 220}, {252, 248, 244}, std::clamp(0.62F + 3.2F * turned, 0.0F, 1.0F));
        snow = mixed(snow, {255, 226, 206}, 0.25F * smoothStep(620, 540, y));
        snow.a = smoothStep(0, 3, y - edge);
        return snow;
    });
    // A house with lights on.
    const QColor wall(122, 78, 60);
    painter.fillRect(QRectF(560, 430, 236, 150), wall);
    for (int i = 0; i < 11; ++i)
        painter.fillRect(QRectF(560, 434.0 + 14 * i, 236, 1.6), mixed(wall, Qt::black, 0.4));
    painter.fillPath(polygon({{700, 430}, {748, 372}, {796, 430}}), mixed(wall, Qt::black, 0.12));
    painter.fillPath(outline({{536, 434}, {560, 400}, {586, 360}, {606, 346}, {650, 338}, {710, 338}, {752, 346},
                              {780, 366}, {806, 404}, {824, 432}, {826, 446}, {806, 446}, {798, 436}, {780, 410},
                              {764, 388}, {748, 374}, {730, 392}, {712, 418}, {700, 440}, {650, 446}, {590, 446},
                              {544, 446}, {530, 446}, {528, 440}, {536, 434}}),
                     QColor(240, 240, 246));
    airbrush(painter, {640, 436}, 120, 12, QColor(140, 160, 204), 0.8);
    painter.fillRect(QRectF(628, 300, 30, 52), QColor(104, 66, 56));
    painter.fillRect(QRectF(624, 292, 38, 12), QColor(244, 244, 248));
    sheet.soft({560, 80, 200, 220}, 9, [&](QPainter& p) {
        for (int i = 0; i < 16; ++i)
            airbrush(p, {642 + 3.2 * i + dice.in(-8, 8), 286.0 - 13 * i}, 12 + 2.2 * i, 11 + 1.5 * i,
                     QColor(236, 236, 242), 0.42);
    });
    for (const QRectF& pane : {QRectF(588, 476, 44, 54), QRectF(664, 476, 44, 54), QRectF(736, 400, 24, 26)}) {
        painter.fillRect(pane.adjusted(-5, -5, 5, 5), QColor(236, 230, 222));
        QLinearGradient lamp(pane.topLeft(), pane.bottomLeft());
        lamp.setColorAt(0, QColor(255, 226, 150));
        lamp.setColorAt(1, QColor(250, 168, 74));
        painter.fillRect(pane, lamp);
        painter.fillRect(QRectF(pane.center().x() - 1.5, pane.top(), 3, pane.height()), QColor(236, 230, 222));
        painter.fillRect(QRectF(pane.left(), pane.center().y() - 1.5, pane.width(), 3), QColor(236, 230, 222));
        airbrush(painter, {pane.center().x(), pane.bottom() + 7}, pane.width() * 0.7, 6, Qt::white, 1);
        sheet.glow(pane.center(), 90, QColor(255, 180, 90), 0.4);
    }
    painter.fillRect(QRectF(738, 494, 40, 88), QColor(70, 40, 34));
    painter.fillRect(QRectF(742, 498, 32, 84), QColor(126, 48, 40));
    sheet.glow({650, 620}, 150, QColor(255, 190, 110), 0.35);
    airbrush(painter, {680, 588}, 170, 16, QColor(236, 238, 246), 1);

    // The path to the door, trodden.
    QPainterPath path(QPointF(740, 588));
    path.cubicTo(QPointF(720, 680), QPointF(560, 740), QPointF(470, 1010));
    path.lineTo(660, 1010);
    path.cubicTo(QPointF(690, 800), QPointF(770, 690), QPointF(774, 588));
    path.closeSubpath();
    sheet.soft({440, 580, 350, 430}, 6, [&](QPainter& p) { p.fillPath(path, QColor(150, 170, 208, 120)); });
    for (int i = 0; i < 26; ++i) {
        const double t = i / 25.0;
        const QPointF at(756 - 60 * t - 150 * t * t + (i % 2 == 0 ? -9 : 9) * (0.5 + 1.2 * t), 604 + 380 * t * t);
        airbrush(painter, at, 4 + 13 * t, 2 + 6 * t, QColor(96, 118, 164), 0.7);
        airbrush(painter, at + QPointF(0, 3 + 5 * t), 4 + 11 * t, 1 + 2.5 * t, Qt::white, 0.7);
    }
    // A fence under caps of snow.
    for (int i = 0; i < 9; ++i) {
        const double x = 20 + 58 * i - i * i * 0.6, y = 700 - 9.0 * i, tall = 92 - 4.4 * i;
        painter.fillRect(QRectF(x - 60, y - tall * 0.62, 62, 7), QColor(96, 74, 64));
        painter.fillRect(QRectF(x - 60, y - tall * 0.62 - 5, 62, 6), QColor(246, 246, 250));
        painter.fillRect(QRectF(x - 60, y - tall * 0.3, 62, 6), QColor(96, 74, 64));
        painter.fillRect(QRectF(x - 60, y - tall * 0.3 - 4, 62, 5), QColor(246, 246, 250));
        painter.fillRect(QRectF(x - 6, y - tall, 12, tall), QColor(84, 64, 56));
        painter.fillRect(QRectF(x + 1, y - tall, 5, tall), QColor(58, 44, 44));
        painter.setBrush(QColor(250, 250, 252));
        painter.drawEllipse(QPointF(x, y - tall), 10, 7);
        airbrush(painter, {x, y}, 22, 7, QColor(236, 238, 246), 1);
        airbrush(painter, {x + 40, y + 8}, 46, 5, QColor(120, 144, 194), 0.5, 8);
    }
    // Bare trees that carry snow.
    const std::function<void(QPointF, double, double, int)> branch = [&](QPointF from, double angle, double length,
                                                                         int depth) {
        const QPointF to = from + QPointF(std::cos(angle), std::sin(angle)) * length;
        const double width = length * (depth > 5 ? 0.17 : 0.1);
        const QPainterPath wood =
            curve(from, (from + to) / 2 + QPointF(dice.in(-1, 1), dice.in(-1, 1)) * length * 0.1, to);
        stroke(painter, wood, mixed(QColor(62, 48, 46), QColor(96, 84, 88), dice.in(0, 0.6)), width);
        if (std::abs(std::cos(angle)) > 0.25)
            stroke(painter, wood.translated(0, -width * 0.48), QColor(250, 250, 253), std::max(0.7, width * 0.6));
        if (depth == 0)
            return;
        const int children = depth > 5 ? 3 : 2 + dice.upTo(2);
        for (int i = 0; i < children; ++i)
            branch(to, angle + (i - (children - 1) / 2.0) * 0.62 + dice.in(-0.2, 0.2), length * dice.in(0.66, 0.82),
                   depth - 1);
    };
    branch({180, 780}, -1.56, 170, 7);
    sheet.soft({110, 768, 150, 40}, 2, [](QPainter& p) {
        p.setBrush(QColor(238, 240, 248));
        p.drawEllipse(QPointF(184, 788), 52, 13);
    });
    branch({914, 690}, -1.66, 120, 6);
    sheet.soft({860, 676, 110, 36}, 2, [](QPainter& p) {
        p.setBrush(QColor(238, 240, 248));
        p.drawEllipse(QPointF(914, 695), 38, 10);
    });
    airbrush(painter, {360, 812}, 210, 12, QColor(110, 134, 188), 0.5, 9);
    // Falling flakes: near ones out of focus.
    sheet.soft({0, 0, 1000, 1000}, 3.5, [&](QPainter& p) {
        p.setBrush(QColor(255, 255, 255, 190));
        for (int i = 0; i < 70; ++i) {
            const double size = dice.in(3, 8);
            p.drawEllipse(QPointF(dice.in(0, 1000), dice.in(0, 1000)), size, size);
        }
    });
    for (int i = 0; i < 420; ++i) {
        const double size = dice.in(0.7, 2.6);
        painter.setBrush(QColor(255, 255, 255, 200));
        painter.drawEllipse(QPointF(dice.in(0, 1000), dice.in(0, 1000)), size, size * 1.15);
    }
}

void drawKite(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    sky(sheet, 900, {58, 128, 206}, {236, 226, 204}, {255, 252, 244}, 0.52F, 23);
    sheet.glow({830, 700}, 520, QColor(255, 226, 160), 0.6);
    // Hills behind.
    sheet.soft({0, 760, 900, 300}, 4, [&](QPainter& p) {
        p.fillPath(ridge(sheet, 900, 110, 320, 2, 41), QColor(138, 166, 158));
        p.fillPath(ridge(sheet, 950, 110, 260, 3, 43), QColor(112, 146, 104));
    });
    QPainterPath hill(QPointF(-10, 1210));
    hill.lineTo(-10, 1020);
    hill.cubicTo(QPointF(200, 950), QPointF(480, 930), QPointF(910, 1010));
    hill.lineTo(910, 1210);
    hill.closeSubpath();
    QLinearGradient green(0, 950, 0, 1200);
    green.setColorAt(0, QColor(178, 176, 84));
    green.setColorAt(1, QColor(66, 92, 38));
    painter.fillPath(hill, green);
    grass(sheet, {-10, 985, 920, 60}, 2600, 26, {98, 122, 48}, {214, 206, 110});

    // The kite, its tail and the line down to the hand.
    const QPointF hand(452, 822);
    painter.save();
    painter.translate(632, 236);
    painter.rotate(24);
    const QPointF top(0, -128), bottom(0, 168), left(-98, -18), right(98, -18), cross(0, -18);
    painter.fillPath(polygon({top, left, cross}), QColor(226, 62, 52));
    painter.fillPath(polygon({top, right, cross}), QColor(250, 188, 46));
    painter.fillPath(polygon({left, bottom, cross}), QColor(44, 124, 190));
    painter.fillPath(polygon({right, bottom, cross}), QColor(72, 166, 92));
    airbrush(painter, {50, 40}, 120, 140, QColor(40, 20, 40), 0.22);
    airbrush(painter, {-40, -50}, 80, 80, Qt::white, 0.3);
    stroke(painter, curve(top, cross, bottom), QColor(90, 60, 40, 200), 3);
    stroke(painter, curve(left, {0, -26}, right), QColor(90, 60, 40, 200), 3);
    sheet.texture(polygon({top, left, bottom, right}), 0.9, 0.9, 0.05);
    painter.restore();
    QPainterPath tail(QPointF(563, 389));
    tail.cubicTo(QPointF(520, 460), QPointF(640, 500), QPointF(572, 580));
    tail.cubicTo(QPointF(530, 630), QPointF(620, 660), QPointF(590, 710));
    stroke(painter, tail, QColor(120, 90, 70), 2.2);
    for (int i = 0; i < 7; ++i) {
        const QPointF at = tail.pointAtPercent(0.12 + 0.14 * i);
        const QColor ribbon = i % 3 == 0   ? QColor(226, 62, 52)
                              : i % 3 == 1 ? QColor(250, 188, 46)
                                           : QColor(44, 124, 190);
        painter.save();
        painter.translate(at);
        painter.rotate(dice.in(-30, 30));
        painter.fillPath(outline({{0, 0}, {-10, -14}, {-22, -12}, {-24, 0}, {-22, 12}, {-10, 10}, {0, 0}}), ribbon);
        painter.fillPath(outline({{0, 0}, {10, -12}, {22, -12}, {24, 2}, {22, 12}, {10, 12}, {0, 0}}),
                         mixed(ribbon, Qt::black, 0.15));
        painter.restore();
    }
    stroke(painter, curve(hand, {560, 560}, {632, 226}), QColor(246, 244, 236, 190), 1.3);

    // The child, running up the hill, seen from behind.
    sheet.soft({180, 990, 280, 70}, 6, [](QPainter& p) {
        p.setBrush(QColor(30, 44, 16, 150));
        p.drawEllipse(QPointF(318, 1030), 112, 14);
    });
    const QColor skin(222, 166, 130), shirt(206, 64, 58), trousers(56, 82, 126), hair(112, 70, 38);
    const auto limb = [&](std::initializer_list<QPointF> through, double from, double to, const QColor& colour) {
        const auto* p = through.begin();
        const QPainterPath bone = curve(p[0], p[1], p[2]);
        for (int i = 0; i <= 40; ++i) {
            const double t = i / 40.0, radius = (from + (to - from) * t) / 2;
            painter.setBrush(colour);
            painter.drawEllipse(bone.pointAtPercent(t), radius, radius);
        }
        stroke(painter, bone.translated(from * 0.26, 0), withAlpha(QColor(255, 226, 160), 0.35), from * 0.2);
        stroke(painter, bone.translated(-from * 0.26, 0), withAlpha(QColor(20, 16, 40), 0.25), from * 0.25);
    };
    limb({{372, 936}, {352, 976}, {356, 1018}}, 27, 17, mixed(trousers, Qt::black, 0.25));
    limb({{354, 1018}, {358, 1022}, {368, 1024}}, 17, 15, QColor(240, 236, 228));
    limb({{404, 936}, {440, 962}, {424, 996}}, 28, 19, trousers);
    limb({{426, 996}, {424, 1006}, {414, 1014}}, 18, 14, skin);
    limb({{412, 1014}, {422, 1018}, {434, 1012}}, 16, 14, QColor(240, 236, 228));
    limb({{414, 858}, {444, 862}, {450, 826}}, 18, 12, skin);
    limb({{364, 862}, {332, 874}, {322, 906}}, 18, 12, mixed(skin, Qt::black, 0.12));
    painter.fillPath(outline({{358, 852},
                              {370, 836},
                              {380, 832},
                              {392, 832},
                              {404, 832},
                              {416, 838},
                              {424, 852},
                              {430, 886},
                              {426, 920},
                              {422, 948},
                              {404, 954},
                              {374, 954},
                              {358, 946},
                              {352, 914},
                              {352, 884},
                              {358, 852}}),
                     shirt);
    airbrush(painter, {360, 900}, 34, 70, QColor(60, 10, 30), 0.5);
    airbrush(painter, {416, 880}, 18, 60, QColor(255, 206, 150), 0.6);
    limb({{418, 852}, {436, 858}, {438, 852}}, 24, 20, shirt);
    limb({{364, 854}, {350, 866}, {344, 872}}, 24, 20, mixed(shirt, Qt::black, 0.2));
    painter.fillRect(QRectF(383, 812, 18, 24), mixed(skin, Qt::black, 0.15));
    painter.setBrush(hair);
    painter.drawEllipse(QPointF(393, 790), 30, 33);
    for (int i = 0; i < 320; ++i) {
        const double angle = dice.in(0, 6.283), radius = dice.in(4, 28);
        const QPointF at(393 + radius * std::cos(angle), 787 + radius * 1.08 * std::sin(angle));
        stroke(painter,
               curve(at, at + QPointF(dice.in(-4, 4), 8), at + QPointF((at.x() - 393) * 0.2 - 5, dice.in(12, 20))),
               withAlpha(mixed(hair, at.x() > 404 ? QColor(255, 214, 140) : QColor(30, 16, 10), dice.in(0, 0.6)), 0.8),
               1.5);
    }
    airbrush(painter, {417, 782}, 8, 22, QColor(255, 222, 150), 0.7);
    painter.setBrush(skin);
    painter.drawEllipse(QPointF(422, 795), 5, 8);
    painter.drawEllipse(hand, 8, 8);
    // The meadow before the feet, near blades out of focus.
    grass(sheet, {-10, 1030, 920, 190}, 5200, 62, {52, 78, 30}, {186, 186, 84});
    for (int i = 0; i < 60; ++i) {
        const QPointF at(dice.in(0, 900), dice.in(1050, 1190));
        airbrush(painter, at, 7, 6, i % 2 == 0 ? QColor(250, 246, 236) : QColor(236, 90, 70), 0.95);
        airbrush(painter, at, 2.6, 2.2, QColor(240, 190, 60), 1);
    }
    sheet.soft({-20, 1040, 940, 180}, 7, [&](QPainter& p) {
        for (int i = 0; i < 110; ++i) {
            const QPointF root(dice.in(-20, 920), 1230);
            stroke(p,
                   curve(root, root + QPointF(dice.in(-16, 16), -70),
                         root + QPointF(dice.in(-60, 60), dice.in(-150, -60))),
                   mixed(QColor(44, 66, 28), QColor(150, 156, 70), dice.in(0, 1)), 3);
        }
    });
    sheet.glow({880, 640}, 420, QColor(255, 214, 140), 0.35);
}

void drawNight(Sheet& sheet) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    const QPointF away(600, 452); // where the street vanishes
    sheet.gradient({0, 0, 1200, 900},
                   {{0, {16, 20, 46}}, {0.45, {48, 52, 92}}, {0.52, {80, 66, 84}}, {1, {20, 20, 34}}});
    sheet.glow(away, 340, QColor(255, 176, 104), 0.55);
    // Houses on both sides, in perspective: at(side, depth 0 near to 1 far, height 0 the ground to 1 the eaves).
    const auto at = [&](double side, double depth, double height) {
        const double near = std::pow(1 - depth, 1.9);
        return QPointF(away.x() + side * (54 + 640 * near), away.y() + 26 + 190 * near - height * (90 + 640 * near));
    };
    for (const double side : {-1.0, 1.0}) {
        const std::array<QColor, 6> walls = {QColor(92, 66, 62), QColor(66, 62, 84), QColor(104, 80, 66),
                                             QColor(72, 56, 66), QColor(86, 74, 80), QColor(78, 62, 62)};
        for (int house = 5; house >= 0; --house) {
            const double a = house / 6.0, b = (house + 1) / 6.0, tall = 0.86 + 0.2 * dice.in(0, 1);
            const QColor wall =
                mixed(walls[static_cast<std::size_t>(house)], QColor(30, 28, 50), 0.25 + (side < 0 ? 0.12 : 0));
            painter.fillPath(polygon({at(side, a, 0), at(side, a, tall), at(side, b, tall), at(side, b, 0)}), wall);
            painter.fillPath(
                polygon({at(side, a, tall), at(side, a, tall + 0.03), at(side, b, tall + 0.03), at(side, b, tall)}),
                mixed(wall, Qt::black, 0.35));
            const auto pane = [&](double u, double v, double wide, double high) {
                const double l = a + (b - a) * u, r = a + (b - a) * (u + wide);
                return polygon({at(side, l, v), at(side, l, v + high), at(side, r, v + high), at(side, r, v)});
            };
            for (int floor = 0; floor < 3; ++floor) {
                for (int column = 0; column < 3; ++column) {
                    const double u = 0.12 + 0.3 * column, v = 0.3 + 0.19 * floor;
                    const bool lit = dice.in(0, 1) < 0.42;
                    painter.fillPath(pane(u - 0.02, v - 0.012, 0.2, 0.134), mixed(wall, QColor(210, 190, 180), 0.35));
                    painter.fillPath(pane(u, v, 0.16, 0.11),
                                     lit ? mixed(QColor(255, 186, 92), QColor(255, 226, 164), dice.in(0, 1))
                                         : QColor(24, 28, 50));
                    painter.fillPath(pane(u + 0.07, v, 0.02, 0.11), mixed(wall, QColor(210, 190, 180), 0.2));
                    painter.fillPath(pane(u, v + 0.06, 0.16, 0.008), mixed(wall, QColor(210, 190, 180), 0.2));
                }
            }
            // A shop: its window, its awning.
            painter.fillPath(pane(0.08, 0.03, 0.84, 0.2),
                             mixed(QColor(255, 206, 130), QColor(255, 236, 200), dice.in(0, 1)));
            for (int i = 0; i < 9; ++i)
                painter.fillPath(pane(0.1 + 0.09 * i, 0.03, dice.in(0.02, 0.06), dice.in(0.03, 0.13)),
                                 withAlpha(mixed(QColor(120, 50, 40), QColor(60, 90, 110), dice.in(0, 1)), 0.8));
            painter.fillPath(pane(0.34, 0.0, 0.02, 0.23), mixed(wall, Qt::black, 0.4));
            painter.fillPath(pane(0.64, 0.0, 0.02, 0.23), mixed(wall, Qt::black, 0.4));
            const QColor awning = house % 3 == 0   ? QColor(150, 44, 48)
                                  : house % 3 == 1 ? QColor(40, 92, 84)
                                                   : QColor(60, 62, 110);
            const QPointF drop(-side * 26 * (1 - a), 14 * (1 - a));
            painter.fillPath(polygon({at(side, a + 0.005, 0.265), at(side, b - 0.005, 0.265),
                                      at(side, b - 0.005, 0.225) + drop * 0.8, at(side, a + 0.005, 0.225) + drop}),
                             awning);
        }
    }
    // The wet street shows what stands above it.
    for (const double side : {-1.0, 1.0})
        painter.fillPath(polygon({at(side, 0, 0), at(side, 0, -0.12), at(side, 1, -0.03), at(side, 1, 0)}),
                         QColor(54, 48, 56));
    painter.fillPath(
        polygon({at(-1, 1, -0.0), at(1, 1, -0.0), at(1, 0, -0.05), {1300, 920}, {-100, 920}, at(-1, 0, -0.05)}),
        QColor(30, 30, 42));
    sheet.glow({away.x(), 500}, 260, QColor(255, 170, 100), 0.5);
    const auto streak = [&](QPointF foot, double length, double wide, const QColor& colour, double strength) {
        sheet.soft(
            {foot.x() - wide * 2, foot.y(), wide * 4, length}, 4,
            [&](QPainter& p) {
                for (int i = 0; i < 46; ++i) {
                    const double t = dice.in(0, 1);
                    p.setBrush(withAlpha(colour, strength * (1 - t) * dice.in(0.2, 0.9)));
                    p.drawEllipse(QPointF(foot.x() + dice.in(-0.6, 0.6) * wide * (1 + t), foot.y() + t * length),
                                  wide * dice.in(0.3, 0.9), dice.in(1.2, 4.5));
                }
            },
            1, QPainter::CompositionMode_Screen);
    };
    for (int i = 0; i < 20; ++i) {
        const double side = i % 2 == 0 ? -1 : 1, depth = dice.in(0, 0.9);
        const QPointF foot = at(side * 0.92, depth, -0.08);
        streak(foot, 260 * (1 - depth) + 40, 40 * (1 - depth) + 8, QColor(255, 190, 110), 0.6);
    }
    // Paving stones in the shine.
    painter.save();
    painter.setClipPath(
        polygon({at(-1, 1, 0), at(1, 1, 0), at(1, 0, -0.02), {1300, 920}, {-100, 920}, at(-1, 0, -0.02)}));
    for (int row = 0; row < 46; ++row) {
        const double t = std::pow(row / 46.0, 1.8), y = 492 + 420 * t;
        stroke(painter, curve({-20, y}, {600, y + 5 * t}, {1220, y}), QColor(8, 8, 16, 90), 0.6 + 2.4 * t);
        for (int i = -14; i <= 14; ++i) {
            const double x = 600 + (i + (row % 2) * 0.5) * (10 + 92 * t);
            stroke(painter, curve({x, y}, {x, y + 4}, {x + i * 0.6 * t, y + 5 + 16 * t}), QColor(8, 8, 16, 80),
                   0.6 + 2 * t);
        }
    }
    painter.restore();
    // Lamps along the pavement.
    for (const double depth : {0.72, 0.5, 0.2}) {
        for (const double side : {-1.0, 1.0}) {
            const QPointF foot = at(side * 0.84, depth, -0.05),
                          head = foot - QPointF(0, 60 + 420 * std::pow(1 - depth, 1.9));
            const double size = 3 + 22 * std::pow(1 - depth, 1.9);
            stroke(painter, curve(foot, (foot + head) / 2, head), QColor(16, 16, 24), size * 0.34);
            stroke(painter, curve(foot, foot - QPointF(0, size), foot - QPointF(0, size * 2)), QColor(16, 16, 24),
                   size * 0.7);
            painter.fillPath(polygon({head + QPointF(-size * 0.7, -size), head + QPointF(size * 0.7, -size),
                                      head + QPointF(size * 0.4, size * 0.6), head + QPointF(-size * 0.4, size * 0.6)}),
                             QColor(255, 236, 190));
            painter.fillPath(polygon({head + QPointF(-size * 0.9, -size), head + QPointF(0, -size * 1.9),
                                      head + QPointF(size * 0.9, -size)}),
                             QColor(16, 16, 24));
            sheet.glow(head, size * 3, QColor(255, 236, 180), 0.9);
            sheet.glow(head, size * 11, QColor(255, 180, 96), 0.45);
            streak(foot + QPointF(0, 8), size * 14, size * 1.3, QColor(255, 214, 150), 0.8);
        }
    }
    // Strings of bulbs over the street.
    for (int line = 0; line < 3; ++line) {
        const double depth = 0.2 + 0.22 * line;
        const QPointF a = at(-1, depth, 0.78), b = at(1, depth, 0.78),
                      sag((a.x() + b.x()) / 2, a.y() + 90 * (1 - depth));
        const QPainterPath wire = curve(a, sag, b);
        stroke(painter, wire, QColor(10, 10, 18), 1.4);
        for (int i = 1; i < 20; ++i) {
            const QPointF bulb = wire.pointAtPercent(i / 20.0) + QPointF(0, 4);
            painter.setBrush(QColor(255, 244, 214));
            painter.drawEllipse(bulb, 3.6 - line, 4.4 - line);
            sheet.glow(bulb, 20 - 5 * line, QColor(255, 190, 100), 0.8);
        }
    }
    // Tail lights far down, and one who goes home under an umbrella.
    for (const QPointF& car : {QPointF(566, 488), QPointF(590, 488), QPointF(628, 484), QPointF(645, 484)}) {
        airbrush(painter, car, 6, 5, QColor(255, 60, 44), 1);
        sheet.glow(car, 18, QColor(255, 60, 40), 0.5);
        streak(car + QPointF(0, 12), 50, 3, QColor(255, 70, 50), 0.35);
    }
    const QColor coat(14, 14, 22);
    const QPointF feet(508, 700);
    sheet.soft({420, 690, 180, 210}, 5, [&](QPainter& p) {
        p.setBrush(QColor(8, 8, 16, 190));
        p.drawEllipse(QPointF(508, 770), 30, 72);
        p.drawEllipse(QPointF(510, 866), 86, 30);
    });
    stroke(painter, curve({500, 630}, {494, 668}, feet - QPointF(14, 0)), coat, 13);
    stroke(painter, curve({516, 630}, {524, 668}, feet + QPointF(18, -8)), coat, 13);
    painter.fillPath(outline({{482, 650},
                              {484, 600},
                              {486, 560},
                              {494, 548},
                              {500, 542},
                              {516, 542},
                              {522, 548},
                              {532, 560},
                              {534, 600},
                              {536, 650},
                              {520, 656},
                              {498, 656},
                              {482, 650}}),
                     coat);
    painter.setBrush(coat);
    painter.drawEllipse(QPointF(508, 528), 14, 17);
    stroke(painter, curve({522, 610}, {528, 540}, {526, 462}), coat, 4);
    const QPainterPath umbrella = outline({{424, 520},
                                           {430, 456},
                                           {480, 430},
                                           {524, 432},
                                           {572, 432},
                                           {618, 462},
                                           {622, 522},
                                           {606, 508},
                                           {590, 508},
                                           {574, 522},
                                           {556, 508},
                                           {540, 508},
                                           {524, 522},
                                           {506, 508},
                                           {490, 508},
                                           {474, 522},
                                           {458, 508},
                                           {440, 508},
                                           {424, 520}});
    painter.fillPath(umbrella, QColor(118, 26, 34));
    airbrush(painter, {576, 470}, 60, 40, QColor(255, 150, 110), 0.55);
    stroke(painter, curve({524, 432}, {486, 456}, {474, 520}), QColor(50, 10, 18), 1.6);
    stroke(painter, curve({524, 432}, {566, 456}, {574, 520}), QColor(50, 10, 18), 1.6);
    stroke(painter, curve({534, 560}, {540, 600}, {536, 648}), QColor(255, 180, 110, 150), 2.4);
    stroke(painter, curve({521, 518}, {525, 528}, {520, 540}), QColor(255, 180, 110, 160), 2);
}

} // namespace lumora::demo
