#pragma once

#include "common/DrivePath.h"

#include <QString>

#include <cstdint>
#include <optional>

namespace lumora {

struct BasketLine;
enum class OrderKind : std::int16_t;

// The name of a print file: print code, number of the basket line, kind of order, and the picture's own name in
// hexadecimal, so that a Hebrew name survives the transfer and the lab's file system.
struct PrintFileName {
    QString code;     // print code, 9 characters
    int index = 0;    // of the basket line, from 0; the name holds its last four digits
    int optint = 0;   // kind of order
    QString baseName; // the name holds its last 20 characters

    // As "121015MWB0007_03FAEEE5F0E4203031.jpp".
    QString text() const;

    // No value for a name of another form, such as an order sheet's.
    static std::optional<PrintFileName> parse(const QString& name);

    int copies() const;
};

// The base name in names and tails: the last 20 characters of the file name without its last four.
QString PrintBaseName(const DrivePath& path);

// The name of the print file of a basket line; index counts from 0.
QString PrintNameOf(const BasketLine& line, int index, OrderKind kind);

} // namespace lumora
