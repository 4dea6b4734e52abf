#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"

#include <filesystem>

// Picture files. What a file is goes by its content and never by its ending: JPEG of every kind (grey, progressive, CMYK), BMP and PNG.
// The orientation that a camera may have noted is ignored everywhere alike. A damaged or cut-short file is a failure: it must
// never print half grey. Files are opened for reading only. Bounds are checked before memory is taken: 65,500 pixels a side.
namespace lumora {

struct PictureSize {
    int width = 0;
    int height = 0;
    bool operator==(const PictureSize&) const = default;
};

// From the header alone.
Result<PictureSize> readPictureSize(const std::filesystem::path& path);

// The whole picture.
Result<Bitmap> loadPicture(const std::filesystem::path& path);

// The picture shrunk smoothly to exactly size (the caller keeps the proportions), by a scaled decode where that loses nothing;
// enlarged smoothly where size is larger.
Result<Bitmap> loadPictureScaled(const std::filesystem::path& path, PictureSize size);

// Quality 0 to 100, held within that range; 4:2:0. Written whole or not at all.
Result<void> saveJpeg(const Bitmap& picture, const std::filesystem::path& path, int quality);

// A JPEG (or another picture) scaled to exactly size on white and saved as JPEG: what a plain print is made of.
Result<void> scalePictureFile(const std::filesystem::path& source, const std::filesystem::path& target, PictureSize size,
                              int quality);

} // namespace lumora
