#pragma once

#include <QString>

#include <optional>

namespace lumora {

// Per cent of a pass over count files when the file at index begins: Int(index / max(count - 1, 1) * 100).
int UploadPercent(int index, int count);

// Width of the inner bar in a bar of the width full: Int(percent * full / 100).
int BarWidth(int percent, int full);

// The number and total of a piece, as its name tells.
struct PieceOfOrder {
    QString sequence;
    QString total;
    double share() const; // 0 to 1; a total below 1 counts as 1
    bool last() const { return sequence == total; }
};
std::optional<PieceOfOrder> PieceFromName(const QString& name);

// Minutes left, from the seconds of the last piece: whole minutes, plus 3 for the check.
int MinutesLeft(qint64 secondsOfOne, int remaining);

} // namespace lumora
