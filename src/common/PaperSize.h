#pragma once

#include <QString>

#include <optional>

namespace lumora {

// The paper of an order with prints of several sizes.
inline const QString mixedSizes = QStringLiteral("zz/zz");

// The two ends of a paper text: its first two characters, what stands between, its last two. "10/15" gives the size
// code "1015", an empty text an empty code.
QString SizeCode(const QString& paper, const QString& between = {});

// A paper in whole centimetres.
struct PaperSize {
    int shortSide = 0;
    int longSide = 0;
    bool operator==(const PaperSize&) const = default;

    // From a paper as the order names it, "10/15": its first two characters and its last two. No value for a text
    // without two usable numbers, as "zz/zz".
    static std::optional<PaperSize> ofText(const QString& paper);
    // From a size code, "1015". No value for a text of another length either.
    static std::optional<PaperSize> ofDigits(const QString& code);
};

} // namespace lumora
