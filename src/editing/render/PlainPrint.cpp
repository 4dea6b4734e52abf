#include "editing/render/PlainPrint.h"

#include "common/FixedText.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

PictureSize paperPictureSize(PictureSize source, PaperSize paper) {
    const int width = paperSides(paper, orientationOf(source)).width() * pixelsPerCentimetre;
    // The product is computed first since it is exact, so that a height that ends in one half is recognised.
    const double height = static_cast<double>(width) * source.height / std::max(source.width, 1);
    const long long rounded = RoundHalfEven(height);
    if (width > source.width || rounded > source.height)
        return source;
    return {width, static_cast<int>(rounded)};
}

PaperFit paperFitOf(const QString& fillFit) {
    return fillFit == u"FIT"_s ? PaperFit::Fit : PaperFit::Fill;
}

double pixelsPerCentimetreOf(PictureSize pixels, PaperSize paper, PaperFit fit) {
    const QSizeF sides = paperSides(paper, orientationOf(pixels));
    const double across = pixels.width / sides.width();
    const double down = pixels.height / sides.height();
    return fit == PaperFit::Fill ? std::min(across, down) : std::max(across, down);
}

QRectF paperOnPicture(PictureSize picture, PaperSize paper, PaperFit fit) {
    const double scale = pixelsPerCentimetreOf(picture, paper, fit);
    const QSizeF sides = paperSides(paper, orientationOf(picture));
    const double width = sides.width() * scale / std::max(picture.width, 1);
    const double height = sides.height() * scale / std::max(picture.height, 1);
    return {(1 - width) / 2, (1 - height) / 2, width, height};
}

} // namespace lumora
