#pragma once

#include "Sheet.h"

#include <QPointF>

#include <array>

namespace lumora::demo {

enum class Hair { Short, Long, Bun, Curls, Thin };

struct Person {
    QColor skin = QColor(226, 176, 146);
    QColor hair = QColor(82, 52, 34);
    QColor iris = QColor(96, 66, 42);
    QColor cloth = QColor(46, 98, 112);
    Hair style = Hair::Short;
    double age = 0.3;     // 0 is a child, 1 an old person
    double smile = 0.8;   // 1 shows teeth
    double beard = 0;     // how dense
    bool redEyes = false; // by flash light
};

// Head and shoulders on a sheet of 900 by 1200 units, the eyes at their places there.
void portray(Sheet& sheet, const Person& person);

// Where the pupils are, in shares of the sheet's width and height, and their radius in shares of the width.
inline constexpr std::array<QPointF, 2> pupils = {QPointF(0.395, 0.415), QPointF(0.605, 0.415)};
inline constexpr double pupilRadius = 0.0115;

} // namespace lumora::demo
