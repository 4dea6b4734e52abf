#pragma once

#include "common/HostFile.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"

#include <QRect>
#include <QSize>

#include <filesystem>
#include <functional>

// Bitmap files of 24 bits a pixel, uncompressed, rows from the bottom up: each pixel has its fixed place in the file.
// Transparency is not kept.
namespace lumora {

// Written row by row, so that no second copy of a large picture lies in memory; synced and renamed, the old file or the
// whole new one.
Result<void> saveBmp(const Bitmap& picture, const std::filesystem::path& path);

// The same bytes into new content, until stopped says that nobody wants them any more.
void appendBmp(const Bitmap& picture, NewContent& content, const std::function<bool()>& stopped);

// A file that saveBmp wrote, open for rewriting parts of it in place.
class BmpRows {
public:
    // Failure unless the file has the size that such a picture has.
    static Result<BmpRows> open(const std::filesystem::path& path, QSize picture);

    // Only the rows of part are touched. The picture has the file's size; part lies inside it.
    Result<void> write(const Bitmap& picture, const QRect& part);
    // The part as the file holds it.
    Result<Bitmap> read(const QRect& part) const;

private:
    BmpRows(std::filesystem::path path, Descriptor file, QSize picture);

    std::filesystem::path m_path;
    Descriptor m_file;
    QSize m_picture;
};

} // namespace lumora
