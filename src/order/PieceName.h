#pragma once

#include <QString>

#include <optional>

// Names of the pieces of a file, <base>_<ext>_<sss>_<ttt>.prk: base and ending of the source, the piece's number and
// the declared total. Everything is found by its place from the end of the name; docs/formats.md has the table.
namespace lumora {

// Three digits each: with a number above this the places no longer hold.
inline constexpr int mostPieces = 999;

// Ends in "prk", in small letters.
bool IsPiece(const QString& name);

// "<base>_<ext>" for the leaf name of a source: the name without its last 4 characters, "_", its last 3.
QString PieceStem(const QString& leaf);
// "_<sss>_<ttt>.prk".
QString PieceTail(int sequence, const QString& total);
// A number as it stands in a piece's name.
QString PieceNumber(int number);

// All pieces with the same text before the last 12 characters are a family. Of full paths, so that the pieces in two
// folders are two families. Empty for a name that has no more than those 12.
QString FamilyKey(const QString& path);
// The piece with that number of the same family and total.
QString PieceBeside(const QString& path, int sequence);
// As they stand; digits or not.
QString PieceSequence(const QString& name);
QString PieceTotal(const QString& name);

// "<base>.<ext>" for the leaf name of a piece. Nothing when it has no more than the 12 characters of the tail.
std::optional<QString> JoinedName(const QString& leaf);

} // namespace lumora
