#include "views/kit/KeyRows.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

void addDigits(QGridLayout& grid, const KeyRows& keys, int column) {
    for (int digit = 1; digit <= 9; ++digit)
        grid.addWidget(keys.digits[static_cast<std::size_t>(digit)], (digit - 1) / 3, column + (digit - 1) % 3);
    int from = column;
    int width = 3;
    if (keys.besideZero[0]) {
        grid.addWidget(keys.besideZero[0], 3, from++);
        --width;
    }
    if (keys.besideZero[1])
        grid.addWidget(keys.besideZero[1], 3, from + --width);
    grid.addWidget(keys.digits[0], 3, from, 1, width);
    for (int i = 0; i < 3; ++i)
        grid.setColumnStretch(column + i, 10);
}

void makeTall(QPushButton& key) {
    key.setMaximumHeight(QWIDGETSIZE_MAX);
    key.setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
}

} // namespace

QPushButton* toKey(QPushButton* made, const Theme& theme) {
    setRole(made, made->property("role") == u"quiet"_s ? "wordKey" : "key");
    made->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    made->setFixedHeight(std::max(theme.least(), theme.px(50)));
    return made;
}

QWidget* inKeyRows(const Maker& maker, const Theme& theme, const KeyRows& keys) {
    QGridLayout* grid = maker.inGrid(Space::Tight);
    for (int at = 0; at < static_cast<int>(keys.letters.size()); ++at)
        grid->addWidget(keys.letters[static_cast<std::size_t>(at)], at / KeyRows::columns, at % KeyRows::columns);
    grid->addWidget(keys.back, 0, KeyRows::columns);
    makeTall(*keys.enter);
    grid->addWidget(keys.enter, 1, KeyRows::columns, 2, 1);
    int column = 0;
    for (const KeyRows::Wide& wide : keys.bottom) {
        grid->addWidget(wide.key, 3, column, 1, wide.columns);
        column += wide.columns;
    }
    for (int i = 0; i < KeyRows::columns; ++i)
        grid->setColumnStretch(i, 10);
    grid->setColumnStretch(KeyRows::columns, 16);
    grid->setColumnMinimumWidth(KeyRows::width, theme.size(Space::Small));
    addDigits(*grid, keys, KeyRows::width + 1);
    return maker.leftToRight(grid);
}

QWidget* inDigitRows(const Maker& maker, const Theme& theme, const KeyRows& keys) {
    QGridLayout* grid = maker.inGrid(Space::Tight);
    addDigits(*grid, keys, 0);
    if (keys.back) {
        grid->setColumnMinimumWidth(3, theme.size(Space::Small));
        grid->setColumnStretch(4, 14);
        grid->addWidget(keys.back, 0, 4);
        makeTall(*keys.enter);
        grid->addWidget(keys.enter, 1, 4, 2, 1);
        grid->addWidget(keys.bottom.front().key, 3, 4);
    }
    return maker.leftToRight(grid);
}

} // namespace lumora
