#include "transfer/delivery/UploadProgress.h"

#include "common/FixedText.h"
#include "order/PieceName.h"

#include <algorithm>
#include <cmath>

namespace lumora {

int UploadPercent(int index, int count) {
    return static_cast<int>(std::floor(static_cast<double>(index) / std::max(count - 1, 1) * 100));
}

int BarWidth(int percent, int full) {
    return static_cast<int>(std::floor(static_cast<double>(percent) * full / 100));
}

double PieceOfOrder::share() const {
    return std::clamp(Val(sequence) / std::max(Val(total), 1.0), 0.0, 1.0);
}

std::optional<PieceOfOrder> PieceFromName(const QString& name) {
    if (!IsPiece(name))
        return std::nullopt;
    return PieceOfOrder{PieceSequence(name), PieceTotal(name)};
}

int MinutesLeft(qint64 secondsOfOne, int remaining) {
    return static_cast<int>(secondsOfOne * remaining / 60) + 3;
}

} // namespace lumora
