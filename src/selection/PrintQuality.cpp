#include "selection/PrintQuality.h"

#include <algorithm>
#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

PrintGrade printGrade(PictureSize size) {
    const auto pixels = static_cast<long long>(size.width) * size.height;
    if (pixels > 800000)
        return PrintGrade::Good;
    if (pixels < 400000)
        return PrintGrade::VeryLow;
    return pixels < 800000 ? PrintGrade::Borderline : PrintGrade::Unmarked;
}

QString printGradeText(PrintGrade grade, PictureSize size, bool english) {
    const auto word = [&] {
        switch (grade) {
        case PrintGrade::Good:
            return english ? u"  Quality  "_s : u"  איכות  "_s;
        case PrintGrade::Borderline:
            return english ? u"  Borderline quality  "_s : u"  איכות גבולית  "_s;
        case PrintGrade::VeryLow:
            return english ? u"  Very low quality  "_s : u"  איכות נמוכה מאוד  "_s;
        case PrintGrade::Unmarked:
            break;
        }
        return QString();
    };
    if (grade == PrintGrade::Unmarked)
        return {};
    return word() + QString::number(size.height) + u" / "_s + QString::number(size.width);
}

PictureSize largeViewSize(PictureSize picture) {
    const float ratio = static_cast<float>(picture.height) / static_cast<float>(std::max(picture.width, 1));
    const int width = ratio >= 1 ? 300 : 400;
    return {width, std::max(1, static_cast<int>(std::lround(static_cast<float>(width) * ratio)))};
}

} // namespace lumora
