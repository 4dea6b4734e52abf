#include "selection/PrintQuality.h"

#include <algorithm>
#include <cmath>

namespace lumora {

PrintGrade printGrade(PictureSize size) {
    const auto pixels = static_cast<long long>(size.width) * size.height;
    if (pixels > 800000)
        return PrintGrade::Good;
    if (pixels < 400000)
        return PrintGrade::VeryLow;
    return pixels < 800000 ? PrintGrade::Borderline : PrintGrade::Unmarked;
}

PictureSize largeViewSize(PictureSize picture) {
    const float ratio = static_cast<float>(picture.height) / static_cast<float>(std::max(picture.width, 1));
    const int width = ratio >= 1 ? 300 : 400;
    return {width, std::max(1, static_cast<int>(std::lround(static_cast<float>(width) * ratio)))};
}

} // namespace lumora
