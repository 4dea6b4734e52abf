// The wording of a picture's resolution, in both languages.
#include "editing/ResolutionCaption.h"
#include "editing/ResolutionWords.h"

namespace lumora {

using namespace Qt::StringLiterals;

QString ResolutionDots(const PrintResolution& resolution) {
    return u"%1 dpi"_s.arg(resolution.dotsPerInch());
}

QString ResolutionWord(PrintResolution::Grade grade, bool english) {
    switch (grade) {
    case PrintResolution::Grade::Sharp:
        return english ? u"sharp"_s : u"חדה"_s;
    case PrintResolution::Grade::Fair:
        return english ? u"fair"_s : u"סבירה"_s;
    case PrintResolution::Grade::Coarse:
        break;
    }
    return english ? u"coarse"_s : u"מפוקסלת"_s;
}

void ResolutionCaption::show(const std::optional<PrintResolution>& resolution) {
    visible = resolution.has_value();
    text = resolution ? ResolutionDots(*resolution) : QString();
    if (resolution)
        grade = resolution->grade();
}

void ResolutionCaption::show(const std::optional<PrintResolution>& resolution, const QString& paper, bool english) {
    show(resolution);
    if (resolution)
        text = (english ? u"%1 on %2: %3"_s : u"%1 בגודל %2: %3"_s)
                   .arg(ResolutionDots(*resolution), paper, ResolutionWord(resolution->grade(), english));
}

} // namespace lumora
