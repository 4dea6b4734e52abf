#include "assembly/PaperResize.h"

#include "common/FixedText.h"
#include "platform/files/HostPath.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

PictureSize paperPictureSize(PictureSize source, PaperSize paper) {
    const double ratio = static_cast<double>(source.height) / std::max(source.width, 1);
    const int width = (ratio >= 1 ? paper.shortSide : paper.longSide) * pixelsPerCentimetre;
    // The product is computed first since it is exact, so that a height that ends in one half is recognised.
    const double height = static_cast<double>(width) * source.height / std::max(source.width, 1);
    const long long rounded = RoundHalfEven(height);
    if (width > source.width || rounded > source.height)
        return source;
    return {width, static_cast<int>(rounded)};
}

Result<QByteArray> resizeToPaper(const std::filesystem::path& source, PaperSize paper) {
    const Result<PictureSize> size = readPictureSize(source);
    if (!size)
        return size.failure();
    const PictureSize target = paperPictureSize(*size, paper);
    if (target.width < 1 || target.height < 1)
        return Failure{Failure::Kind::Damaged,
                       u"%1: nothing is left of a picture of %2 x %3 on this paper"_s.arg(toText(source))
                           .arg(size->width)
                           .arg(size->height)};
    return scalePictureToJpeg(source, target, printQuality);
}

} // namespace lumora
