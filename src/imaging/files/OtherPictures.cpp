#include "imaging/files/OtherPictures.h"

#include "common/HostFile.h"

#include <QBuffer>
#include <QIODevice>
#include <QImageReader>
#include <QtEndian>

#include <algorithm>
#include <cerrno>
#include <mutex>

#include <unistd.h>

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

// A file as a device that makes no call but pread(), as the door allows no other inside, and that remembers
// what could not be read: Qt leaves the rest of a BMP black and calls it whole.
class InputDevice : public QIODevice {
public:
    explicit InputDevice(const PictureInput& input)
        : m_input(input) {}
    qint64 size() const override { return m_input.size(); }
    bool seek(qint64 to) override {
        m_at = to;
        return QIODevice::seek(to);
    }
    bool wasCut() const { return m_cut; }
    int error() const { return m_error; }

protected:
    qint64 readData(char* target, qint64 most) override {
        const qint64 wanted = std::min(most, size() - m_at);
        qint64 got = 0;
        while (got < wanted) {
            const ssize_t part =
                ::pread(m_input.descriptor(), target + got, static_cast<std::size_t>(wanted - got), m_at + got);
            if (part < 0 && errno == EINTR)
                continue;
            if (part <= 0) {
                m_cut = true;
                m_error = part < 0 ? errno : 0;
                return -1;
            }
            got += part;
        }
        m_at += got;
        return got;
    }
    qint64 writeData(const char* /*bytes*/, qint64 /*count*/) override { return -1; }

private:
    const PictureInput& m_input;
    qint64 m_at = 0;
    bool m_cut = false;
    int m_error = 0;
};

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
    InputDevice file(input);
    if (bmp) {
        if (auto checked = checkBmp(input, *bytes); !checked)
            return checked.failure();
        file.open(QIODevice::ReadOnly | QIODevice::Unbuffered);
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
    Result<Value> result = use(reader);
    if (file.error() != 0)
        return fileFailure(input.path(), u"can't be read"_s, file.error());
    if (file.wasCut())
        return pictureFailure(input.path(), Failure::Kind::Damaged, u"the picture is damaged or cut short"_s);
    return result;
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
