#include "imaging/files/OtherPictures.h"

#include "common/HostFile.h"

#include <QBuffer>
#include <QFile>
#include <QImageReader>
#include <QtEndian>

#include <algorithm>
#include <cerrno>
#include <mutex>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

Result<QByteArray> readBytes(PictureInput& input, std::int64_t count) {
    QByteArray bytes(count, Qt::Uninitialized);
    qsizetype filled = 0;
    while (filled < bytes.size()) {
        const std::ptrdiff_t got = input.read(bytes.data() + filled, static_cast<std::size_t>(bytes.size() - filled));
        if (got < 0)
            return fileFailure(input.path(), u"can't be read"_s, errno);
        if (got == 0)
            break;
        filled += got;
    }
    bytes.truncate(filled);
    return bytes;
}

// Qt's reader of BMP files takes an absurd size for damage, and takes a file that is cut short for whole, the rest
// black; both are checked here.
Result<void> checkBmp(PictureInput& input, const QByteArray& bytes) {
    constexpr qsizetype headers = 14 + 40;
    const auto* data = reinterpret_cast<const uchar*>(bytes.constData());
    const bool oldHeader = bytes.size() >= 18 && qFromLittleEndian<quint32>(data + 14) == 12;
    if (oldHeader)
        return {};
    const auto cutShort = [&] {
        return pictureFailure(input.path(), Failure::Kind::Damaged, u"the picture is cut short"_s);
    };
    if (bytes.size() < headers)
        return cutShort();
    const qint64 offset = qFromLittleEndian<quint32>(data + 10);
    const qint64 width = qFromLittleEndian<qint32>(data + 18);
    const qint64 height = qAbs(static_cast<qint64>(qFromLittleEndian<qint32>(data + 22)));
    const qint64 bits = qFromLittleEndian<quint16>(data + 28);
    const auto compression = qFromLittleEndian<quint32>(data + 30);
    if (auto bounds = checkPictureBounds(input.path(), width, height); !bounds)
        return bounds;
    const bool runLengths =
        compression == 1 || compression == 2; // the header does not tell the length of compressed rows
    if (!runLengths && offset + (width * bits + 31) / 32 * 4 * height > input.size())
        return cutShort();
    return {};
}

// Of a BMP file, which may have 150 MB, only the headers are read ahead; Qt takes the rows from the file one by one.
template <class Value, class Use>
Result<Value> withReader(PictureInput& input, const Use& use) {
    // checkPictureBounds refuses what is too large; Qt's limit of 128 MiB would refuse good pictures.
    static std::once_flag limitLifted;
    std::call_once(limitLifted, [] { QImageReader::setAllocationLimit(0); });

    constexpr std::int64_t headers = 4096;
    const bool bmp = input.format() == PictureInput::Format::Bmp;
    auto bytes = readBytes(input, bmp ? std::min(headers, input.size()) : input.size());
    if (!bytes)
        return bytes.failure();
    QBuffer buffer(&*bytes);
    QFile file;
    if (bmp) {
        if (auto checked = checkBmp(input, *bytes); !checked)
            return checked.failure();
        if (!file.open(input.descriptor(), QIODevice::ReadOnly) || !file.seek(0))
            return fileFailure(input.path(), u"can't be read"_s, errno);
    } else {
        buffer.open(QIODevice::ReadOnly);
    }
    QImageReader reader(bmp ? static_cast<QIODevice*>(&file) : &buffer, bmp ? "bmp" : "png");
    reader.setAutoTransform(false);
    const QSize size = reader.size();
    if (!size.isValid())
        return pictureFailure(input.path(), Failure::Kind::Damaged, u"the picture is damaged or cut short"_s);
    if (auto bounds = checkPictureBounds(input.path(), size.width(), size.height()); !bounds)
        return bounds.failure();
    return use(reader);
}

} // namespace

Result<PictureSize> readOtherPictureSize(PictureInput& input) {
    return withReader<PictureSize>(input, [](QImageReader& reader) -> Result<PictureSize> {
        return PictureSize{reader.size().width(), reader.size().height()};
    });
}

Result<Bitmap> readOtherPicture(PictureInput& input) {
    return withReader<Bitmap>(input, [&input](QImageReader& reader) -> Result<Bitmap> {
        QImage image = reader.read();
        if (image.isNull())
            return pictureFailure(input.path(), Failure::Kind::Damaged, u"the picture is damaged or cut short"_s);
        image.convertTo(image.hasAlphaChannel() ? QImage::Format_ARGB32_Premultiplied : QImage::Format_RGB32);
        if (image.isNull())
            return pictureFailure(input.path(), Failure::Kind::TooLarge, u"memory is short"_s);
        return Bitmap(std::move(image));
    });
}

} // namespace lumora
