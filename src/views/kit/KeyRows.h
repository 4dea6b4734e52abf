#pragma once

#include "views/kit/Maker.h"

#include <array>
#include <vector>

namespace lumora {

// Keys as they lie on a real keyboard, beside digits as on a telephone. They run from left to right in every language.
struct KeyRows {
    static constexpr int columns = 10;
    static constexpr int width = columns + 1; // of the row below the letters

    struct Wide {
        QPushButton* key;
        int columns;
    };

    std::vector<QPushButton*> letters; // row by row from the left
    QPushButton* back = nullptr;       // takes back a letter
    QPushButton* enter = nullptr;
    std::vector<Wide> bottom;
    std::array<QPushButton*, 10> digits{};
    std::array<QPushButton*, 2> besideZero{}; // where there is none, the zero is wider
};

// The look and the size of a key. A quiet button becomes a key with words on it.
QPushButton* toKey(QPushButton* made, const Theme& theme);

QWidget* inKeyRows(const Maker& maker, const Theme& theme, const KeyRows& keys);
// The digits, and behind them what edits, if there is anything.
QWidget* inDigitRows(const Maker& maker, const Theme& theme, const KeyRows& keys);

} // namespace lumora
