#include "selection/PrintQuality.h"

namespace lumora {

using namespace Qt::StringLiterals;

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

} // namespace lumora
