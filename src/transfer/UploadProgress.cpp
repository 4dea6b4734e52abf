#include "transfer/UploadProgress.h"

#include "common/FixedText.h"

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
    if (!name.endsWith(QStringLiteral("prk")))
        return std::nullopt;
    const QString tail = name.right(11);
    return PieceOfOrder{tail.left(3), tail.mid(4, 3)};
}

int MinutesLeft(qint64 secondsOfOne, int remaining) {
    return static_cast<int>(secondsOfOne * remaining / 60) + 3;
}

} // namespace lumora
