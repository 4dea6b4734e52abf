#include "imaging/drawing/PlacedDraw.h"

#include "common/FixedText.h"
#include "imaging/scaling/PixelRows.h"
#include "imaging/scaling/Resample.h"

#include <QPainter>

#include <algorithm>
#include <cmath>
#include <cstring>
#include <memory>
#include <numbers>
#include <utility>
#include <vector>

namespace lumora {
namespace {

struct Turn {
    double cosine;
    double sine;
};

// Quarter turns are exact, so that their edges stay hard and pixels keep their values.
Turn turnOf(int rotationCode) {
    const int degrees = ((rotationCode - 180) % 360 + 360) % 360;
    switch (degrees) {
    case 0:
        return {1, 0};
    case 90:
        return {0, 1};
    case 180:
        return {-1, 0};
    case 270:
        return {0, -1};
    default:
        const double angle = degrees * std::numbers::pi / 180.0;
        return {std::cos(angle), std::sin(angle)};
    }
}

// The edit record counts from the middle in whole pixels, rounded down.
int middleOf(int side) {
    return side / 2;
}

// Maps a point of the paper to the picture: u to the right and v down in zoomed pixels, (0, 0) the picture's corner.
struct Inverse {
    Turn turn;
    double originX;
    double originY;

    Inverse(const Placement& placement, PictureSize zoomed)
        : turn(turnOf(placement.rotationCode))
        , originX(middleOf(zoomed.width) - (turn.cosine * placement.panX + turn.sine * placement.panY))
        , originY(middleOf(zoomed.height) - (-turn.sine * placement.panX + turn.cosine * placement.panY)) {}

    double u(double x, double y) const { return turn.cosine * x + turn.sine * y + originX; }
    double v(double x, double y) const { return -turn.sine * x + turn.cosine * y + originY; }
};

// The part of the columns [from, to) whose pixel centres fulfil low <= start + step * x <= high.
std::pair<int, int> narrowed(std::pair<int, int> range, double start, double step, double low, double high) {
    if (step == 0.0)
        return start >= low && start < high ? range : std::pair(0, 0);
    double first = (low - start) / step - 0.5;
    double last = (high - start) / step - 0.5;
    if (step < 0)
        std::swap(first, last);
    const auto held = [](double value) { return static_cast<int>(std::clamp(value, -1e6, 1e6)); };
    return {std::max(range.first, held(std::ceil(first - 1e-9))), std::min(range.second, held(std::ceil(last - 1e-9)))};
}

// Samples reach at most this many pixels beyond the picture's edge.
constexpr int margin = 6;

// The part of the source that the paper shows, after the colour matrix, with its edge pixels repeated around it.
class PreparedSource {
public:
    PreparedSource(const Bitmap& source, QRect wanted, const ColourMatrix& matrix)
        : m_area(wanted)
        , m_stride(wanted.width() + 2 * margin)
        , m_pixels(std::make_unique_for_overwrite<std::uint32_t[]>(
              static_cast<std::size_t>(m_stride) * static_cast<std::size_t>(wanted.height() + 2 * margin))) {
        const bool toned = !matrix.changesNothing();
        for (int y = 0; y < wanted.height(); ++y) {
            const auto* from =
                reinterpret_cast<const std::uint32_t*>(source.image().constScanLine(wanted.top() + y)) + wanted.left();
            std::uint32_t* row = rowOf(y);
            if (toned)
                applyMatrixToRow(matrix, from, row, wanted.width());
            else
                std::memcpy(row, from, static_cast<std::size_t>(wanted.width()) * sizeof(std::uint32_t));
            std::fill_n(row - margin, margin, row[0]);
            std::fill_n(row + wanted.width(), margin, row[wanted.width() - 1]);
        }
        for (int y = 1; y <= margin; ++y) {
            std::copy_n(rowOf(0) - margin, m_stride, rowOf(-y) - margin);
            std::copy_n(rowOf(wanted.height() - 1) - margin, m_stride, rowOf(wanted.height() - 1 + y) - margin);
        }
    }

    PaddedPicture padded() const { return {rowOf(0), m_stride}; }
    QPoint corner() const { return m_area.topLeft(); }

private:
    std::uint32_t* rowOf(int y) { return m_pixels.get() + (std::ptrdiff_t(y) + margin) * m_stride + margin; }
    const std::uint32_t* rowOf(int y) const {
        return m_pixels.get() + (std::ptrdiff_t(y) + margin) * m_stride + margin;
    }

    QRect m_area;
    std::ptrdiff_t m_stride;
    std::unique_ptr<std::uint32_t[]> m_pixels;
};

std::uint32_t blended(std::uint32_t below, std::uint32_t above, double coverage) {
    const auto weight = static_cast<std::uint32_t>(std::lround(coverage * 256.0));
    std::uint32_t result = 0xFF000000U;
    for (int shift = 0; shift < 24; shift += 8) {
        const std::uint32_t under = (below >> shift) & 0xFF;
        const std::uint32_t over = (above >> shift) & 0xFF;
        result |= ((under * (256 - weight) + over * weight + 128) >> 8) << shift;
    }
    return result;
}

// Source rows and columns that samples for this paper touch; at most beyond pixels of them lie outside the source.
QRect touched(const Placement& placement, PictureSize paper, PictureSize source, int beyond) {
    const PictureSize zoomed = placement.zoomed();
    const Inverse inverse(placement, zoomed);
    const double scaleX = double(source.width) / zoomed.width;
    const double scaleY = double(source.height) / zoomed.height;
    double left = 1e9;
    double top = 1e9;
    double right = -1e9;
    double bottom = -1e9;
    for (const double x : {0.0, double(paper.width)}) {
        for (const double y : {0.0, double(paper.height)}) {
            const double u = inverse.u(x, y) * scaleX;
            const double v = inverse.v(x, y) * scaleY;
            left = std::min(left, u);
            right = std::max(right, u);
            top = std::min(top, v);
            bottom = std::max(bottom, v);
        }
    }
    constexpr int reach = 4;
    const auto held = [beyond](double value, int limit) {
        return static_cast<int>(std::clamp<double>(value, -beyond, limit + beyond));
    };
    const int x0 = std::min(held(std::floor(left) - reach, source.width), source.width - 1);
    const int y0 = std::min(held(std::floor(top) - reach, source.height), source.height - 1);
    const int x1 = std::max(held(std::ceil(right) + reach, source.width), x0 + 1);
    const int y1 = std::max(held(std::ceil(bottom) + reach, source.height), y0 + 1);
    return {x0, y0, x1 - x0, y1 - y0};
}

// padded shows part of a picture of the size whole; its pixel (0, 0) is the picture's pixel corner.
void drawSamples(Bitmap& paper, const PaddedPicture& padded, QPoint corner, PictureSize whole,
                 const Placement& placement) {
    const PictureSize zoomed = placement.zoomed();
    const PictureSize size{paper.width(), paper.height()};
    const Inverse inverse(placement, zoomed);
    const double scaleX = double(whole.width) / zoomed.width;
    const double scaleY = double(whole.height) / zoomed.height;

    const auto fixed = [](double value) { return static_cast<std::int64_t>(std::llround(value * 4294967296.0)); };
    const bool level = inverse.turn.cosine == 0 || inverse.turn.sine == 0;
    const double stepU = inverse.turn.cosine;
    const double stepV = -inverse.turn.sine;
    const double outer = level ? 0.0 : 0.5; // pixels by which the smooth edge reaches past the picture
    for (int y = 0; y < size.height; ++y) {
        const double startU = inverse.u(0, y + 0.5);
        const double startV = inverse.v(0, y + 0.5);
        const auto inside = [&](double edge) {
            auto range = narrowed({0, size.width}, startU, stepU, -edge, zoomed.width + edge);
            return narrowed(range, startV, stepV, -edge, zoomed.height + edge);
        };
        const std::pair<int, int> shown = inside(outer);
        const int from = shown.first;
        const int to = shown.second;
        if (from >= to)
            continue;
        auto [solidFrom, solidTo] = inside(-outer);
        if (solidFrom >= solidTo)
            solidFrom = solidTo = to;

        const double u = startU + stepU * (from + 0.5);
        const double v = startV + stepV * (from + 0.5);
        // The sampler cuts positions to 256 phases; half a phase more makes that a rounding.
        const double halfPhase = 1.0 / 512.0;
        const SampleLine line{fixed(u * scaleX - 0.5 - corner.x() + halfPhase),
                              fixed(v * scaleY - 0.5 - corner.y() + halfPhase), fixed(stepU * scaleX),
                              fixed(stepV * scaleY)};
        const auto lineAt = [&](int x) {
            return SampleLine{line.x + (x - from) * line.stepX, line.y + (x - from) * line.stepY, line.stepX,
                              line.stepY};
        };
        auto* row = reinterpret_cast<std::uint32_t*>(paper.image().scanLine(y));
        const auto edge = [&](int begin, int end) {
            for (int x = begin; x < end; ++x) {
                std::uint32_t sample = 0;
                sampleLine(padded, lineAt(x), &sample, 1);
                const double atU = startU + stepU * (x + 0.5);
                const double atV = startV + stepV * (x + 0.5);
                const double coverage = std::clamp(std::min(atU, zoomed.width - atU) + 0.5, 0.0, 1.0) *
                                        std::clamp(std::min(atV, zoomed.height - atV) + 0.5, 0.0, 1.0);
                row[x] = blended(row[x], sample, coverage);
            }
        };
        edge(from, solidFrom);
        sampleLine(padded, lineAt(solidFrom), row + solidFrom, solidTo - solidFrom);
        edge(solidTo, to);
    }
}

// The tiles of the paper for which wanted() is true, joined into larger rectangles: neighbours in a row first, then
// equal runs below each other.
template <class Wanted>
std::vector<QRect> joinedTiles(PictureSize paper, const Wanted& wanted) {
    constexpr int tileWidth = 64;
    constexpr int tileHeight = 32;
    std::vector<QRect> done;
    std::vector<QRect> open; // rectangles that reach down to the current row of tiles
    for (int top = 0; top < paper.height; top += tileHeight) {
        const int height = std::min(tileHeight, paper.height - top);
        std::vector<QRect> band;
        for (int left = 0; left < paper.width; left += tileWidth) {
            const QRect tile(left, top, std::min(tileWidth, paper.width - left), height);
            if (!wanted(tile))
                continue;
            if (!band.empty() && band.back().right() + 1 == left)
                band.back().setRight(tile.right());
            else
                band.push_back(tile);
        }
        for (const QRect& above : open) {
            const auto below = std::find_if(band.begin(), band.end(), [&](const QRect& run) {
                return run.left() == above.left() && run.right() == above.right();
            });
            if (below == band.end())
                done.push_back(above);
            else
                below->setTop(above.top());
        }
        open = std::move(band);
    }
    done.insert(done.end(), open.begin(), open.end());
    return done;
}

} // namespace

PictureSize Placement::zoomed() const {
    const double zoom = zoomPercent / 100.0;
    return {std::max(1, static_cast<int>(RoundHalfEven(drawWidth * zoom))),
            std::max(1, static_cast<int>(RoundHalfEven(drawHeight * zoom)))};
}

Placement::Point Placement::onPaper(double x, double y) const {
    const Turn turn = turnOf(rotationCode);
    const PictureSize size = zoomed();
    const double across = x - middleOf(size.width);
    const double down = y - middleOf(size.height);
    return {panX + turn.cosine * across - turn.sine * down, panY + turn.sine * across + turn.cosine * down};
}

bool Placement::covers(const QRect& part) const {
    const PictureSize size = zoomed();
    const Inverse inverse(*this, size);
    const bool level = inverse.turn.cosine == 0 || inverse.turn.sine == 0;
    const double edge = level ? 0.0 : 0.5;
    for (const double x : {part.left() + 0.5, part.left() + part.width() - 0.5}) {
        for (const double y : {part.top() + 0.5, part.top() + part.height() - 0.5}) {
            const double u = inverse.u(x, y);
            const double v = inverse.v(x, y);
            if (u < edge || u > size.width - edge || v < edge || v > size.height - edge)
                return false;
        }
    }
    return true;
}

std::vector<QRect> Placement::uncovered(PictureSize paper) const {
    return joinedTiles(paper, [this](const QRect& tile) { return !covers(tile); });
}

PictureSize reducedSize(PictureSize source, const Placement& placement) {
    const PictureSize zoomed = placement.zoomed();
    const auto enough = [](int side) { return static_cast<int>(std::ceil(side * 1.25)); };
    return {std::min(source.width, enough(zoomed.width)), std::min(source.height, enough(zoomed.height))};
}

void drawPlaced(Bitmap& paper, const Bitmap& source, const Placement& placement, const ColourMatrix& matrix) {
    if (paper.isNull() || source.isNull())
        return;
    const PictureSize reduced = reducedSize({source.width(), source.height()}, placement);
    if (reduced != PictureSize{source.width(), source.height()}) {
        drawPlaced(paper, resampled(source, reduced), placement, matrix);
        return;
    }
    Bitmap plain = source;
    if (plain.image().format() != QImage::Format_RGB32)
        plain = Bitmap(plain.image().convertToFormat(QImage::Format_RGB32));

    const PictureSize size{paper.width(), paper.height()};
    const PictureSize whole{plain.width(), plain.height()};
    const PreparedSource prepared(plain, touched(placement, size, whole, 0), matrix);
    drawSamples(paper, prepared.padded(), prepared.corner(), whole, placement);
}

QRect neededPart(PictureSize reduced, const Placement& placement, PictureSize paper) {
    return touched(placement, paper, reduced, margin);
}

void drawPlacedPart(Bitmap& paper, const Bitmap& pixels, const QRect& part, PictureSize reduced,
                    const Placement& placement) {
    if (paper.isNull() || pixels.isNull())
        return;
    const PaddedPicture padded{reinterpret_cast<const std::uint32_t*>(pixels.image().constBits()),
                               pixels.image().bytesPerLine() / std::ptrdiff_t{sizeof(std::uint32_t)}};
    drawSamples(paper, padded, part.topLeft(), reduced, placement);
}

KeyedFrame keyedFrame(const Bitmap& frame, PictureSize paper) {
    QImage keyed = frame.image().convertToFormat(QImage::Format_ARGB32);
    if (keyed.isNull() || paper.width < 1 || paper.height < 1 ||
        !keyed.reinterpretAsFormat(QImage::Format_ARGB32_Premultiplied))
        return {};
    constexpr int solid = 24;
    // For each row of the frame: whether a stretch of so many pixels shows anything.
    constexpr int stretch = 16;
    const int stretches = (keyed.width() + stretch - 1) / stretch;
    std::vector<std::uint8_t> shows(static_cast<std::size_t>(keyed.height()) * static_cast<std::size_t>(stretches));
    for (int y = 0; y < keyed.height(); ++y) {
        auto* row = reinterpret_cast<QRgb*>(keyed.scanLine(y));
        auto* rowShows = shows.data() + std::ptrdiff_t{y} * stretches;
        for (int x = 0; x < keyed.width(); ++x) {
            const int sum = qRed(row[x]) + qGreen(row[x]) + qBlue(row[x]);
            if (sum == 0) {
                row[x] = 0;
                continue;
            }
            rowShows[x / stretch] = 1;
            row[x] |= 0xFF000000U;
            if (sum < solid)
                row[x] = qPremultiply((row[x] & 0x00FFFFFFU) | (static_cast<QRgb>(11 * sum) << 24));
        }
    }
    // The cubic of the resampling reaches 2 source steps around a pixel; one more for the rounding.
    const double stepX = double(keyed.width()) / paper.width;
    const double stepY = double(keyed.height()) / paper.height;
    const auto reach = [](double step) { return 2 * std::max(1.0, step) + 1; };
    const auto showsIn = [&](const QRect& tile) {
        const int left = std::max(0, static_cast<int>(tile.left() * stepX - reach(stepX))) / stretch;
        const int right = std::min(keyed.width() - 1, static_cast<int>((tile.right() + 1) * stepX + reach(stepX)));
        const int top = std::max(0, static_cast<int>(tile.top() * stepY - reach(stepY)));
        const int bottom = std::min(keyed.height() - 1, static_cast<int>((tile.bottom() + 1) * stepY + reach(stepY)));
        for (int y = top; y <= bottom; ++y) {
            const auto row = shows.begin() + std::ptrdiff_t{y} * stretches;
            if (std::find(row + left, row + right / stretch + 1, 1) != row + right / stretch + 1)
                return true;
        }
        return false;
    };
    KeyedFrame result;
    for (const QRect& part : joinedTiles(paper, showsIn)) {
        Bitmap pixels = resampledPart(Bitmap(keyed), paper, part);
        if (pixels.isNull())
            return {};
        result.pieces.push_back({part.topLeft(), std::move(pixels)});
    }
    return result;
}

void drawKeyedFrame(Bitmap& paper, const KeyedFrame& keyed) {
    if (paper.isNull() || keyed.pieces.empty())
        return;
    QPainter painter(&paper.image());
    for (const KeyedFrame::Piece& piece : keyed.pieces)
        painter.drawImage(piece.at, piece.pixels.image());
}

} // namespace lumora
