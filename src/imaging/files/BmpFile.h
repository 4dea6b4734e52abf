#pragma once

#include "common/HostFile.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"

#include <QRect>
#include <QSize>

#include <filesystem>
#include <functional>

// Bitmap files: 24 bits a pixel, uncompressed, rows from the bottom up, so that each pixel has a fixed place in the
// file. Transparency is lost.
namespace lumora {

// Writes in parts, without a second copy of the picture in memory, to a temporary file that is synced and renamed: the
// path holds the old file or the whole new one.
Result<void> saveBmp(const Bitmap& picture, const std::filesystem::path& path);

// Appends the bytes of the file to content; stops when stopped() becomes true.
void appendBmp(const Bitmap& picture, NewContent& content, const std::function<bool()>& stopped);

// A file written by saveBmp, open for rewriting parts of it in place.
class BmpRows {
public:
    // Fails unless the file has exactly the size of such a picture's file.
    static Result<BmpRows> open(const std::filesystem::path& path, QSize picture);

    // Rewrites the pixels of part. picture has the size given to open(); part lies inside it.
    Result<void> write(const Bitmap& picture, const QRect& part);
    // The pixels of part as the file holds them.
    Result<Bitmap> read(const QRect& part) const;

private:
    BmpRows(std::filesystem::path path, Descriptor file, QSize picture);

    std::filesystem::path m_path;
    Descriptor m_file;
    QSize m_picture;
};

} // namespace lumora
