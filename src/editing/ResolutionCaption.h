#pragma once

#include "editing/render/PrintResolution.h"
#include "session/Caption.h"

#include <optional>

namespace lumora {

// The mark of a picture that tells its resolution: words, and the grade, which gives it a sign and a colour. Hidden
// where there is none to tell.
struct ResolutionCaption : Caption {
    using Caption::Caption;
    PrintResolution::Grade grade = PrintResolution::Grade::Sharp;

    // "304 dpi"
    void show(const std::optional<PrintResolution>& resolution);
    // "304 dpi on 10/15: sharp"
    void show(const std::optional<PrintResolution>& resolution, const QString& paper, bool english);
};

} // namespace lumora
