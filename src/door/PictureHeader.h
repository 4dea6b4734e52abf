#pragma once

#include "door/PictureColours.h"
#include "door/PictureKind.h"
#include "imaging/files/PictureFile.h"

#include <QByteArray>

#include <functional>
#include <optional>

// What the header of a picture file says, read by code of our own from any bytes whatever: it reads nothing outside of
// them, takes a bounded number of steps, and leaves out what it does not find. The first 16 KB are asked for once.
namespace lumora {

inline constexpr qint64 maxDoorPixels = 100'000'000;

class PictureBytes {
public:
    // Gives up to count bytes from a place of the file, fewer at its end.
    using Read = std::function<QByteArray(qint64 at, qint64 count)>;
    explicit PictureBytes(Read read);

    // The bytes from a place on; nothing where the file ends before the last of them.
    QByteArray part(qint64 at, qint64 count) const;
    QByteArrayView head() const { return m_head; }

private:
    Read m_read;
    QByteArray m_head;
};

struct PictureHeader {
    // As ISO/IEC 23091-2 numbers them: PNG's cICP, and the nclx of HEIC and AVIF.
    struct CodedColours {
        int primaries = 0;
        int transfer = 0;
    };
    struct Place {
        qint64 at = 0;
        qint64 length = 0;
    };

    PictureKind kind = PictureKind::None;
    PictureSize size;    // of JPEG, PNG and BMP, as stored
    int orientation = 1; // as EXIF counts it; of JPEG, PNG and WebP
    bool adobeRgb = false;
    QByteArray profile; // of JPEG and WebP, whole
    bool profileBroken = false;
    bool packedProfile = false; // PNG's, which only its decoder unpacks
    std::optional<CodedColours> coded;
    std::optional<PictureColours> named; // PNG's gAMA and cHRM
    Place thumbnail;                     // the JPEG file in the EXIF of a JPEG file
};

PictureHeader readPictureHeader(const PictureBytes& bytes);

} // namespace lumora
