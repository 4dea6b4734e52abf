#include "common/PaperSize.h"

#include "common/FixedText.h"

namespace lumora {

QString SizeCode(const QString& paper, const QString& between) {
    return paper.left(2) + between + paper.right(2);
}

std::optional<PaperSize> PaperSize::ofText(const QString& paper) {
    const PaperSize size{Val16(paper.left(2)), Val16(paper.right(2))};
    if (size.shortSide < 1 || size.longSide < 1)
        return std::nullopt;
    return size;
}

std::optional<PaperSize> PaperSize::ofDigits(const QString& code) {
    return code.size() == 4 ? ofText(code) : std::nullopt;
}

} // namespace lumora
