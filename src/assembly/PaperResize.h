#pragma once

#include "common/PaperSize.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"

#include <QByteArray>

#include <filesystem>

namespace lumora {

inline constexpr int printQuality = 90; // of the JPEG

// The plain print: the picture in the size of paperPictureSize(), as the bytes of a JPEG. Touches nothing but the
// source file, so that it may run beside the thread that packs the picture before. A picture of no height is a failure.
// sheetPicture becomes what sheetThumbnail() makes of the source, out of the same decode; it stays null where that
// takes a decode of its own.
Result<QByteArray> resizeToPaper(const std::filesystem::path& source, PaperSize paper, Bitmap* sheetPicture = nullptr);

} // namespace lumora
