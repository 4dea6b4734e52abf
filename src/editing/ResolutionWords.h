#pragma once

#include "editing/render/PrintResolution.h"

#include <QString>

namespace lumora {

// The words of a picture's resolution, in the file of its caption's texts.
QString ResolutionDots(const PrintResolution& resolution);          // "304 dpi"
QString ResolutionWord(PrintResolution::Grade grade, bool english); // "sharp"

} // namespace lumora
