#include "door/PictureDraft.h"

#include "door/HeaderOfFile.h"
#include "door/Orientation.h"
#include "imaging/files/PictureFile.h"

#include <QBuffer>
#include <QImageReader>

namespace lumora {

namespace {

// EXIF asks for 160 by 120; some cameras put in a few times that.
constexpr int largestSide = 1024;

QImage smallPicture(QByteArray bytes) {
    QBuffer buffer(&bytes);
    QImageReader reader(&buffer, "jpg");
    const QSize size = reader.size();
    const bool fits =
        size.width() > 0 && size.height() > 0 && size.width() <= largestSide && size.height() <= largestSide;
    return fits ? reader.read() : QImage();
}

// The middle of the small picture, in the proportions of the picture.
QImage withoutBars(const QImage& small, PictureSize picture) {
    const QSize whole =
        QSize(picture.width, picture.height).scaled(small.size(), Qt::KeepAspectRatio).expandedTo({1, 1});
    return small.copy((small.width() - whole.width()) / 2, (small.height() - whole.height()) / 2, whole.width(),
                      whole.height());
}

} // namespace

Bitmap pictureDraft(const std::filesystem::path& path, int cell, Held held) {
    const auto file = openSource(path, {});
    const auto header = file ? headerOf(*file, path) : file.failure();
    if (!header || header->thumbnail.length == 0 || header->size.width < 1 || header->size.height < 1)
        return {};
    int error = 0;
    const QImage small = smallPicture(readPart(*file, header->thumbnail.at, header->thumbnail.length, error));
    if (small.isNull())
        return {};
    const PictureSize size = smallPictureSize(header->size, cell);
    Bitmap draft(withoutBars(small, header->size)
                     .scaled(size.width, size.height, Qt::IgnoreAspectRatio, Qt::SmoothTransformation)
                     .convertToFormat(QImage::Format_RGB32));
    return held == Held::Upright ? upright(std::move(draft), header->orientation) : draft;
}

Bitmap pictureDraft(const QByteArray& jpeg, int cell) {
    const QImage small = smallPicture(jpeg);
    if (small.isNull())
        return {};
    const PictureSize size = smallPictureSize({small.width(), small.height()}, cell);
    return Bitmap(small.scaled(size.width, size.height, Qt::IgnoreAspectRatio, Qt::SmoothTransformation)
                      .convertToFormat(QImage::Format_RGB32));
}

} // namespace lumora
