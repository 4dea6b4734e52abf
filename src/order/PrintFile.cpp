#include "order/PrintFile.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

#include <algorithm>
#include <array>
#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 markerWidth = 10; // characters of the field with base + piece length
constexpr qint64 numberWidth = 2;  // bytes of the number behind each piece

Failure damaged(const QString& reason) {
    return {Failure::Kind::Damaged, reason};
}

std::optional<Failure> outOfRange(PrintFileShape shape) {
    if (shape.chunks >= 1 && shape.chunks <= 32767)
        return std::nullopt;
    return Failure{Failure::Kind::Unsupported, u"A print file has 1 to 32767 pieces, not %1."_s.arg(shape.chunks)};
}

// Reads the noted piece length: digits, then blanks to the end of the field. No value when the field is wrong.
std::optional<qint64> readMarker(const QByteArray& field, PrintFileShape shape) {
    const QByteArray digits = field.left(field.indexOf(' ') < 0 ? field.size() : field.indexOf(' '));
    bool ok = false;
    const qint64 marker = digits.toLongLong(&ok);
    const bool blanksBehind = field.mid(digits.size()).count(' ') == field.size() - digits.size();
    if (!ok || !blanksBehind || digits.startsWith('+') || marker < shape.base)
        return std::nullopt;
    return marker - shape.base;
}

bool piecesCarryTheirNumbers(const QByteArray& bytes, qint64 piece, int chunks) {
    for (int i = 1; i <= chunks; ++i) {
        const qint64 at = i * piece + (i - 1) * numberWidth;
        const auto low = static_cast<unsigned char>(bytes[at]);
        const auto high = static_cast<unsigned char>(bytes[at + 1]);
        if (low + 256 * high != i)
            return false;
    }
    return true;
}

// The length of the picture in taken, the bytes of all pieces and the remainder.
qint64 pictureLength(const QByteArray& taken, qint64 piece, qint64 remainder, int chunks) {
    const bool cameOut = 2 * remainder < chunks;
    if (cameOut)
        return taken.size();
    const bool roundedUp = 2 * remainder > chunks;
    const bool filled = std::all_of(taken.end() - std::min<qint64>(chunks, taken.size()), taken.end(),
                                    [](char byte) { return byte == 0; });
    return piece > 0 && (roundedUp || filled) ? taken.size() - chunks : taken.size();
}

} // namespace

PrintFileShape PrintFileShape::of(const ClientProfile& profile) {
    return {profile.JppChunks, profile.JppBase};
}

Result<QByteArray> packPrintFile(const QByteArray& picture, PrintFileShape shape, const QByteArray& tail) {
    if (const auto failure = outOfRange(shape))
        return *failure;
    const qint64 length = picture.size();
    const qint64 piece = RoundHalfEven(static_cast<double>(length) / shape.chunks);
    const qint64 remainder = length % shape.chunks;

    QByteArray bytes;
    bytes.reserve(shape.chunks * (piece + numberWidth) + remainder + markerWidth + tail.size());
    qint64 position = 0;
    const auto take = [&](qint64 count) {
        const qint64 left = std::clamp<qint64>(length - position, 0, count);
        bytes.append(picture.constData() + std::min(position, length), left);
        bytes.append(count - left, '\0');
        position += count;
    };
    for (int i = 1; i <= shape.chunks; ++i) {
        take(piece);
        bytes.append(static_cast<char>(i & 0xFF));
        bytes.append(static_cast<char>(i >> 8));
    }
    take(remainder);
    bytes.append(LeftField(QString::number(shape.base + piece), markerWidth).toLatin1());
    bytes.append(tail);
    return bytes;
}

Result<PrintFileContent> readPrintFile(const QByteArray& bytes, PrintFileShape shape) {
    if (const auto failure = outOfRange(shape))
        return *failure;
    constexpr std::array<qint64, 3> tailWidths = {40, 60, 0};
    bool markerSeen = false;
    for (const qint64 tailWidth : tailWidths) {
        const qint64 bodyEnd = bytes.size() - tailWidth - markerWidth;
        if (bodyEnd < 0)
            continue;
        const std::optional<qint64> piece = readMarker(bytes.mid(bodyEnd, markerWidth), shape);
        if (!piece)
            continue;
        markerSeen = true;
        if (*piece > bodyEnd / shape.chunks)
            continue;
        const qint64 remainder = bodyEnd - shape.chunks * (*piece + numberWidth);
        if (remainder < 0 || remainder >= shape.chunks || !piecesCarryTheirNumbers(bytes, *piece, shape.chunks))
            continue;

        PrintFileContent content{{}, *piece, remainder, bytes.right(tailWidth)};
        content.picture.reserve(shape.chunks * *piece + remainder);
        for (int i = 0; i < shape.chunks; ++i)
            content.picture.append(bytes.constData() + i * (*piece + numberWidth), *piece);
        content.picture.append(bytes.constData() + bodyEnd - remainder, remainder);
        content.picture.truncate(pictureLength(content.picture, *piece, remainder, shape.chunks));
        return content;
    }
    if (markerSeen)
        return damaged(u"The file does not fall into %1 numbered pieces of the length that it notes "
                       u"(base %2)."_s.arg(shape.chunks)
                           .arg(shape.base));
    return damaged(u"No length of a piece stands before the tail: no print file, or one of another base."_s);
}

} // namespace lumora
