#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"

#include <QByteArray>
#include <QRect>

#include <cstdint>
#include <filesystem>
#include <vector>

// Picture files: JPEG of every kind (grey, progressive, CMYK), BMP and PNG. The content decides the format, never the
// ending. The orientation noted by a camera is ignored. A damaged or cut-short file is a failure, so that no print
// comes out half grey. Files are opened for reading only. At most 65,500 pixels a side and 250 million in all, checked
// before memory is taken. All functions may be called from several threads at once.
namespace lumora {

struct PictureSize {
    int width = 0;
    int height = 0;
    bool operator==(const PictureSize&) const = default;
};

// Where the time of one picture went, in milliseconds. The stages run interleaved, row by row.
struct PictureTimes {
    double decode = 0;
    double draw = 0;
    double encode = 0;
};

// Reads the header alone.
Result<PictureSize> readPictureSize(const std::filesystem::path& path);

// About how many bytes of memory a decode takes, by the header: Rows, where it is scaled row by row if the file allows
// it, Whole, where all of its pixels are kept. Little for a file that can't be read.
enum class Decode { Rows, Whole };
std::int64_t decodingMemory(const std::filesystem::path& path, Decode decode);

Result<Bitmap> loadPicture(const std::filesystem::path& path);

// The picture resampled to exactly size (the caller keeps the proportions), with a scaled decode where that loses no
// quality.
Result<Bitmap> loadPictureScaled(const std::filesystem::path& path, PictureSize size);

// The same picture, of which only part is made. part may reach beyond the picture, where the edge is repeated.
Result<Bitmap> loadPicturePart(const std::filesystem::path& path, PictureSize size, const QRect& part);

// The picture of a JPEG file that lies in memory, scaled to a width; the height keeps the proportion.
Result<Bitmap> scaledFromJpeg(const QByteArray& file, int width);

// The size of the small picture in a square cell of cell pixels: the longer side fills the cell, the other keeps the
// proportion and is at least 1.
PictureSize smallPictureSize(PictureSize picture, int cell);

// The small pictures of a page, each of its smallPictureSize, read on all cores side by side. One result a path, in
// order; a file that can't be read fails alone.
std::vector<Result<Bitmap>> loadSmallPictures(const std::vector<std::filesystem::path>& paths, int cell);

// The picture as the bytes of a JPEG file, chroma 4:2:0. Quality is held within 0 to 100.
Result<QByteArray> encodeJpeg(const Bitmap& picture, int quality);

// The same written to path, whole or not at all.
Result<void> saveJpeg(const Bitmap& picture, const std::filesystem::path& path, int quality);

// A small picture that is wanted out of the decode of a larger one: as loadPictureScaled() makes it, but for the last
// rounding. The pixels stay null where the file would need a decode of its own for it.
struct SmallCopy {
    PictureSize size;
    Bitmap pixels = {};
};

// The picture at source, scaled to exactly size on white, as the bytes of a JPEG file: the content of a plain print. It
// changes no state, so that the next picture of an order can be prepared on another thread.
Result<QByteArray> scalePictureToJpeg(const std::filesystem::path& source, PictureSize size, int quality,
                                      PictureTimes* times = nullptr, SmallCopy* small = nullptr);

} // namespace lumora
