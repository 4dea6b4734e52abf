#pragma once

#include "imaging/Bitmap.h"

#include <QPointF>

#include <array>

namespace lumora::demo {

// A face by flash light, 3 wide to 4 high: both pupils shine red.
Bitmap portrait(int width);

// Where the red pupils are, in shares of the picture's width and height, and their radius in shares of the width.
inline constexpr std::array<QPointF, 2> redPupils = {QPointF(0.395, 0.415), QPointF(0.605, 0.415)};
inline constexpr double pupilRadius = 0.0115;

} // namespace lumora::demo
