#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"

#include <QByteArray>
#include <QRect>

#include <filesystem>
#include <vector>

// Picture files. What a file is goes by its content and never by its ending: JPEG of every kind (grey, progressive,
// CMYK), BMP and PNG. The orientation that a camera may have noted is ignored everywhere alike. A damaged or cut-short
// file is a failure: it must never print half grey. Files are opened for reading only. Bounds are checked before memory
// is taken: 65,500 pixels a side and 250 million in all. Every function here may be called from several threads at
// once.
namespace lumora {

struct PictureSize {
    int width = 0;
    int height = 0;
    bool operator==(const PictureSize&) const = default;
};

// Where the time of one picture went, in milliseconds. Its stages run interleaved, row by row.
struct PictureTimes {
    double decode = 0;
    double draw = 0;
    double encode = 0;
};

// From the header alone.
Result<PictureSize> readPictureSize(const std::filesystem::path& path);

// The whole picture.
Result<Bitmap> loadPicture(const std::filesystem::path& path);

// The picture shrunk smoothly to exactly size (the caller keeps the proportions), by a scaled decode where that loses
// nothing; enlarged smoothly where size is larger.
Result<Bitmap> loadPictureScaled(const std::filesystem::path& path, PictureSize size);

// The part of it that is needed. The part may reach beyond the picture, whose edge is repeated there.
Result<Bitmap> loadPicturePart(const std::filesystem::path& path, PictureSize size, const QRect& part);

// The size of the small picture in a cell: the longer side fills the cell, the other follows the proportion, at
// least 1.
PictureSize smallPictureSize(PictureSize picture, int cell);

// The small pictures of a page, each in its size of smallPictureSize, read on the machine's cores side by side. One
// result a path, in order: a file that can't be read has its failure there, and the others come all the same.
std::vector<Result<Bitmap>> loadSmallPictures(const std::vector<std::filesystem::path>& paths, int cell);

// The bytes of a JPEG file of the picture, 4:2:0. Quality 0 to 100, held within that range.
Result<QByteArray> encodeJpeg(const Bitmap& picture, int quality);

// The same into a file, written whole or not at all.
Result<void> saveJpeg(const Bitmap& picture, const std::filesystem::path& path, int quality);

// A JPEG (or another picture) scaled to exactly size on white as the bytes of a JPEG file: what a plain print is made
// of. It touches nothing but the source, so that the next picture of an order can be made ahead on another thread.
Result<QByteArray> scalePictureToJpeg(const std::filesystem::path& source, PictureSize size, int quality,
                                      PictureTimes* times = nullptr);

} // namespace lumora
