#include "editing/render/PrintResolution.h"

#include <algorithm>

namespace lumora {

namespace {

constexpr double centimetresPerInch = 2.54;
constexpr double roundingError = 1e-6;
constexpr int leastSharp = 200; // dots per inch
constexpr int leastFair = 120;

} // namespace

PrintResolution::PrintResolution(double pixelsOnCentimetre)
    : m_dots(static_cast<int>(pixelsOnCentimetre * centimetresPerInch + roundingError)) {}

PrintResolution PrintResolution::ofPlain(PictureSize picture, PaperSize paper, PaperFit fit, Sent sent) {
    const PictureSize pixels = sent == Sent::Whole ? picture : paperPictureSize(picture, paper);
    return PrintResolution(pixelsPerCentimetreOf(pixels, paper, fit));
}

PrintResolution PrintResolution::ofEdited(PictureSize picture, PaperSize paper, const EditFields& edit) {
    const PaperOrientation orientation = orientationOf(picture);
    const PrintGeometry print = printGeometry(paper, orientation);
    const PictureSize drawn = printPlacement(picture, print, edit).zoomed();
    const double across = static_cast<double>(picture.width) / drawn.width;
    const double down = static_cast<double>(picture.height) / drawn.height;
    const double ofPrint = static_cast<double>(print.size.width) / paperSides(paper, orientation).width();
    return PrintResolution(std::min({across, down, 1.0}) * ofPrint);
}

PrintResolution::Grade PrintResolution::grade() const {
    return m_dots >= leastSharp ? Grade::Sharp : m_dots >= leastFair ? Grade::Fair : Grade::Coarse;
}

} // namespace lumora
