#include "assembly/PaperResize.h"

#include "assembly/OrderSheet.h"
#include "editing/render/PlainPrint.h"
#include "platform/files/HostPath.h"

namespace lumora {

using namespace Qt::StringLiterals;

Result<QByteArray> resizeToPaper(const std::filesystem::path& source, PaperSize paper, Bitmap* sheetPicture) {
    const Result<PictureSize> size = readPictureSize(source);
    if (!size)
        return size.failure();
    const PictureSize target = paperPictureSize(*size, paper);
    if (target.width < 1 || target.height < 1)
        return Failure{Failure::Kind::Damaged,
                       u"%1: nothing is left of a picture of %2 x %3 on this paper"_s.arg(toText(source))
                           .arg(size->width)
                           .arg(size->height)};
    const SheetPlace place = sheetPlaceOf(*size);
    SmallCopy small{place.upright};
    Result<QByteArray> print =
        scalePictureToJpeg(source, target, printQuality, nullptr, sheetPicture != nullptr ? &small : nullptr);
    if (!small.pixels.isNull())
        *sheetPicture = laidOnSheet(small.pixels, place);
    return print;
}

} // namespace lumora
