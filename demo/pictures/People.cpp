#include "People.h"

#include <QLinearGradient>
#include <QRadialGradient>

#include <array>

namespace lumora::demo {
namespace {

struct Skin {
    QColor plain, shade, deep, shine, blush;
};

Skin skinOf(const Person& person) {
    const QColor& plain = person.skin;
    return {plain, mixed(plain, QColor(96, 40, 24), 0.42), mixed(plain, QColor(52, 18, 12), 0.72),
            mixed(plain, QColor(255, 240, 224), 0.6), mixed(plain, QColor(214, 66, 60), 0.45)};
}

// The lower face is a little shorter than it is drawn.
void shortenLowerFace(QPainter& painter) {
    painter.translate(0, 510 * 0.14);
    painter.scale(1, 0.86);
}

QPainterPath faceOf(const Person& person) {
    const bool child = person.age < 0.15;
    const double jaw = child ? 16 : person.beard > 0 ? 12 : 0, chin = child ? 768 : 788;
    return outline({{450, 200},
                    {560, 200},
                    {640, 270},
                    {650, 410},
                    {656, 500},
                    {650 + jaw, 586},
                    {622 + jaw, 660},
                    {594 + jaw, 722},
                    {514, chin},
                    {450, chin},
                    {386, chin},
                    {306 - jaw, 722},
                    {278 - jaw, 660},
                    {250 - jaw, 586},
                    {244, 500},
                    {250, 410},
                    {260, 270},
                    {340, 200},
                    {450, 200}});
}

// Hair of one head.
class Tuft {
public:
    Tuft(Sheet& sheet, const QColor& hair)
        : m_sheet(sheet)
        , m_hair(hair) {}

    void add(QPointF from, QPointF by, QPointF to, double width, double light) const {
        m_sheet.strand(from, by, to, width, colour(m_sheet.dice().around(light, 0.35)));
    }
    QColor colour(double tone) const {
        return tone > 0 ? withAlpha(mixed(m_hair, mixed(m_hair, QColor(255, 232, 200), 0.65), tone), 0.75)
                        : withAlpha(mixed(m_hair, QColor(14, 8, 6), -tone), 0.8);
    }

private:
    Sheet& m_sheet;
    QColor m_hair;
};

void hairBehind(Sheet& sheet, const Person& person) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    const QColor dark = mixed(person.hair, QColor(10, 6, 4), 0.45);
    if (person.style == Hair::Long) {
        painter.fillPath(outline({{450, 140},
                                  {640, 140},
                                  {730, 280},
                                  {724, 480},
                                  {720, 660},
                                  {780, 800},
                                  {730, 960},
                                  {640, 1010},
                                  {260, 1010},
                                  {170, 960},
                                  {120, 800},
                                  {180, 660},
                                  {176, 480},
                                  {170, 280},
                                  {260, 140},
                                  {450, 140}}),
                         dark);
        const Tuft tuft(sheet, person.hair);
        for (int i = 0; i < 520; ++i) {
            const double side = dice.upTo(2) == 0 ? -1 : 1;
            const double out = dice.in(0.55, 1);
            const QPointF from(450 + side * 200 * out, dice.in(300, 520));
            const QPointF to(450 + side * (140 + 190 * out) + dice.in(-40, 40), dice.in(860, 1040));
            tuft.add(from, {450 + side * (270 * out + dice.in(0, 40)), dice.in(620, 760)}, to, dice.in(3, 9),
                     side < 0 ? 0.12 : -0.12);
        }
    } else if (person.style == Hair::Bun) {
        painter.setBrush(dark);
        painter.drawEllipse(QPointF(450, 170), 112, 96);
        const Tuft tuft(sheet, person.hair);
        for (int i = 0; i < 120; ++i) {
            const double angle = dice.in(0, 6.28), radius = dice.in(40, 108);
            const QPointF at(450 + radius * std::cos(angle), 170 + 0.86 * radius * std::sin(angle));
            tuft.add(at, at + QPointF(30 * std::sin(angle), -26 * std::cos(angle)),
                     at + QPointF(56 * std::sin(angle + 0.4), -52 * std::cos(angle + 0.4)), dice.in(3, 8), 0.1);
        }
    } else if (person.style == Hair::Curls) {
        for (int i = 0; i < 260; ++i) {
            const double angle = dice.in(2.6, 6.85), radius = dice.in(0.7, 1.0);
            const QPointF at(450 + 292 * radius * std::cos(angle), 420 + 296 * radius * std::sin(angle));
            airbrush(painter, at, 46, 42, mixed(dark, person.hair, dice.in(0, 0.7)), 0.95);
        }
    }
}

void hairInFront(Sheet& sheet, const Person& person) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    if (person.style == Hair::Curls) {
        const Tuft tones(sheet, person.hair);
        for (int i = 0; i < 900; ++i) {
            const double angle = dice.in(3.0, 6.42), radius = dice.in(0.72, 1.04);
            const QPointF at(450 + 270 * radius * std::cos(angle), 420 + 292 * radius * std::sin(angle));
            const double size = dice.in(10, 22);
            QPainterPath curl;
            curl.arcMoveTo(QRectF(at.x() - size, at.y() - size, 2 * size, 2 * size), dice.in(0, 360));
            curl.arcTo(QRectF(at.x() - size, at.y() - size, 2 * size, 2 * size), dice.in(0, 360), 200);
            stroke(painter, curl, tones.colour(dice.around(at.x() < 450 ? 0.15 : -0.1, 0.35)), dice.in(3, 8));
        }
        return;
    }
    // The hairline falls to the temples; thin hair begins higher and lets the skin through.
    const bool thin = person.style == Hair::Thin;
    const int count = thin ? 0 : person.style == Hair::Short ? 1500 : 1300;
    const double parting = person.style == Hair::Short ? 372 : 420;
    if (!thin) {
        painter.fillPath(outline({{222, 470},
                                  {200, 300},
                                  {290, 140},
                                  {450, 138},
                                  {610, 140},
                                  {700, 300},
                                  {678, 470},
                                  {668, 400},
                                  {640, 330},
                                  {600, 292},
                                  {540, 262},
                                  {460, 262},
                                  {parting, 236},
                                  {310, 290},
                                  {250, 380},
                                  {222, 470},
                                  {222, 470},
                                  {222, 470},
                                  {222, 470}}),
                         mixed(person.hair, QColor(10, 6, 4), 0.25));
    }
    const Tuft tuft(sheet, person.hair);
    for (int i = 0; i < count; ++i) {
        const double share = dice.in(-1, 1); // from the left temple to the right one
        const double lift = dice.in(0, 1);
        const QPointF root(parting + share * 26 * (1 + lift), 150 + 92 * lift + 14 * std::abs(share));
        const QPointF tip(450 + share * 222 + dice.in(-8, 8),
                          262 + 210 * share * share * share * share * (share > 0 ? 1 : 0.96) +
                              dice.in(-26, 20) * (1 - lift / 2) - (1 - lift) * 60 * (1 - share * share));
        const QPointF by((root.x() + tip.x()) / 2 + share * 70, std::min(root.y(), tip.y()) + 8 - 34 * (1 - lift));
        const double light = 0.55 * std::exp(-std::pow((share + 0.35) / 0.3, 2)) - 0.12;
        tuft.add(root, by, tip, dice.in(3, 8), light);
    }
    if (person.style == Hair::Long || person.style == Hair::Bun) {
        // Swept over the forehead to both sides; long hair falls before the ears.
        for (int i = 0; i < 1500; ++i) {
            const double side = i % 5 < 3 ? 1 : -1, out = dice.in(0, 1);
            const QPointF root(410 + side * dice.in(0, 26), dice.in(150, 222));
            const double low = person.style == Hair::Bun ? dice.in(400, 500) : dice.in(560, 900) + 90 * out;
            const QPointF tip(
                450 + side * (person.style == Hair::Bun ? 212 + 14 * out : 206 + 66 * out + dice.in(-16, 16)), low);
            const QPointF by(450 + side * (168 + 92 * out), 196 + 70 * (1 - out));
            const double light =
                0.6 * std::exp(-std::pow((out - (side < 0 ? 0.6 : 0.3)) / 0.22, 2)) - (side < 0 ? 0.05 : 0.25);
            tuft.add(root, by, tip, dice.in(3, 8), light);
        }
    }
    if (thin) {
        for (int i = 0; i < 700; ++i) {
            const double side = dice.upTo(2) == 0 ? -1 : 1;
            const QPointF at(450 + side * dice.in(178, 216), dice.in(300, 530));
            tuft.add(at, at + QPointF(side * 16, 22), at + QPointF(side * dice.in(4, 18), dice.in(36, 70)),
                     dice.in(3, 7), 0.1);
        }
    }
}

void shoulders(Sheet& sheet, const Person& person, const Skin& skin) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    const double narrow = person.age < 0.15 ? 70 : 0;
    const QPainterPath torso = outline({{40 + narrow, 2400},
                                        {56 + narrow, 1060},
                                        {120 + narrow, 1000},
                                        {250, 960},
                                        {330, 934},
                                        {360, 920},
                                        {366, 900},
                                        {420, 980},
                                        {480, 980},
                                        {534, 900},
                                        {540, 920},
                                        {570, 934},
                                        {650, 960},
                                        {780 - narrow, 1000},
                                        {844 - narrow, 1060},
                                        {860 - narrow, 2400},
                                        {600, 2400},
                                        {300, 2400},
                                        {40 + narrow, 2400}});
    const QPainterPath neck = outline({{362, 760},
                                       {366, 850},
                                       {362, 900},
                                       {330, 936},
                                       {380, 1010},
                                       {520, 1010},
                                       {570, 936},
                                       {538, 900},
                                       {534, 850},
                                       {538, 760},
                                       {500, 760},
                                       {400, 760},
                                       {362, 760}});
    QLinearGradient throat(0, 790, 0, 960);
    throat.setColorAt(0, skin.deep);
    throat.setColorAt(0.45, skin.shade);
    throat.setColorAt(1, skin.plain);
    painter.fillPath(neck, throat);
    painter.save();
    painter.setClipPath(neck);
    airbrush(painter, {540, 880}, 60, 120, skin.deep, 0.6);
    airbrush(painter, {405, 900}, 26, 90, skin.shine, 0.25, 8);
    painter.restore();

    QLinearGradient cloth(80, 950, 760, 1240);
    cloth.setColorAt(0, mixed(person.cloth, Qt::white, 0.2));
    cloth.setColorAt(0.5, person.cloth);
    cloth.setColorAt(1, mixed(person.cloth, Qt::black, 0.45));
    painter.fillPath(torso, cloth);
    painter.save();
    painter.setClipPath(torso);
    for (int fold = 0; fold < 90; ++fold) {
        const QPointF at(dice.in(90, 810), dice.in(1010, 2000));
        const double lean = (at.x() - 450) * 0.12 + 90;
        airbrush(painter, at, dice.in(60, 150), dice.in(7, 18),
                 fold % 2 == 0 ? mixed(person.cloth, Qt::black, 0.6) : mixed(person.cloth, Qt::white, 0.4), 0.3, lean);
    }
    for (const double side : {-1.0, 1.0})
        airbrush(painter, {450 + side * (286 - narrow), 1640}, 26, 560, mixed(person.cloth, Qt::black, 0.75), 0.8,
                 side * 2);
    airbrush(painter, {450, 920}, 190, 66, QColor(10, 8, 12), 0.45);
    painter.restore();
    sheet.texture(torso, 0.9, 0.9, 0.07);
    QPainterPath collar(QPointF(352, 918));
    collar.cubicTo(QPointF(420, 1000), QPointF(480, 1000), QPointF(548, 918));
    stroke(painter, collar, mixed(person.cloth, Qt::black, 0.3), 16);
    stroke(painter, collar.translated(-2, -4), mixed(person.cloth, Qt::white, 0.22), 5);
}

void modelling(QPainter& painter, const Person& person, const Skin& skin) {
    const double old = std::max(0.0, person.age - 0.55) / 0.45;
    // The light comes from the upper left.
    airbrush(painter, {640, 560}, 130, 360, skin.deep, 0.62);
    airbrush(painter, {236, 600}, 60, 300, skin.shade, 0.55);
    airbrush(painter, {450, 850}, 240, 70, skin.deep, 0.5);
    airbrush(painter, {450, 214}, 260, 70, skin.shade, 0.6);
    airbrush(painter, {400, 330}, 150, 84, skin.shine, 0.5);
    // The hollows of the eyes, the cheekbones and below them.
    for (const double side : {-1.0, 1.0}) {
        airbrush(painter, {450 + side * 94, 480}, 92, 54, skin.shade, 0.62);
        airbrush(painter, {450 + side * 40, 486}, 34, 52, skin.deep, 0.32);
        airbrush(painter, {450 + side * 128, 616}, 96, 70, skin.blush, person.age < 0.15 ? 0.62 : 0.4);
        airbrush(painter, {450 + side * 122, 588}, 64, 30, skin.shine, side < 0 ? 0.55 : 0.3, side * -18);
        airbrush(painter, {450 + side * 150, 712}, 60, 90, skin.shade, 0.4, side * 24);
        airbrush(painter, {450 + side * 90, 548}, 66, 17, skin.shade, 0.2 + 0.45 * old, side * 8);
        // From the wings of the nose to the corners of the mouth.
        for (int i = 0; i < 7; ++i) {
            const double t = i / 6.0;
            airbrush(painter, {450 + side * (52 + 46 * t + 14 * t * (1 - t)), 640 + 78 * t}, 13, 22, skin.deep,
                     (0.05 + 0.22 * old + 0.07 * person.smile) * (1 - 0.5 * t), side * -30);
        }
    }
    // The nose: bridge, tip, wings, shadow below.
    airbrush(painter, {474, 570}, 22, 92, skin.shade, 0.6, -4);
    airbrush(painter, {444, 560}, 13, 96, skin.shine, 0.62);
    airbrush(painter, {450, 640}, 54, 36, skin.shade, 0.35);
    airbrush(painter, {445, 628}, 25, 20, skin.shine, 0.7);
    for (const double side : {-1.0, 1.0}) {
        airbrush(painter, {450 + side * 44, 640}, 17, 24, skin.deep, 0.38, side * -14);
        airbrush(painter, {450 + side * 22, 658}, 15, 7.5, mixed(skin.deep, QColor(30, 6, 4), 0.6), 0.95, side * -12);
    }
    airbrush(painter, {462, 680}, 46, 15, skin.deep, 0.42);
    airbrush(painter, {450, 690}, 11, 20, skin.shade, 0.4);
    airbrush(painter, {450, 798}, 60, 18, skin.deep, 0.35);
    airbrush(painter, {442, 822}, 40, 20, skin.shine, 0.38);
    // What years draw.
    if (old > 0) {
        for (int line = 0; line < 3; ++line) {
            QPainterPath crease(QPointF(330, 330.0 + 34 * line));
            crease.cubicTo(QPointF(400, 316.0 + 34 * line), QPointF(500, 322.0 + 34 * line),
                           QPointF(566, 332.0 + 34 * line));
            stroke(painter, crease, withAlpha(skin.deep, 0.16 * old), 7);
            stroke(painter, crease.translated(0, 4), withAlpha(skin.shine, 0.2 * old), 4);
        }
        for (const double side : {-1.0, 1.0}) {
            for (int line = 0; line < 3; ++line)
                stroke(painter,
                       curve({450 + side * 152, 500.0 + 10 * line}, {450 + side * 172, 498.0 + 14 * line},
                             {450 + side * 186, 490.0 + 26 * line}),
                       withAlpha(skin.deep, 0.3 * old), 3);
        }
    }
}

void eye(Sheet& sheet, const Person& person, const Skin& skin, double side) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    const double wide = person.age < 0.15 ? 1.16 : 1;
    const double radius = pupilRadius * 900;
    const double iris = radius * 1.78 * (person.age < 0.15 ? 1.1 : 1);
    painter.save();
    painter.translate(450 + side * 94.5, 498);
    painter.scale(side, 1); // x grows towards the temple
    const double open = 1 - 0.16 * std::max(0.0, person.smile - 0.5);
    const QPainterPath lid = outline({{-49 * wide, 9},
                                      {-34 * wide, -12 * open},
                                      {-10, -20 * wide * open},
                                      {8, -20 * wide * open},
                                      {28 * wide, -20 * open},
                                      {44 * wide, -9},
                                      {50 * wide, -3},
                                      {34 * wide, 10},
                                      {16, 15 * wide},
                                      {-6, 15 * wide},
                                      {-26 * wide, 15},
                                      {-40 * wide, 11},
                                      {-49 * wide, 9}});
    painter.save();
    painter.setClipPath(lid);
    painter.fillPath(lid, QColor(222, 214, 206));
    airbrush(painter, {-46, 6}, 16, 14, QColor(206, 120, 108), 0.7);
    airbrush(painter, {46, 0}, 26, 26, QColor(150, 128, 120), 0.5);
    QRadialGradient ring(QPointF(0, 0), iris);
    const QColor edge = mixed(person.iris, QColor(10, 8, 8), 0.65);
    ring.setColorAt(0.4, mixed(person.iris, QColor(255, 220, 160), 0.12));
    ring.setColorAt(0.8, person.iris);
    ring.setColorAt(0.94, edge);
    ring.setColorAt(1, withAlpha(edge, 0));
    painter.setBrush(ring);
    painter.drawEllipse(QPointF(0, 0), iris, iris);
    for (int i = 0; i < 60; ++i) {
        const double angle = dice.in(0, 6.283);
        const QPointF ray(std::cos(angle), std::sin(angle));
        stroke(painter, curve(ray * radius, ray * (radius * 1.3), ray * (iris * dice.in(0.75, 0.92))),
               withAlpha(mixed(person.iris, dice.upTo(2) == 0 ? QColor(255, 230, 180) : QColor(0, 0, 0), 0.45), 0.35),
               0.9);
    }
    QRadialGradient pupil(QPointF(0, 0), radius);
    if (person.redEyes) {
        pupil.setColorAt(0, QColor(240, 52, 50));
        pupil.setColorAt(0.75, QColor(214, 26, 34));
        pupil.setColorAt(1, QColor(150, 16, 24));
    } else {
        pupil.setColorAt(0, QColor(10, 8, 10));
        pupil.setColorAt(1, QColor(18, 12, 12));
    }
    painter.setBrush(pupil);
    painter.drawEllipse(QPointF(0, 0), radius, radius);
    // The lid's shadow on the ball, and the light in the eye.
    airbrush(painter, {0, -24 * open}, 64, 22, QColor(40, 22, 18), 0.7);
    airbrush(painter, {-side * radius * 0.45, -radius * 0.5}, radius * 0.36, radius * 0.36, Qt::white, 1);
    airbrush(painter, {-side * radius * 0.45, -radius * 0.5}, radius * 0.2, radius * 0.2, Qt::white, 1);
    painter.restore();

    stroke(painter, curve({-44 * wide, 12}, {0, 23 * wide}, {46 * wide, 1}),
           withAlpha(mixed(skin.plain, QColor(220, 130, 120), 0.5), 0.8), 4);
    QPainterPath upper(QPointF(-50 * wide, 10));
    upper.cubicTo(QPointF(-32 * wide, -15 * open), QPointF(-10, -23 * wide * open), QPointF(8, -23 * wide * open));
    upper.cubicTo(QPointF(30 * wide, -22 * open), QPointF(46 * wide, -11), QPointF(53 * wide, -4));
    stroke(painter, upper, QColor(36, 22, 18), person.beard > 0 ? 3 : 4);
    QPainterPath fold(QPointF(-48 * wide, -6));
    fold.cubicTo(QPointF(-30 * wide, -29), QPointF(-8, -37 * wide), QPointF(10, -36 * wide));
    fold.cubicTo(QPointF(32 * wide, -34), QPointF(48 * wide, -23), QPointF(56 * wide, -12));
    stroke(painter, fold, withAlpha(skin.deep, 0.5), 5);
    stroke(painter, fold.translated(0, -5), withAlpha(skin.shine, 0.18), 5);
    for (int i = 0; i < 26; ++i) {
        const double t = i / 25.0;
        const QPointF root = upper.pointAtPercent(0.12 + 0.88 * t);
        const double length = (person.beard > 0 || person.age > 0.8 ? 5 : 10) * (0.5 + 0.7 * t);
        const QPointF tip = root + QPointF(-3 + 15 * t, -length);
        sheet.strand(root, (root + tip) / 2 + QPointF(2 * t, 3), tip, 1.9, QColor(26, 16, 14, 220));
    }
    // The brow.
    const QColor brow = mixed(person.hair, QColor(20, 12, 8), person.age > 0.8 ? 0.1 : 0.45);
    airbrush(painter, {0, -66}, 62, 13, brow, 0.5, -3);
    for (int i = 0; i < 320; ++i) {
        const double t = dice.in(0, 1);
        const double thick = (person.beard > 0 ? 13 : 9) * (1 - 0.7 * t) * (0.4 + std::min(1.0, 4 * t));
        const QPointF root(-56 + 122 * t, -56 - 22 * std::sin(2.2 * t) + 20 * t * t + dice.in(-1, 1) * thick);
        const QPointF tip = root + QPointF(10 + 8 * t, -10 + 14 * t + dice.in(-2, 2));
        sheet.strand(root, (root + tip) / 2 + QPointF(0, -2), tip, 1.7, withAlpha(brow, 0.55));
    }
    painter.restore();
}

void mouth(Sheet& sheet, const Person& person, const Skin& skin) {
    QPainter& painter = sheet.painter();
    const double smile = person.smile;
    const double half = 60 + 20 * smile;
    const double lift = 12 * smile;
    const double open = smile > 0.6 ? 21 * smile : 3;
    const bool painted = person.beard <= 0 && person.age > 0.2 && person.age < 0.8;
    const QColor lip = mixed(skin.plain, painted ? QColor(172, 50, 60) : QColor(178, 84, 78), painted ? 0.6 : 0.5);
    const QPointF left(450 - half, 736 - lift), right(450 + half, 736 - lift);
    const QPainterPath inside = outline({left,
                                         {400, 744},
                                         {420, 746},
                                         {450, 746},
                                         {480, 746},
                                         {500, 744},
                                         right,
                                         {500, 744 + open},
                                         {480, 750 + open},
                                         {450, 750 + open},
                                         {420, 750 + open},
                                         {400, 744 + open},
                                         left});
    const QPainterPath upper = outline({left,
                                        {402, 728},
                                        {426, 721},
                                        {438, 722},
                                        {446, 727},
                                        {454, 727},
                                        {462, 722},
                                        {474, 721},
                                        {498, 728},
                                        right,
                                        {500, 745},
                                        {480, 748},
                                        {450, 748},
                                        {420, 748},
                                        {400, 745},
                                        left});
    const QPainterPath lower = outline({left,
                                        {404, 746 + open},
                                        {424, 750 + open},
                                        {450, 750 + open},
                                        {476, 750 + open},
                                        {496, 746 + open},
                                        right,
                                        {504, 758 + open},
                                        {480, 769 + open},
                                        {450, 769 + open},
                                        {420, 769 + open},
                                        {396, 758 + open},
                                        left});
    painter.fillPath(inside, QColor(64, 20, 22));
    if (open > 8) {
        painter.save();
        painter.setClipPath(inside);
        painter.fillPath(outline({left,
                                  {400, 744},
                                  {420, 745},
                                  {450, 745},
                                  {480, 745},
                                  {500, 744},
                                  right,
                                  {490, 748 + open * 0.72},
                                  {470, 752 + open * 0.72},
                                  {450, 752 + open * 0.72},
                                  {430, 752 + open * 0.72},
                                  {410, 748 + open * 0.72},
                                  left}),
                         QColor(240, 234, 224));
        for (int tooth = -4; tooth <= 4; ++tooth) {
            const double x = 450 + tooth * 17.0 * (1 - 0.05 * std::abs(tooth));
            stroke(painter, curve({x, 742}, {x, 755}, {x, 752 + open * 0.7}), QColor(150, 120, 112, 70), 1.6);
        }
        airbrush(painter, left + QPointF(8, 10), 44, 40, QColor(50, 16, 16), 0.9);
        airbrush(painter, right + QPointF(-8, 10), 44, 40, QColor(50, 16, 16), 0.9);
        airbrush(painter, {450, 742}, 80, 10, QColor(60, 20, 20), 0.6);
        painter.restore();
    }
    painter.fillPath(upper, mixed(lip, QColor(60, 14, 18), 0.22));
    painter.fillPath(lower, lip);
    airbrush(painter, {440, 760 + open}, 40, 8, mixed(lip, Qt::white, 0.6), 0.6);
    airbrush(painter, {450, 782 + open}, 62, 12, skin.deep, 0.35);
    for (const QPointF& corner : {left, right})
        airbrush(painter, corner, 16, 12, skin.deep, 0.7);
}

void beard(Sheet& sheet, const Person& person) {
    QPainter& painter = sheet.painter();
    Dice& dice = sheet.dice();
    airbrush(painter, {450, 800}, 200, 74, person.hair, 0.6);
    const Tuft tuft(sheet, person.hair);
    for (int i = 0; i < 7000 * person.beard; ++i) {
        const double angle = dice.in(0.08, 3.06);
        const double radius = dice.in(0.62, 1.04);
        const QPointF at(450 + 202 * radius * std::cos(angle), 600 + 230 * radius * std::sin(angle));
        const bool onMouth = std::abs(at.x() - 450) < 92 && at.y() > 716 && at.y() < 788;
        const double side = std::abs(at.x() - 450) / 200;
        const bool onCheek = at.y() < 716 - 130 * side * side * side;
        if (onMouth || onCheek)
            continue;
        tuft.add(at, at + QPointF((at.x() - 450) * 0.03, 12), at + QPointF(dice.in(-6, 6), dice.in(10, 22)),
                 dice.in(1.5, 3.2), at.x() < 450 ? 0.2 : -0.05);
    }
    for (int i = 0; i < 320 * person.beard; ++i) {
        const double x = dice.in(-82, 82);
        const QPointF at(450 + x, 696 + 0.0022 * x * x + dice.in(-9, 10));
        tuft.add(at, at + QPointF(x * 0.08, 9), at + QPointF(x * 0.22, 20), dice.in(2, 4), 0);
    }
}

} // namespace

void portray(Sheet& sheet, const Person& person) {
    QPainter& painter = sheet.painter();
    const Skin skin = skinOf(person);
    hairBehind(sheet, person);
    painter.save();
    painter.translate(0, -42);
    shoulders(sheet, person, skin);
    painter.restore();
    for (const double side : {-1.0, 1.0}) {
        if (person.style == Hair::Long)
            break;
        const QPointF at(450 + side * 208, 552);
        painter.setBrush(mixed(skin.plain, skin.shade, side < 0 ? 0.3 : 0.9));
        painter.drawEllipse(at, 26, 56);
        airbrush(painter, at, 17, 38, skin.deep, 0.6);
    }
    const QPainterPath face = faceOf(person);
    QLinearGradient base(240, 300, 680, 800);
    base.setColorAt(0, mixed(skin.plain, skin.shine, 0.25));
    base.setColorAt(0.5, skin.plain);
    base.setColorAt(1, mixed(skin.plain, skin.shade, 0.8));
    painter.fillPath(face, base);
    painter.save();
    painter.setClipPath(face);
    shortenLowerFace(painter);
    modelling(painter, person, skin);
    painter.restore();
    sheet.texture(face, 1.3, 1.3, 0.028);
    painter.save();
    shortenLowerFace(painter);
    if (person.beard > 0)
        beard(sheet, person);
    mouth(sheet, person, skin);
    painter.restore();
    for (const double side : {-1.0, 1.0})
        eye(sheet, person, skin, side);
    hairInFront(sheet, person);
}

} // namespace lumora::demo
