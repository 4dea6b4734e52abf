#pragma once

#include <QString>

#include <optional>

// Names of the pieces of a file, <base>_<ext>_<sss>_<ttt>.prk: base and ending of the source, the piece's number and
// the declared total. Each part is found by its position from the end of the name; docs/formats.md has the table.
namespace lumora {

// The name has three digits for a number.
inline constexpr int mostPieces = 999;

// True when the name ends in "prk" in small letters.
bool IsPiece(const QString& name);

// "<base>_<ext>" of a source's leaf name: all but its last 4 characters, "_", its last 3.
QString PieceStem(const QString& leaf);
// "_<sss>_<ttt>.prk".
QString PieceTail(int sequence, const QString& total);
// The number with at least three digits.
QString PieceNumber(int number);

// All but the last 12 characters of a piece's full path, the same for all pieces of a file in one folder. Empty for a
// path of at most 12 characters.
QString FamilyKey(const QString& path);
// The path of the piece with that number and the same family and total.
QString PieceBeside(const QString& path, int sequence);
// The characters at the position of the number or total, which need not be digits.
QString PieceSequence(const QString& name);
QString PieceTotal(const QString& name);

// "<base>.<ext>" of a piece's leaf name. No value when it has at most the 12 characters of the tail.
std::optional<QString> JoinedName(const QString& leaf);

} // namespace lumora
