#pragma once

#include <QString>

#include <optional>

namespace lumora {

// The name of a print file: how many copies on which paper, the place in the order, the kind of order and the
// customer's own name for the picture, in hexadecimal so that a name in Hebrew survives the transfer and the lab's file
// system.
struct PrintFileName {
    QString code;     // print code, 9 characters: copies 2, size 4, paper 1, border 2
    int index = 0;    // in the order's list, from 0; only the last four digits are kept
    int optint = 0;   // kind of order
    QString baseName; // its last 20 characters are kept

    // "121015MWB0007_03FAEEE5F0E4203031.jpp"
    QString text() const;

    // No value for a name that is not built so, an order sheet's for one.
    static std::optional<PrintFileName> parse(const QString& name);

    int copies() const;
};

// The base name as names and tails carry it: the file name less its last four characters, of that the last 20.
QString PrintBaseName(const QString& path);

} // namespace lumora
