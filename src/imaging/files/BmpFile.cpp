#include "imaging/files/BmpFile.h"

#include <QByteArray>
#include <QtEndian>

#include <algorithm>
#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 headerSize = 14 + 40;
constexpr qint64 pixelSize = 3;

qint64 rowSize(int width) {
    return (width * pixelSize + 3) / 4 * 4;
}

qint64 fileSize(QSize picture) {
    return headerSize + rowSize(picture.width()) * picture.height();
}

QByteArray header(QSize picture) {
    QByteArray bytes(headerSize, '\0');
    uchar* at = reinterpret_cast<uchar*>(bytes.data());
    at[0] = 'B';
    at[1] = 'M';
    qToLittleEndian<quint32>(static_cast<quint32>(fileSize(picture)), at + 2);
    qToLittleEndian<quint32>(headerSize, at + 10);
    qToLittleEndian<quint32>(40, at + 14);
    qToLittleEndian<qint32>(picture.width(), at + 18);
    qToLittleEndian<qint32>(picture.height(), at + 22);
    qToLittleEndian<quint16>(1, at + 26);
    qToLittleEndian<quint16>(pixelSize * 8, at + 28);
    qToLittleEndian<quint32>(static_cast<quint32>(fileSize(picture) - headerSize), at + 34);
    constexpr qint32 pixelsPerMetre = 11811; // 300 to the inch
    qToLittleEndian<qint32>(pixelsPerMetre, at + 38);
    qToLittleEndian<qint32>(pixelsPerMetre, at + 42);
    return bytes;
}

void packRow(const QRgb* from, int count, char* to) {
    for (int i = 0; i < count; ++i, to += pixelSize) {
        to[0] = static_cast<char>(qBlue(from[i]));
        to[1] = static_cast<char>(qGreen(from[i]));
        to[2] = static_cast<char>(qRed(from[i]));
    }
}

const QRgb* rowOf(const Bitmap& picture, int y) {
    return reinterpret_cast<const QRgb*>(picture.image().constScanLine(y));
}

// Gives the bytes of the file in parts of about 1 MiB; an empty part is the end.
class Parts {
public:
    explicit Parts(const Bitmap& picture)
        : m_picture(picture)
        , m_left(picture.height()) {}

    QByteArrayView next() {
        if (!std::exchange(m_begun, true)) {
            m_bytes = header(m_picture.image().size());
            return m_bytes;
        }
        constexpr qint64 partSize = 1 << 20;
        const qint64 row = rowSize(m_picture.width());
        const int rows = static_cast<int>(std::min<qint64>(m_left, std::max<qint64>(1, partSize / row)));
        m_bytes.resize(rows * row);
        m_bytes.fill('\0');
        for (int i = 0; i < rows; ++i)
            packRow(rowOf(m_picture, --m_left), m_picture.width(), m_bytes.data() + i * row);
        return m_bytes;
    }

private:
    const Bitmap& m_picture;
    int m_left;
    bool m_begun = false;
    QByteArray m_bytes;
};

} // namespace

Result<void> saveBmp(const Bitmap& picture, const std::filesystem::path& path) {
    NewContent content(path, QString::fromLocal8Bit(path.c_str()));
    appendBmp(picture, content, [] { return false; });
    return content.commit();
}

void appendBmp(const Bitmap& picture, NewContent& content, const std::function<bool()>& stopped) {
    Parts parts(picture);
    for (QByteArrayView part = parts.next(); !part.isEmpty() && !content.failed() && !stopped(); part = parts.next())
        content.append(part.constData(), static_cast<std::size_t>(part.size()));
}

Result<BmpRows> BmpRows::open(const std::filesystem::path& path, QSize picture) {
    Descriptor file(::open(path.c_str(), O_RDWR | O_CLOEXEC));
    struct stat status {};
    if (!file.valid() || ::fstat(file.number(), &status) != 0)
        return fileFailure(path, u"can't be opened"_s, errno);
    if (status.st_size != fileSize(picture))
        return fileFailure(path, u"is not the copy of this picture"_s, EINVAL);
    return BmpRows(path, std::move(file), picture);
}

BmpRows::BmpRows(std::filesystem::path path, Descriptor file, QSize picture)
    : m_path(std::move(path))
    , m_file(std::move(file))
    , m_picture(picture) {}

namespace {

qint64 placeOf(QSize picture, int x, int y) {
    return headerSize + rowSize(picture.width()) * (picture.height() - 1 - y) + x * pixelSize;
}

} // namespace

Result<void> BmpRows::write(const Bitmap& picture, const QRect& part) {
    QByteArray row(part.width() * pixelSize, '\0');
    for (int y = part.top(); y <= part.bottom(); ++y) {
        packRow(rowOf(picture, y) + part.left(), part.width(), row.data());
        const qint64 at = placeOf(m_picture, part.left(), y);
        if (::pwrite(m_file.number(), row.constData(), static_cast<std::size_t>(row.size()), at) != row.size())
            return fileFailure(m_path, u"can't be written"_s, errno);
    }
    return {};
}

Result<Bitmap> BmpRows::read(const QRect& part) const {
    Bitmap result(part.width(), part.height(), Qt::black);
    QByteArray row(part.width() * pixelSize, '\0');
    for (int y = 0; y < part.height(); ++y) {
        const qint64 at = placeOf(m_picture, part.left(), part.top() + y);
        if (::pread(m_file.number(), row.data(), static_cast<std::size_t>(row.size()), at) != row.size())
            return fileFailure(m_path, u"can't be read"_s, errno);
        auto* to = reinterpret_cast<QRgb*>(result.image().scanLine(y));
        const auto* from = reinterpret_cast<const uchar*>(row.constData());
        for (int x = 0; x < part.width(); ++x, from += pixelSize)
            to[x] = qRgb(from[2], from[1], from[0]);
    }
    return result;
}

} // namespace lumora
