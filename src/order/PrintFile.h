#pragma once

#include "common/Result.h"

#include <QByteArray>

#include <cstdint>

// The print file (.jpp): a picture file cut into numbered pieces, the length of a piece, and the order's tail.
// docs/formats.md has the field table.
namespace lumora {

struct ClientProfile;

// What writer and reader must agree on; the client profile holds both.
struct PrintFileShape {
    int chunks = 56; // pieces, 1 to 32767
    int base = 30;   // added to the piece length where the file notes it

    static PrintFileShape of(const ClientProfile& profile);
};

// The bytes of a print file. The layout keeps two oddities that the lab's reader relies on: the length of a piece is
// rounded, ties to even, so that the pieces may reach past the end of the picture, where zeros stand; and
// picture-length modulo chunks more bytes follow the last piece all the same. Fails when chunks is out of range.
Result<QByteArray> packPrintFile(const QByteArray& picture, PrintFileShape shape, const QByteArray& tail);

struct PrintFileContent {
    QByteArray picture;
    std::int64_t piece = 0;     // length of a piece, less the base
    std::int64_t remainder = 0; // bytes behind the last piece
    QByteArray tail;            // 40, 60 or 0 bytes
};

// Takes a print file apart. It is damaged unless every piece carries its number and the noted length fits the file.
// Where a piece was rounded at exactly one half, the numbers do not tell whether a last round of bytes is the picture's
// or filling; zeros are filling then, since no whole JPEG ends in them.
Result<PrintFileContent> readPrintFile(const QByteArray& bytes, PrintFileShape shape);

} // namespace lumora
