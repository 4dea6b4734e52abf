#include "editing/redeye/RedOverview.h"

#include "common/FixedText.h"

#include <algorithm>
#include <vector>

namespace lumora::RedOverview {
namespace {

// The source pixels, first to before last, that one pixel of the overview stands for.
struct Span {
    int first;
    int last;
};

Span spanOf(int index, int of, int source) {
    const auto edge = [&](int i) { return static_cast<int>(static_cast<qint64>(i) * source / of); };
    const int first = std::min(edge(index), source - 1);
    return {first, std::clamp(edge(index + 1), first + 1, source)};
}

struct Sums {
    qint64 red = 0;
    qint64 green = 0;
    qint64 blue = 0;
    qint64 count = 0;
};

// The pixels [left, right] x [top, bottom] of the overview.
void work(Bitmap& overview, const Bitmap& picture, int left, int right, int top, int bottom) {
    std::vector<Sums> row(static_cast<std::size_t>(std::max(0, right - left + 1)));
    for (int y = top; y <= bottom; ++y) {
        std::fill(row.begin(), row.end(), Sums{});
        const Span lines = spanOf(y, overview.height(), picture.height());
        for (int line = lines.first; line < lines.last; ++line) {
            const auto* from = reinterpret_cast<const QRgb*>(picture.image().constScanLine(line));
            for (int x = left; x <= right; ++x) {
                const Span columns = spanOf(x, overview.width(), picture.width());
                Sums& sums = row[static_cast<std::size_t>(x - left)];
                for (int column = columns.first; column < columns.last; ++column) {
                    sums.red += qRed(from[column]);
                    sums.green += qGreen(from[column]);
                    sums.blue += qBlue(from[column]);
                }
                sums.count += columns.last - columns.first;
            }
        }
        auto* to = reinterpret_cast<QRgb*>(overview.image().scanLine(y));
        for (int x = left; x <= right; ++x) {
            const Sums& sums = row[static_cast<std::size_t>(x - left)];
            const auto mean = [&](qint64 sum) { return static_cast<int>((sum + sums.count / 2) / sums.count); };
            to[x] = qRgb(mean(sums.red), mean(sums.green), mean(sums.blue));
        }
    }
}

} // namespace

PictureSize size(PictureSize picture) {
    const double ratio = static_cast<double>(picture.width) / std::max(1, picture.height);
    const auto side = [](double length) { return std::max(1, static_cast<int>(RoundHalfEven(length))); };
    const double height = 250 / ratio;
    return height > 270 ? PictureSize{side(300 * ratio), 300} : PictureSize{250, side(height)};
}

PictureSize pixels(PictureSize size) {
    constexpr int density = 2;
    return {size.width * density, size.height * density};
}

Bitmap draw(const Bitmap& picture, PictureSize size) {
    Bitmap overview(size.width, size.height, Qt::white);
    if (!picture.isNull() && !overview.isNull())
        work(overview, picture, 0, size.width - 1, 0, size.height - 1);
    return overview;
}

void refresh(Bitmap& overview, const Bitmap& picture, const QRect& part) {
    const QRect changed = part & picture.image().rect();
    if (changed.isEmpty() || overview.isNull())
        return;
    // Spans are cut to whole pixels, so one pixel more is drawn on each side.
    const auto index = [](int at, int of, int source) {
        return static_cast<int>(static_cast<qint64>(at) * of / source);
    };
    const int right = overview.width() - 1;
    const int bottom = overview.height() - 1;
    work(overview, picture, std::max(0, index(changed.left(), overview.width(), picture.width()) - 1),
         std::min(right, index(changed.right(), overview.width(), picture.width()) + 1),
         std::max(0, index(changed.top(), overview.height(), picture.height()) - 1),
         std::min(bottom, index(changed.bottom(), overview.height(), picture.height()) + 1));
}

} // namespace lumora::RedOverview
