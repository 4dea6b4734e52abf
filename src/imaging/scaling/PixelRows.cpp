#include "imaging/scaling/PixelRows.h"

#include "imaging/drawing/ColourMatrix.h"

#include <algorithm>
#include <cmath>

#undef HWY_TARGET_INCLUDE
#define HWY_TARGET_INCLUDE "imaging/scaling/PixelRows.cpp"
#include <hwy/foreach_target.h>
#include <hwy/highway.h>

HWY_BEFORE_NAMESPACE();
namespace lumora {
namespace HWY_NAMESPACE {
namespace hn = hwy::HWY_NAMESPACE;

// entries[row * 3 + column] in the order red, green, blue.
void applyMatrix(const float* entries, const std::uint32_t* from, std::uint32_t* to, int pixels) {
    const hn::ScalableTag<std::uint32_t> du;
    const hn::RebindToSigned<decltype(du)> di;
    const hn::RebindToFloat<decltype(du)> df;
    const int lanes = static_cast<int>(hn::Lanes(du));
    const auto byteMask = hn::Set(du, 0xFF);
    const auto zero = hn::Zero(df);
    const auto top = hn::Set(df, 255.0F);
    // Single precision may give a whole number as slightly less, which would be rounded down. The lift is far below a
    // thousandth, the smallest step of an edit record.
    const auto lift = hn::Set(df, 1.0F / 4096.0F);

    const auto convert = [&](auto pixel) HWY_ATTR {
        const auto channel = [&](auto value)
                                 HWY_ATTR { return hn::ConvertTo(df, hn::BitCast(di, hn::And(value, byteMask))); };
        const auto red = channel(hn::ShiftRight<16>(pixel));
        const auto green = channel(hn::ShiftRight<8>(pixel));
        const auto blue = channel(pixel);
        const auto mix = [&](int column) HWY_ATTR {
            auto sum = hn::MulAdd(red, hn::Set(df, entries[column]), lift);
            sum = hn::MulAdd(green, hn::Set(df, entries[3 + column]), sum);
            sum = hn::MulAdd(blue, hn::Set(df, entries[6 + column]), sum);
            return hn::BitCast(du, hn::ConvertTo(di, hn::Min(hn::Max(sum, zero), top)));
        };
        return hn::Or(hn::Or(hn::ShiftLeft<16>(mix(0)), hn::ShiftLeft<8>(mix(1))),
                      hn::Or(mix(2), hn::Set(du, 0xFF000000U)));
    };

    int x = 0;
    for (; x + lanes <= pixels; x += lanes)
        hn::StoreU(convert(hn::LoadU(du, from + x)), du, to + x);
    if (x < pixels) {
        std::uint32_t rest[HWY_MAX_BYTES / sizeof(std::uint32_t)] = {};
        for (int i = 0; x + i < pixels; ++i)
            rest[i] = from[x + i];
        hn::StoreU(convert(hn::LoadU(du, rest)), du, rest);
        for (int i = 0; x + i < pixels; ++i)
            to[x + i] = rest[i];
    }
}

// Handles the whole vectors of the row; returns the number of pixels done.
int splitWhole(const std::uint32_t* from, int width, std::uint8_t* const* planes, bool fourth) {
#if HWY_TARGET == HWY_SCALAR
    static_cast<void>(from), static_cast<void>(width), static_cast<void>(planes), static_cast<void>(fourth);
    return 0;
#else
    const hn::FixedTag<std::uint8_t, 16> d8;
    int x = 0;
    for (; x + 16 <= width; x += 16) {
        auto c0 = hn::Zero(d8);
        auto c1 = c0;
        auto c2 = c0;
        auto c3 = c0;
        hn::LoadInterleaved4(d8, reinterpret_cast<const std::uint8_t*>(from + x), c0, c1, c2, c3);
        hn::StoreU(c0, d8, planes[0] + x);
        hn::StoreU(c1, d8, planes[1] + x);
        hn::StoreU(c2, d8, planes[2] + x);
        if (fourth)
            hn::StoreU(c3, d8, planes[3] + x);
    }
    return x;
#endif
}

int joinWhole(const std::uint8_t* const* planes, int width, std::uint32_t* to, bool fourth) {
#if HWY_TARGET == HWY_SCALAR
    static_cast<void>(planes), static_cast<void>(width), static_cast<void>(to), static_cast<void>(fourth);
    return 0;
#else
    const hn::FixedTag<std::uint8_t, 16> d8;
    int x = 0;
    for (; x + 16 <= width; x += 16) {
        const auto alpha = fourth ? hn::LoadU(d8, planes[3] + x) : hn::Set(d8, 0xFF);
        const auto channel = [&](int i) HWY_ATTR { return hn::Min(hn::LoadU(d8, planes[i] + x), alpha); };
        hn::StoreInterleaved4(channel(0), channel(1), channel(2), alpha, d8, reinterpret_cast<std::uint8_t*>(to + x));
    }
    return x;
#endif
}

int colourWhole(const std::uint8_t* y, const std::uint8_t* cb, const std::uint8_t* cr, int width, std::uint32_t* to,
                const std::int32_t* factors) {
#if HWY_TARGET == HWY_SCALAR
    static_cast<void>(y), static_cast<void>(cb), static_cast<void>(cr), static_cast<void>(width);
    static_cast<void>(to), static_cast<void>(factors);
    return 0;
#else
    const HWY_CAPPED(std::int32_t, 8) d32;
    const hn::Rebind<std::uint8_t, decltype(d32)> d8;
    const hn::RebindToUnsigned<decltype(d32)> du;
    const int lanes = static_cast<int>(hn::Lanes(d32));
    const auto half = hn::Set(d32, 1 << 15);
    const auto neutral = hn::Set(d32, 128);
    const auto top = hn::Set(d32, 255);
    int x = 0;
    for (; x + lanes <= width; x += lanes) {
        const auto load = [&](const std::uint8_t* plane)
                              HWY_ATTR { return hn::PromoteTo(d32, hn::LoadU(d8, plane + x)); };
        const auto luma = hn::Add(hn::ShiftLeft<16>(load(y)), half);
        const auto blue = hn::Sub(load(cb), neutral);
        const auto red = hn::Sub(load(cr), neutral);
        const auto times = [&](auto value, int i) HWY_ATTR { return hn::Mul(value, hn::Set(d32, factors[i])); };
        const auto byte = [&](auto sum) HWY_ATTR {
            return hn::BitCast(du, hn::Min(hn::Max(hn::ShiftRight<16>(sum), hn::Zero(d32)), top));
        };
        const auto r = byte(hn::Add(luma, times(red, 0)));
        const auto g = byte(hn::Add(luma, hn::Add(times(red, 1), times(blue, 2))));
        const auto b = byte(hn::Add(luma, times(blue, 3)));
        hn::StoreU(hn::Or(hn::Or(b, hn::ShiftLeft<8>(g)), hn::Or(hn::ShiftLeft<16>(r), hn::Set(du, 0xFF000000U))), du,
                   to + x);
    }
    return x;
#endif
}

// Handles the whole vectors of the row; returns the number of samples done.
int addWhole(const std::uint8_t* const* rows, std::size_t count, std::uint16_t* sums, int width) {
#if HWY_TARGET == HWY_SCALAR
    static_cast<void>(rows), static_cast<void>(count), static_cast<void>(sums), static_cast<void>(width);
    return 0;
#else
    const HWY_CAPPED(std::uint16_t, 16) d16;
    const hn::Rebind<std::uint8_t, decltype(d16)> d8;
    const int lanes = static_cast<int>(hn::Lanes(d16));
    int x = 0;
    for (; x + lanes <= width; x += lanes) {
        auto sum = hn::Zero(d16);
        for (std::size_t i = 0; i < count; ++i)
            sum = hn::Add(sum, hn::PromoteTo(d16, hn::LoadU(d8, rows[i] + x)));
        hn::StoreU(sum, d16, sums + x);
    }
    return x;
#endif
}

// weights: for each of 256 phases the four weights, 14 fraction bits, as [w0 w1 w0 w1 w0 w1 w0 w1] [w2 w3 w2 w3 w2 w3
// w2 w3].
#if HWY_TARGET == HWY_SCALAR
void sample(const std::uint32_t* origin, std::ptrdiff_t stride, SampleLine line, const std::int16_t* weights,
            std::uint32_t* out, int count) {
    constexpr int tapAt[4] = {0, 1, 8, 9};
    for (int i = 0; i < count; ++i) {
        const std::int16_t* wx = weights + ((line.x >> 24) & 0xFF) * 16;
        const std::int16_t* wy = weights + ((line.y >> 24) & 0xFF) * 16;
        const std::uint32_t* at = origin + ((line.y >> 32) - 1) * stride + ((line.x >> 32) - 1);
        std::uint32_t pixel = 0;
        for (int shift = 0; shift < 32; shift += 8) {
            std::int32_t total = 1 << 19;
            for (int row = 0; row < 4; ++row) {
                std::int32_t sum = 1 << 7;
                for (int tap = 0; tap < 4; ++tap)
                    sum += static_cast<std::int32_t>((at[row * stride + tap] >> shift) & 0xFF) * wx[tapAt[tap]];
                total += (sum >> 8) * wy[tapAt[row]];
            }
            const std::int32_t value = total >> 20;
            pixel |= static_cast<std::uint32_t>(value < 0 ? 0 : value > 255 ? 255 : value) << shift;
        }
        out[i] = pixel;
        line.x += line.stepX;
        line.y += line.stepY;
    }
}
#else
void sample(const std::uint32_t* origin, std::ptrdiff_t stride, SampleLine line, const std::int16_t* weights,
            std::uint32_t* out, int count) {
    const hn::FixedTag<std::uint8_t, 16> d8;
    const hn::FixedTag<std::int16_t, 8> d16;
    const hn::FixedTag<std::int32_t, 4> d32;
    const hn::FixedTag<std::int16_t, 4> d16half;
    const hn::FixedTag<std::uint8_t, 4> d8quarter;
    const auto roundRow = hn::Set(d32, 1 << 7);
    const auto roundAll = hn::Set(d32, 1 << 19);
    const auto lowHalf = hn::Set(d32, 0xFFFF);
    // Shuffles for four pixels to 16 bits, each channel of one pixel beside that of the next: pixels 0 and 1, and 2 and
    // 3.
    constexpr std::uint8_t none = 0x80;
    alignas(16) static constexpr std::uint8_t nearBytes[16] = {0, none, 4, none, 1, none, 5, none,
                                                               2, none, 6, none, 3, none, 7, none};
    alignas(16) static constexpr std::uint8_t farBytes[16] = {8,  none, 12, none, 9,  none, 13, none,
                                                              10, none, 14, none, 11, none, 15, none};
    const auto nearPair = hn::Load(d8, nearBytes);
    const auto farPair = hn::Load(d8, farBytes);

    const auto pairSums = [&](auto a, auto b, auto c, auto d, auto start) HWY_ATTR {
        auto odd = hn::Zero(d32);
        auto sum = hn::ReorderWidenMulAccumulate(d32, a, b, start, odd);
        sum = hn::ReorderWidenMulAccumulate(d32, c, d, sum, odd);
        return hn::RearrangeToOddPlusEven(sum, odd);
    };

    for (int i = 0; i < count; ++i) {
        const auto column = static_cast<std::ptrdiff_t>(line.x >> 32);
        const auto row = static_cast<std::ptrdiff_t>(line.y >> 32);
        const std::int16_t* wx = weights + ((line.x >> 24) & 0xFF) * 16;
        const std::int16_t* wy = weights + ((line.y >> 24) & 0xFF) * 16;
        const auto wxNear = hn::LoadU(d16, wx);
        const auto wxFar = hn::LoadU(d16, wx + 8);
        const std::uint32_t* at = origin + (row - 1) * stride + (column - 1);

        const auto across = [&](const std::uint32_t* pixels) HWY_ATTR {
            const auto four = hn::LoadU(d8, reinterpret_cast<const std::uint8_t*>(pixels));
            const auto sum = pairSums(hn::BitCast(d16, hn::TableLookupBytesOr0(four, nearPair)), wxNear,
                                      hn::BitCast(d16, hn::TableLookupBytesOr0(four, farPair)), wxFar, roundRow);
            return hn::ShiftRight<8>(sum); // 6 fraction bits
        };
        const auto pack = [&](auto upper, auto lower) HWY_ATTR {
            return hn::BitCast(d16, hn::Or(hn::And(upper, lowHalf), hn::ShiftLeft<16>(lower)));
        };
        const auto first = pack(across(at), across(at + stride));
        const auto second = pack(across(at + 2 * stride), across(at + 3 * stride));
        const auto total = pairSums(first, hn::LoadU(d16, wy), second, hn::LoadU(d16, wy + 8), roundAll);
        const auto bytes = hn::DemoteTo(d8quarter, hn::DemoteTo(d16half, hn::ShiftRight<20>(total)));
        hn::StoreU(bytes, d8quarter, reinterpret_cast<std::uint8_t*>(out + i));
        line.x += line.stepX;
        line.y += line.stepY;
    }
}
#endif

} // namespace HWY_NAMESPACE
} // namespace lumora
HWY_AFTER_NAMESPACE();

#if HWY_ONCE
namespace lumora {
namespace {

HWY_EXPORT(applyMatrix);
HWY_EXPORT(sample);
HWY_EXPORT(splitWhole);
HWY_EXPORT(joinWhole);
HWY_EXPORT(colourWhole);
HWY_EXPORT(addWhole);

constexpr int phases = 256;

// The cubic of Keys with a = -0.5 (IEEE Trans. ASSP-29, 1981), at distances 1+t, t, 1-t, 2-t. The largest weight takes
// the rounding error, so that the weights sum to 16384.
std::array<std::int16_t, phases * 16> cubicWeights() {
    std::array<std::int16_t, phases * 16> table{};
    const auto cubic = [](double x) {
        x = std::fabs(x);
        if (x < 1)
            return (1.5 * x - 2.5) * x * x + 1;
        return x < 2 ? ((-0.5 * x + 2.5) * x - 4) * x + 2 : 0.0;
    };
    for (int phase = 0; phase < phases; ++phase) {
        const double t = double(phase) / phases;
        std::array<int, 4> weights{};
        int sum = 0;
        for (int tap = 0; tap < 4; ++tap) {
            weights[static_cast<std::size_t>(tap)] = static_cast<int>(std::lround(cubic(tap - 1 - t) * 16384));
            sum += weights[static_cast<std::size_t>(tap)];
        }
        weights[t < 0.5 ? 1 : 2] += 16384 - sum;
        for (int copy = 0; copy < 4; ++copy) {
            std::int16_t* entry = table.data() + phase * 16 + copy * 2;
            entry[0] = static_cast<std::int16_t>(weights[0]);
            entry[1] = static_cast<std::int16_t>(weights[1]);
            entry[8] = static_cast<std::int16_t>(weights[2]);
            entry[9] = static_cast<std::int16_t>(weights[3]);
        }
    }
    return table;
}

} // namespace

void applyMatrixToRow(const ColourMatrix& matrix, const std::uint32_t* from, std::uint32_t* to, int pixels) {
    std::array<float, 9> entries{};
    for (int row = 0; row < 3; ++row)
        for (int column = 0; column < 3; ++column)
            entries[static_cast<std::size_t>(row) * 3 + static_cast<std::size_t>(column)] = matrix.entry(row, column);
    HWY_DYNAMIC_DISPATCH(applyMatrix)(entries.data(), from, to, pixels);
}

void splitRow(const std::uint32_t* from, int width, std::span<std::uint8_t* const> planes) {
    for (int x = HWY_DYNAMIC_DISPATCH(splitWhole)(from, width, planes.data(), planes.size() > 3); x < width; ++x) {
        for (std::size_t i = 0; i < planes.size(); ++i)
            planes[i][x] = static_cast<std::uint8_t>(from[x] >> (8 * i));
    }
}

void joinRow(std::span<std::uint8_t* const> planes, int width, std::uint32_t* to) {
    for (int x = HWY_DYNAMIC_DISPATCH(joinWhole)(planes.data(), width, to, planes.size() > 3); x < width; ++x) {
        const std::uint32_t alpha = planes.size() > 3 ? planes[3][x] : 255;
        to[x] = alpha << 24;
        for (std::size_t i = 0; i < 3; ++i)
            to[x] |= std::min<std::uint32_t>(planes[i][x], alpha) << (8 * i);
    }
}

int lumaAndChromaToPixels(const std::uint8_t* y, const std::uint8_t* cb, const std::uint8_t* cr, int width,
                          std::uint32_t* to, const std::array<std::int32_t, 4>& factors) {
    return HWY_DYNAMIC_DISPATCH(colourWhole)(y, cb, cr, width, to, factors.data());
}

void addRows(std::span<const std::uint8_t* const> rows, std::uint16_t* sums, int width) {
    for (int x = HWY_DYNAMIC_DISPATCH(addWhole)(rows.data(), rows.size(), sums, width); x < width; ++x) {
        unsigned sum = 0;
        for (const std::uint8_t* row : rows)
            sum += row[x];
        sums[x] = static_cast<std::uint16_t>(sum);
    }
}

void sampleLine(const PaddedPicture& source, SampleLine line, std::uint32_t* out, int count) {
    static const auto weights = cubicWeights();
    HWY_DYNAMIC_DISPATCH(sample)(source.origin, source.stride, line, weights.data(), out, count);
}

} // namespace lumora
#endif
