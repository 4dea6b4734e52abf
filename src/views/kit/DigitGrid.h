#pragma once

#include <array>

class QGridLayout;
class QPushButton;

namespace lumora {

class Theme;

// Ten keys, 0 to 9, and one that takes a digit back, placed as on a telephone, from left to right in every language
// once it lies in a box of that direction.
QGridLayout* digitGrid(const Theme& theme, const std::array<QPushButton*, 10>& digits, QPushButton* back);

} // namespace lumora
