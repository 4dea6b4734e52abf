#include "door/PictureKind.h"

#include <QtEndian>

#include <algorithm>

namespace lumora {

namespace {

// The brands of an ISO media file: the main one at 8, the compatible ones from 16 on. A general brand (mif1) leaves it
// to the others.
PictureKind kindOfBrands(QByteArrayView head) {
    const auto boxSize = static_cast<qsizetype>(qFromBigEndian<quint32>(head.data()));
    const qsizetype end = std::min(boxSize, head.size());
    PictureKind kind = PictureKind::None;
    for (qsizetype at = 8; at + 4 <= end; at += at == 8 ? 8 : 4) {
        const QByteArrayView brand = head.sliced(at, 4);
        if (brand == "avif" || brand == "avis")
            return PictureKind::Avif;
        if (brand.startsWith("hei") || brand.startsWith("hev") || brand == "mif1" || brand == "msf1")
            kind = PictureKind::Heif;
    }
    return kind;
}

bool isBmp(QByteArrayView head) {
    constexpr quint32 infoSizes[] = {12, 40, 52, 56, 64, 108, 124};
    return head.startsWith("BM") && head.size() >= 18 &&
           std::ranges::find(infoSizes, qFromLittleEndian<quint32>(head.data() + 14)) != std::end(infoSizes);
}

} // namespace

PictureKind pictureKindOf(QByteArrayView head) {
    const auto startsWith = [head](QByteArrayView bytes) { return head.startsWith(bytes); };
    if (startsWith("\xFF\xD8\xFF"))
        return PictureKind::Jpeg;
    if (startsWith("\x89PNG\r\n\x1A\n"))
        return PictureKind::Png;
    if (head.size() >= 12 && head.sliced(4, 4) == "ftyp")
        return kindOfBrands(head);
    if (head.size() >= 12 && startsWith("RIFF") && head.sliced(8, 4) == "WEBP")
        return PictureKind::WebP;
    if (startsWith(QByteArrayView("II*\0", 4)) || startsWith(QByteArrayView("MM\0*", 4)))
        return PictureKind::Tiff;
    if (startsWith("GIF87a") || startsWith("GIF89a"))
        return PictureKind::Gif;
    return isBmp(head) ? PictureKind::Bmp : PictureKind::None;
}

} // namespace lumora
