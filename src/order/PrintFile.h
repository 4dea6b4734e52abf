#pragma once

#include "common/Result.h"

#include <QByteArray>

#include <cstdint>

// The print file (.jpp): a picture file cut into numbered pieces, the noted piece length, and the order's tail.
// docs/formats.md has its table.
namespace lumora {

struct ClientProfile;

// The two numbers of the client profile that writer and reader of a print file share.
struct PrintFileShape {
    int chunks = 56; // number of pieces, 1 to 32767
    int base = 30;   // added to the piece length where the file notes it

    static PrintFileShape of(const ClientProfile& profile);
};

// The bytes of a print file. The lab's reader relies on two oddities. The piece length is rounded, ties to even, so
// that the pieces may reach past the end of the picture and are filled with zeros there. (Picture length modulo chunks)
// more bytes follow the last piece in any case. Fails when chunks is out of range.
Result<QByteArray> packPrintFile(const QByteArray& picture, PrintFileShape shape, const QByteArray& tail);

struct PrintFileContent {
    QByteArray picture;
    std::int64_t piece = 0;     // piece length in bytes, without the base
    std::int64_t remainder = 0; // bytes behind the last piece
    QByteArray tail;            // 40, 60 or 0 bytes
};

// Takes a print file apart. It is damaged unless every piece has its number and the noted length fits the file. When
// the length was rounded at exactly one half, the numbers do not tell whether the last chunks bytes belong to the
// picture; zeros are filling then, since no whole JPEG file ends in them.
Result<PrintFileContent> readPrintFile(const QByteArray& bytes, PrintFileShape shape);

} // namespace lumora
