#include "door/UprightJpeg.h"

#include "door/Orientation.h"
#include "imaging/Bitmap.h"
#include "imaging/drawing/Drawing.h"
#include "imaging/scaling/Resample.h"

#include <QtEndian>

#include <algorithm>
#include <array>
#include <memory>
#include <utility>

#include <turbojpeg.h>

namespace lumora {

namespace {

constexpr int turnedQuality = 97;
constexpr int decodedQuality = 95;
constexpr int smallQuality = 85;
constexpr int smallCell = 160;
constexpr int listCell = 512;

struct TurboReleaser {
    void operator()(void* handle) const { tjDestroy(handle); }
};
using Turbo = std::unique_ptr<void, TurboReleaser>;

struct TurboBuffer {
    TurboBuffer() = default;
    TurboBuffer(const TurboBuffer&) = delete;
    TurboBuffer& operator=(const TurboBuffer&) = delete;
    ~TurboBuffer() { tjFree(bytes); }
    QByteArray copy() const { return {reinterpret_cast<const char*>(bytes), static_cast<qsizetype>(size)}; }

    unsigned char* bytes = nullptr;
    unsigned long size = 0;
};

// Empty where a block at the edge can't be turned, or the file has a fault that decoding will name.
QByteArray turnedBlocks(const QByteArray& jpeg, int orientation) {
    constexpr std::array<int, 9> operations{TJXOP_NONE,      TJXOP_NONE,  TJXOP_HFLIP,      TJXOP_ROT180, TJXOP_VFLIP,
                                            TJXOP_TRANSPOSE, TJXOP_ROT90, TJXOP_TRANSVERSE, TJXOP_ROT270};
    tjtransform transform{};
    transform.op = operations[static_cast<std::size_t>(orientation)];
    transform.options = TJXOPT_PERFECT | TJXOPT_COPYNONE;
    const Turbo turbo(tjInitTransform());
    TurboBuffer turned;
    const bool done = turbo && tjTransform(turbo.get(), reinterpret_cast<const unsigned char*>(jpeg.constData()),
                                           static_cast<unsigned long>(jpeg.size()), 1, &turned.bytes, &turned.size,
                                           &transform, TJFLAG_LIMITSCANS) == 0;
    return done ? turned.copy() : QByteArray();
}

QByteArray encoded(const QImage& picture, int quality) {
    constexpr int pixels = Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? TJPF_BGRX : TJPF_XRGB;
    const Turbo turbo(tjInitCompress());
    TurboBuffer jpeg;
    const bool done = turbo && tjCompress2(turbo.get(), picture.constBits(), picture.width(),
                                           static_cast<int>(picture.bytesPerLine()), picture.height(), pixels,
                                           &jpeg.bytes, &jpeg.size, TJSAMP_444, quality, TJFLAG_ACCURATEDCT) == 0;
    return done ? jpeg.copy() : QByteArray();
}

// The segment of a small picture: an EXIF directory that says "upright", and a second one with the picture's place.
QByteArray thumbnailSegment(const QByteArray& small) {
    QByteArray bytes;
    const auto word = [&bytes](int value) {
        bytes += static_cast<char>(value >> 8);
        bytes += static_cast<char>(value & 255);
    };
    const auto entry = [&word](int tag, int type, qsizetype value) {
        constexpr int shortWord = 3;
        word(tag);
        word(type);
        word(0);
        word(1);
        word(type == shortWord ? static_cast<int>(value) : static_cast<int>(value >> 16));
        word(type == shortWord ? 0 : static_cast<int>(value & 0xFFFF));
    };
    const auto next = [&word](int offset) {
        word(0);
        word(offset);
    };
    constexpr int firstDirectory = 8;
    constexpr int secondDirectory = firstDirectory + 2 + 12 + 4;
    constexpr int picture = secondDirectory + 2 + 3 * 12 + 4;
    word(0xFFE1);
    word(2 + 6 + picture + static_cast<int>(small.size()));
    bytes.append("Exif\0\0MM\0*", 10);
    next(firstDirectory);
    word(1);
    entry(0x0112, 3, 1);
    next(secondDirectory);
    word(3);
    entry(0x0103, 3, 6);
    entry(0x0201, 4, picture);
    entry(0x0202, 4, small.size());
    next(0);
    return bytes + small;
}

QByteArray withThumbnail(QByteArray jpeg, const Bitmap& picture) {
    const PictureSize size = smallPictureSize({picture.width(), picture.height()}, smallCell);
    const Bitmap small = resampled(picture, size);
    const QByteArray segment = thumbnailSegment(small.isNull() ? QByteArray() : encoded(small.image(), smallQuality));
    constexpr qsizetype largestSegment = 2 + 65535;
    // Behind the segment that the encoder begins with.
    const qsizetype at = 4 + qFromBigEndian<quint16>(jpeg.constData() + 4);
    return segment.size() <= largestSegment ? jpeg.insert(at, segment) : jpeg;
}

// The picture in sRGB; null when memory is short.
QImage inSrgb(StoredPicture& picture) {
    std::optional<SrgbConversion> conversion;
    if (picture.colours.source == HeaderColours::Source::Profile)
        conversion = SrgbConversion::ofProfile(picture.profile, picture.pixels);
    else if (picture.colours.source == HeaderColours::Source::Named)
        conversion = SrgbConversion::ofColours(picture.colours.named);
    if (conversion && conversion->fits(picture.image))
        return conversion->converted(std::move(picture.image));
    picture.colours.profileIgnored |= picture.colours.source != HeaderColours::Source::None;
    return std::move(picture.image);
}

} // namespace

DoorStatus makeUprightJpeg(StoredPictureReader& reader, QByteArray& jpeg) {
    const PictureHeader& header = reader.header();
    const bool onlyTurned = doorNeedOf(header, {}) == DoorNeed::Turn;
    const auto done = [](bool profileIgnored) {
        return profileIgnored ? DoorStatus::ProfileIgnored : DoorStatus::Done;
    };
    if (onlyTurned) {
        if (const auto bounds = checkPictureBounds({}, header.size.width, header.size.height); !bounds)
            return doorStatusOf(bounds.failure());
        jpeg = turnedBlocks(reader.bytes(), header.orientation);
        if (!jpeg.isEmpty())
            return done(coloursOf(header).profileIgnored);
    }
    StoredPicture stored;
    if (const DoorStatus read = reader.read(stored); read != DoorStatus::Done)
        return read;
    Bitmap picture = onWhite(Bitmap(inSrgb(stored)));
    stored.image = QImage();
    picture = upright(std::move(picture), stored.orientation);
    jpeg = picture.isNull() ? QByteArray() : encoded(picture.image(), onlyTurned ? turnedQuality : decodedQuality);
    if (jpeg.isEmpty())
        return DoorStatus::TooLarge;
    jpeg = withThumbnail(std::move(jpeg), picture);
    return done(stored.colours.profileIgnored);
}

DoorStatus makeDraftJpeg(StoredPictureReader& reader, QByteArray& jpeg) {
    StoredPicture stored;
    if (const DoorStatus read = reader.readDraft(stored); read != DoorStatus::Done)
        return read;
    const Bitmap picture = onWhite(Bitmap(inSrgb(stored)));
    jpeg = picture.isNull() ? QByteArray() : encoded(picture.image(), smallQuality);
    return jpeg.isEmpty() ? DoorStatus::TooLarge : DoorStatus::Done;
}

DoorStatus makeListJpeg(StoredPictureReader& reader, QByteArray& jpeg) {
    if (makeDraftJpeg(reader, jpeg) == DoorStatus::Done)
        return DoorStatus::Done;
    StoredPicture stored;
    if (const DoorStatus read = reader.read(stored); read != DoorStatus::Done)
        return read;
    Bitmap small = onWhite(Bitmap(inSrgb(stored)));
    if (std::max(small.width(), small.height()) > listCell)
        small = resampled(small, smallPictureSize({small.width(), small.height()}, listCell));
    small = upright(std::move(small), stored.orientation);
    jpeg = small.isNull() ? QByteArray() : encoded(small.image(), smallQuality);
    return jpeg.isEmpty() ? DoorStatus::TooLarge : DoorStatus::Done;
}

} // namespace lumora
