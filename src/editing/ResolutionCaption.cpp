#include "editing/ResolutionCaption.h"

namespace lumora {

using namespace Qt::StringLiterals;

void ResolutionCaption::show(const std::optional<PrintResolution>& resolution) {
    visible = resolution.has_value();
    text = resolution ? resolution->text() : QString();
    if (resolution)
        grade = resolution->grade();
}

void ResolutionCaption::show(const std::optional<PrintResolution>& resolution, const QString& paper, bool english) {
    show(resolution);
    if (resolution)
        text = (english ? u"%1 on %2: %3"_s : u"%1 בגודל %2: %3"_s)
                   .arg(resolution->text(), paper, resolution->word(english));
}

} // namespace lumora
