#pragma once

#include "common/Result.h"
#include "editing/render/PicturePlacement.h"
#include "imaging/files/PictureFile.h"

#include <QByteArray>

#include <filesystem>

// How large a plain print is, and the print itself.
namespace lumora {

inline constexpr int pixelsPerCentimetre = 120; // about 300 dots an inch
inline constexpr int printQuality = 90;

// A portrait or square picture takes the paper's short side as its width, a landscape picture the long side; the height
// follows the picture, in double precision, ties to even. What would be enlarged keeps its own size, and nothing is
// ever cut off. The height is 0 for a picture so flat that nothing of it is left.
PictureSize paperPictureSize(PictureSize source, PaperSize paper);

// The picture scaled to the paper, as the bytes of a JPEG. Touches nothing but the source file, so that it may run
// beside the thread that packs the picture before. A picture of no height is a failure.
Result<QByteArray> resizeToPaper(const std::filesystem::path& source, PaperSize paper);

} // namespace lumora
