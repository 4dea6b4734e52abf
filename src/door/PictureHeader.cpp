#include "door/PictureHeader.h"

#include <algorithm>
#include <cstdlib>
#include <limits>
#include <map>
#include <utility>

namespace lumora {

namespace {

constexpr qint64 headSize = 16384;
constexpr int maxParts = 2000;        // segments or chunks that are looked at
constexpr int maxDataParts = 100'000; // chunks of pixels that are passed over; large pictures have some ten thousand
constexpr qint64 maxProfile = 4 << 20;
constexpr qint64 maxExif = 1 << 20;
constexpr QByteArrayView exifMark("Exif\0\0", 6);

// Numbers of a byte sequence; a byte that lies outside is 0.
class ByteReader {
public:
    explicit ByteReader(QByteArray bytes, bool littleEndian = false)
        : m_bytes(std::move(bytes))
        , m_littleEndian(littleEndian) {}

    int byte(qint64 at) const { return at >= 0 && at < m_bytes.size() ? static_cast<uchar>(m_bytes[at]) : 0; }
    int word(qint64 at) const { return m_littleEndian ? byte(at) | byte(at + 1) << 8 : byte(at) << 8 | byte(at + 1); }
    qint64 number(qint64 at) const {
        return m_littleEndian ? word(at) | qint64(word(at + 2)) << 16 : qint64(word(at)) << 16 | word(at + 2);
    }
    QByteArrayView text(qint64 at, qint64 count) const {
        const bool isThere = at >= 0 && at <= m_bytes.size() - count;
        return isThere ? QByteArrayView(m_bytes).sliced(at, count) : QByteArrayView();
    }

private:
    QByteArray m_bytes;
    bool m_littleEndian;
};

// EXIF: directories of twelve-byte entries. Only the first, the one behind it and two fixed ones below it are read,
// each once.
class Exif {
public:
    explicit Exif(const QByteArray& tiff)
        : m_reader(isTiff(tiff) ? tiff : QByteArray(), tiff.startsWith("II")) {}

    int orientation() const {
        const int value = m_reader.word(valueOf(first(), 0x0112));
        return value >= 1 && value <= 8 ? value : 1;
    }

    bool isAdobeRgb() const {
        const qint64 camera = m_reader.number(valueOf(first(), 0x8769));
        const qint64 exchange = m_reader.number(valueOf(camera, 0xA005));
        return m_reader.text(valueOf(exchange, 0x0001), 3) == "R03";
    }

    PictureHeader::Place thumbnail() const {
        const qint64 second = m_reader.number(first() + 2 + 12 * m_reader.word(first()));
        const PictureHeader::Place place{m_reader.number(valueOf(second, 0x0201)),
                                         m_reader.number(valueOf(second, 0x0202))};
        const bool isThere = place.length >= 4 && m_reader.text(place.at, place.length).startsWith("\xFF\xD8\xFF");
        return isThere ? place : PictureHeader::Place();
    }

private:
    static constexpr qint64 outside = -16; // no number that is read there reaches into the bytes

    static bool isTiff(QByteArrayView bytes) {
        return bytes.startsWith(QByteArrayView("II*\0", 4)) || bytes.startsWith(QByteArrayView("MM\0*", 4));
    }
    qint64 first() const { return m_reader.number(4); }

    qint64 valueOf(qint64 directory, int tag) const {
        const int count = directory >= 8 ? m_reader.word(directory) : 0;
        for (int i = 0; i < count; ++i) {
            const qint64 entry = directory + 2 + 12 * i;
            if (m_reader.word(entry) == tag)
                return entry + 8;
        }
        return outside;
    }

    ByteReader m_reader;
};

void takeExif(const Exif& exif, PictureHeader& header) {
    header.orientation = exif.orientation();
    header.adobeRgb = exif.isAdobeRgb();
}

// A profile lies in numbered parts of up to 64 KB, in any order.
class ProfileParts {
public:
    void add(const QByteArray& body) {
        const ByteReader fields(body);
        const int number = fields.byte(12);
        m_total = fields.byte(13);
        m_size += body.size();
        if (m_size > maxProfile || number < 1 || !m_parts.emplace(number, body.sliced(14)).second)
            m_broken = true;
    }

    void take(PictureHeader& header) const {
        if (m_parts.empty())
            return;
        header.profileBroken =
            m_broken || static_cast<int>(m_parts.size()) != m_total || m_parts.rbegin()->first != m_total;
        for (const auto& [number, part] : m_parts)
            if (!header.profileBroken)
                header.profile += part;
    }

private:
    std::map<int, QByteArray> m_parts;
    int m_total = 0;
    qint64 m_size = 0;
    bool m_broken = false;
};

void readJpeg(const PictureBytes& bytes, PictureHeader& header) {
    ProfileParts profile;
    bool exifSeen = false;
    qint64 at = 2;
    for (int i = 0; i < maxParts; ++i) {
        const ByteReader head(bytes.part(at, 4));
        const int marker = head.byte(1);
        if (head.byte(0) != 0xFF || marker == 0xD9 || marker == 0xDA)
            break;
        if (marker == 0xFF || marker == 0x01 || (marker >= 0xD0 && marker <= 0xD8)) {
            at += marker == 0xFF ? 1 : 2;
            continue;
        }
        const int length = head.word(2) - 2;
        if (length < 0)
            break;
        const qint64 body = at + 4;
        const bool isFrame = marker >= 0xC0 && marker <= 0xCF && marker != 0xC4 && marker != 0xC8 && marker != 0xCC;
        const QByteArray content =
            isFrame || marker == 0xE1 || marker == 0xE2 ? bytes.part(body, length) : QByteArray();
        if (isFrame) {
            const ByteReader frame(content);
            header.size = {frame.word(3), frame.word(1)};
        } else if (!exifSeen && content.startsWith(exifMark)) {
            exifSeen = true;
            const Exif exif(content.sliced(exifMark.size()));
            takeExif(exif, header);
            header.thumbnail = exif.thumbnail();
            if (header.thumbnail.length > 0)
                header.thumbnail.at += body + exifMark.size();
        } else if (content.size() >= 14 && content.startsWith(QByteArrayView("ICC_PROFILE\0", 12))) {
            profile.add(content);
        }
        at = body + length;
    }
    profile.take(header);
}

PictureColours namedByPng(const std::optional<qint64>& gamma, const QByteArray& lights) {
    PictureColours colours;
    const ByteReader fields(lights);
    const auto light = [&fields](int i) {
        return Chromaticity{double(fields.number(8 * i)) / 100000, double(fields.number(8 * i + 4)) / 100000};
    };
    if (!lights.isEmpty()) {
        colours.white = light(0);
        colours.primaries = {light(1), light(2), light(3)};
    }
    // Writers of sRGB are told to note 45455.
    if (gamma && *gamma > 0 && (*gamma < 45000 || *gamma > 46000)) {
        colours.curve = PictureColours::Curve::Gamma;
        colours.gamma = 100000.0 / double(*gamma);
    }
    return colours;
}

void readPng(const PictureBytes& bytes, PictureHeader& header) {
    std::optional<qint64> gamma;
    QByteArray lights;
    bool isSrgb = false;
    qint64 at = 8;
    for (int parts = 0, dataParts = 0; parts < maxParts && dataParts < maxDataParts;) {
        const QByteArray head = bytes.part(at, 8);
        if (head.isEmpty())
            break;
        const ByteReader fields(head);
        const qint64 length = fields.number(0);
        const QByteArrayView name = fields.text(4, 4);
        ++(name == "IDAT" ? dataParts : parts);
        const auto content = [&](qint64 wanted) { return bytes.part(at + 8, wanted); };
        if (name == "IHDR") {
            const ByteReader sides(content(8));
            header.size = {static_cast<int>(sides.number(0) & 0x7FFFFFFF),
                           static_cast<int>(sides.number(4) & 0x7FFFFFFF)};
        } else if (name == "iCCP") {
            header.packedProfile = true;
        } else if (name == "sRGB") {
            isSrgb = true;
        } else if (name == "gAMA") {
            gamma = ByteReader(content(4)).number(0);
        } else if (name == "cHRM") {
            lights = content(32);
        } else if (name == "cICP") {
            const ByteReader codes(content(2));
            header.coded = {codes.byte(0), codes.byte(1)};
        } else if (name == "eXIf" && length <= maxExif) {
            takeExif(Exif(content(length)), header);
        }
        at += 8 + length + 4;
    }
    if (!isSrgb && (gamma || !lights.isEmpty()))
        header.named = namedByPng(gamma, lights);
}

void readWebP(const PictureBytes& bytes, PictureHeader& header) {
    qint64 at = 12;
    for (int i = 0; i < maxParts; ++i) {
        const QByteArray head = bytes.part(at, 8);
        if (head.isEmpty())
            break;
        const ByteReader fields(head, true);
        const qint64 length = fields.number(4);
        if (fields.text(0, 4) == "ICCP" && length <= maxProfile) {
            header.profile = bytes.part(at + 8, length);
        } else if (fields.text(0, 4) == "EXIF" && length <= maxExif) {
            const QByteArray exif = bytes.part(at + 8, length);
            takeExif(Exif(exif.startsWith(exifMark) ? exif.sliced(exifMark.size()) : exif), header);
        }
        at += 8 + length + length % 2;
    }
}

PictureSize bmpSize(const PictureBytes& bytes) {
    const ByteReader fields(bytes.head().first(std::min<qsizetype>(bytes.head().size(), 26)).toByteArray(), true);
    if (fields.number(14) == 12)
        return {fields.word(18), fields.word(20)};
    const auto side = [&fields](qint64 at) {
        const auto value = static_cast<qint32>(fields.number(at));
        return value > std::numeric_limits<qint32>::min() ? std::abs(value) : 0;
    };
    return {side(18), side(22)};
}

} // namespace

PictureBytes::PictureBytes(Read read)
    : m_read(std::move(read))
    , m_head(m_read(0, headSize)) {}

QByteArray PictureBytes::part(qint64 at, qint64 count) const {
    if (at >= 0 && at + count <= m_head.size())
        return m_head.sliced(at, count);
    const QByteArray bytes = m_head.size() < headSize ? QByteArray() : m_read(at, count);
    return bytes.size() == count ? bytes : QByteArray();
}

PictureHeader readPictureHeader(const PictureBytes& bytes) {
    PictureHeader header;
    header.kind = pictureKindOf(bytes.head());
    if (header.kind == PictureKind::Jpeg)
        readJpeg(bytes, header);
    else if (header.kind == PictureKind::Png)
        readPng(bytes, header);
    else if (header.kind == PictureKind::WebP)
        readWebP(bytes, header);
    else if (header.kind == PictureKind::Bmp)
        header.size = bmpSize(bytes);
    return header;
}

} // namespace lumora
