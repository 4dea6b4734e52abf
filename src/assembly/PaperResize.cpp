#include "assembly/PaperResize.h"

#include "common/FixedText.h"

#include <algorithm>

namespace lumora {

std::optional<PaperSize> PaperSize::parse(const QString& text) {
    const PaperSize paper{static_cast<int>(Val(text.left(2))), static_cast<int>(Val(text.right(2)))};
    if (paper.shortSide <= 0 || paper.longSide <= 0)
        return std::nullopt;
    return paper;
}

PictureSize paperPictureSize(PictureSize source, PaperSize paper) {
    const double ratio = static_cast<double>(source.height) / std::max(source.width, 1);
    const int width = (ratio >= 1 ? paper.shortSide : paper.longSide) * pixelsPerCentimetre;
    const double height = static_cast<double>(RoundHalfEven(width * ratio));
    if (width > source.width || height > source.height)
        return source;
    return {width, static_cast<int>(height)};
}

Result<QByteArray> resizeToPaper(const std::filesystem::path& source, PaperSize paper) {
    const Result<PictureSize> size = readPictureSize(source);
    if (!size)
        return size.failure();
    const PictureSize target = paperPictureSize(*size, paper);
    if (target.width < 1 || target.height < 1)
        return Failure{Failure::Kind::Damaged,
                       QStringLiteral("%1: nothing is left of a picture of %2 x %3 on this paper")
                           .arg(QString::fromStdU16String(source.u16string()))
                           .arg(size->width)
                           .arg(size->height)};
    return scalePictureToJpeg(source, target, printQuality);
}

} // namespace lumora
