#include "assembly/PaperResize.h"

#include "editing/render/PlainPrint.h"
#include "platform/files/HostPath.h"

namespace lumora {

using namespace Qt::StringLiterals;

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
