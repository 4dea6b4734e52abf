#include "People.h"
#include "Scenes.h"

namespace lumora::demo {

void drawPortrait(Sheet& sheet) {
    Dice& dice = sheet.dice();
    sheet.gradient({0, 0, 900, 1200}, {{0, {62, 56, 62}}, {1, {30, 26, 34}}});
    // The party behind her, out of the flash's reach.
    sheet.soft({-40, -40, 980, 1280}, 5, [&](QPainter& p) {
        for (int i = 0; i < 44; ++i) {
            const QPointF at(dice.in(0, 900), dice.in(0, 900));
            const double size = dice.in(14, 58);
            const QColor colours[] = {{255, 200, 110}, {250, 150, 110}, {255, 226, 170}, {150, 110, 190}};
            p.setBrush(withAlpha(colours[dice.upTo(4)], dice.in(0.12, 0.4)));
            p.drawEllipse(at, size, size);
        }
    });
    sheet.soft({0, 300, 900, 900}, 24, [&](QPainter& p) {
        for (const double x : {90.0, 800.0}) {
            p.setBrush(QColor(96, 66, 62));
            p.drawEllipse(QPointF(x, 560), 84, 104);
            p.fillPath(outline({{x - 200, 1240},
                                {x - 190, 800},
                                {x - 90, 700},
                                {x, 700},
                                {x + 90, 700},
                                {x + 190, 800},
                                {x + 200, 1240}}),
                       x < 400 ? QColor(60, 50, 84) : QColor(84, 50, 56));
        }
    });
    portray(sheet, {.style = Hair::Long, .redEyes = true});
    // The flash: bright in the middle, soon dark behind.
    sheet.glow({430, 470}, 480, QColor(255, 236, 214), 0.13);
}

void drawGroup(Sheet& sheet) {
    Dice& dice = sheet.dice();
    QPainter& painter = sheet.painter();
    // A garden in the late light.
    sheet.gradient({0, 0, 1200, 900}, {{0, {206, 222, 196}}, {0.5, {140, 170, 104}}, {1, {74, 104, 58}}});
    sheet.soft({-20, -20, 1240, 760}, 16, [&](QPainter& p) {
        p.fillRect(QRectF(180, 60, 40, 620), QColor(104, 84, 66));
        p.fillRect(QRectF(960, 40, 46, 640), QColor(110, 88, 68));
        for (int i = 0; i < 210; ++i) {
            p.setBrush(
                withAlpha(mixed(QColor(66, 106, 52), QColor(222, 226, 130), std::pow(dice.in(0, 1), 1.6)), 0.75));
            p.drawEllipse(QPointF(dice.in(-20, 1220), dice.in(-20, 620)), dice.in(18, 60), dice.in(14, 44));
        }
        for (int i = 0; i < 26; ++i) {
            p.setBrush(withAlpha(QColor(255, 246, 196), dice.in(0.2, 0.5)));
            const double size = dice.in(10, 30);
            p.drawEllipse(QPointF(dice.in(0, 1200), dice.in(0, 360)), size, size);
        }
        p.fillRect(QRectF(-30, 620, 1260, 320), QColor(112, 146, 70));
    });
    sheet.glow({1080, 40}, 620, QColor(255, 236, 170), 0.6);
    const struct {
        double x, y, size;
        Person person;
    } family[] = {
        {240,
         336,
         0.46,
         {.skin = {218, 172, 146},
          .hair = {186, 184, 184},
          .cloth = {92, 98, 128},
          .style = Hair::Thin,
          .age = 1,
          .smile = 0.75}},
        {968,
         344,
         0.44,
         {.skin = {228, 184, 160},
          .hair = {208, 206, 206},
          .iris = {84, 110, 134},
          .cloth = {150, 84, 104},
          .style = Hair::Bun,
          .age = 0.95,
          .smile = 0.8}},
        {470,
         236,
         0.49,
         {.skin = {214, 164, 132},
          .hair = {52, 36, 28},
          .cloth = {52, 84, 120},
          .style = Hair::Short,
          .age = 0.5,
          .smile = 0.75,
          .beard = 0.9}},
        {738,
         276,
         0.45,
         {.skin = {232, 186, 158},
          .hair = {112, 66, 38},
          .iris = {76, 104, 74},
          .cloth = {226, 218, 202},
          .style = Hair::Long,
          .age = 0.4,
          .smile = 0.85}},
        {372,
         570,
         0.41,
         {.skin = {232, 186, 158},
          .hair = {136, 88, 48},
          .cloth = {224, 176, 72},
          .style = Hair::Long,
          .age = 0.1,
          .smile = 0.9}},
        {634,
         592,
         0.4,
         {.skin = {226, 178, 148},
          .hair = {70, 44, 30},
          .cloth = {74, 138, 118},
          .style = Hair::Curls,
          .age = 0.08,
          .smile = 0.9}},
    };
    for (const auto& one : family) {
        painter.save();
        painter.translate(one.x, one.y);
        painter.scale(one.size, one.size);
        painter.rotate(dice.in(-2.5, 2.5));
        painter.translate(-450, -498);
        portray(sheet, one.person);
        painter.restore();
    }
    sheet.glow({1150, 100}, 700, QColor(255, 226, 160), 0.28);
}

} // namespace lumora::demo
