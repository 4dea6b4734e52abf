#include "imaging/scaling/ResampleKernels.h"

// Highway compiles this file once for each instruction set.
#undef HWY_TARGET_INCLUDE
#define HWY_TARGET_INCLUDE "imaging/scaling/ResampleKernels.cpp"
#include "hwy/foreach_target.h"
// highway.h must stand behind foreach_target.h.
#include "hwy/highway.h"

#include <cstring>

HWY_BEFORE_NAMESPACE();
namespace lumora::HWY_NAMESPACE {

#if HWY_TARGET == HWY_SCALAR

// A machine without vectors uses the plain kernels.
ResampleKernels Table() {
    return plainKernels();
}

#else

namespace hn = hwy::HWY_NAMESPACE;

constexpr int rowsInBlock = ResampleKernels::rows;

// Two weights side by side in every pair of 16-bit lanes.
template <class D16>
HWY_INLINE hn::Vec<D16> pairOf(D16 d16, const std::int16_t* weights) {
    const hn::Repartition<std::int32_t, D16> d32;
    std::int32_t both = 0;
    std::memcpy(&both, weights, sizeof both);
    return hn::BitCast(d16, hn::Set(d32, both));
}

// sum plus the products of neighbouring lanes, added in pairs.
template <class D32, class V16>
HWY_INLINE hn::Vec<D32> addProducts(D32 d32, V16 samples, V16 weights, hn::Vec<D32> sum) {
    hn::Vec<D32> rest = hn::Zero(d32);
    sum = hn::ReorderWidenMulAccumulate(d32, samples, weights, sum, rest);
    return hn::RearrangeToOddPlusEven(sum, rest);
}

void BlendRows(const std::uint8_t* const* HWY_RESTRICT source, const std::int16_t* HWY_RESTRICT weights, int taps,
               int width, std::int16_t* HWY_RESTRICT target) {
    const HWY_CAPPED(std::uint8_t, 32) d8;
    const hn::Repartition<std::int16_t, decltype(d8)> d16;
    const hn::Repartition<std::int32_t, decltype(d8)> d32;
    constexpr int step = static_cast<int>(hn::MaxLanes(d8));
    const auto none = hn::Zero(d8);
    for (int x = 0; x < width; x += step) {
        auto sum0 = hn::Set(d32, 128);
        auto sum1 = sum0;
        auto sum2 = sum0;
        auto sum3 = sum0;
        for (int k = 0; k < taps; k += 2) {
            const auto above = hn::LoadU(d8, source[k] + x);
            const auto below = hn::LoadU(d8, source[k + 1] + x);
            const auto pair = pairOf(d16, weights + k);
            const auto left = hn::InterleaveLower(d8, above, below);
            const auto right = hn::InterleaveUpper(d8, above, below);
            sum0 = addProducts(d32, hn::BitCast(d16, hn::InterleaveLower(d8, left, none)), pair, sum0);
            sum1 = addProducts(d32, hn::BitCast(d16, hn::InterleaveUpper(d8, left, none)), pair, sum1);
            sum2 = addProducts(d32, hn::BitCast(d16, hn::InterleaveLower(d8, right, none)), pair, sum2);
            sum3 = addProducts(d32, hn::BitCast(d16, hn::InterleaveUpper(d8, right, none)), pair, sum3);
        }
        // Interleaving and packing both work within 16 bytes, which restores the order there.
        const auto left = hn::ReorderDemote2To(d16, hn::ShiftRight<8>(sum0), hn::ShiftRight<8>(sum1));
        const auto right = hn::ReorderDemote2To(d16, hn::ShiftRight<8>(sum2), hn::ShiftRight<8>(sum3));
        if constexpr (step == 32) {
            hn::StoreU(hn::ConcatLowerLower(d16, right, left), d16, target + x);
            hn::StoreU(hn::ConcatUpperUpper(d16, right, left), d16, target + x + 16);
        } else {
            hn::StoreU(left, d16, target + x);
            hn::StoreU(right, d16, target + x + 8);
        }
    }
}

void PackColumns(const std::int16_t* HWY_RESTRICT source, std::ptrdiff_t stride, int width,
                 std::int16_t* HWY_RESTRICT target) {
    const hn::Full128<std::int16_t> d16;
    const hn::Full128<std::uint32_t> d32;
    const hn::Full128<std::uint64_t> d64;
    for (int x = 0; x < width; x += 8, target += 8 * rowsInBlock) {
        for (int half = 0; half < 2; ++half) {
            const std::int16_t* HWY_RESTRICT from = source + half * 4 * stride + x;
            const auto row0 = hn::BitCast(d32, hn::LoadU(d16, from));
            const auto row1 = hn::BitCast(d32, hn::LoadU(d16, from + stride));
            const auto row2 = hn::BitCast(d32, hn::LoadU(d16, from + 2 * stride));
            const auto row3 = hn::BitCast(d32, hn::LoadU(d16, from + 3 * stride));
            const auto a = hn::BitCast(d64, hn::InterleaveLower(d32, row0, row1));
            const auto b = hn::BitCast(d64, hn::InterleaveLower(d32, row2, row3));
            const auto c = hn::BitCast(d64, hn::InterleaveUpper(d32, row0, row1));
            const auto d = hn::BitCast(d64, hn::InterleaveUpper(d32, row2, row3));
            std::int16_t* HWY_RESTRICT to = target + half * 8;
            hn::StoreU(hn::BitCast(d16, hn::InterleaveLower(d64, a, b)), d16, to);
            hn::StoreU(hn::BitCast(d16, hn::InterleaveUpper(d64, a, b)), d16, to + 16);
            hn::StoreU(hn::BitCast(d16, hn::InterleaveLower(d64, c, d)), d16, to + 32);
            hn::StoreU(hn::BitCast(d16, hn::InterleaveUpper(d64, c, d)), d16, to + 48);
        }
    }
}

// Turns eight columns of eight bytes into eight rows of eight bytes.
HWY_INLINE void turnBlock(const std::uint8_t* HWY_RESTRICT columns, std::uint8_t* HWY_RESTRICT target,
                          std::ptrdiff_t stride) {
    const hn::Full128<std::uint8_t> d8;
    const hn::Full128<std::uint32_t> d32;
    const hn::Half<decltype(d8)> half;
    const auto c01 = hn::Load(d8, columns);
    const auto c23 = hn::Load(d8, columns + 16);
    const auto c45 = hn::Load(d8, columns + 32);
    const auto c67 = hn::Load(d8, columns + 48);
    const auto c02 = hn::InterleaveLower(d8, c01, c23);
    const auto c13 = hn::InterleaveUpper(d8, c01, c23);
    const auto c46 = hn::InterleaveLower(d8, c45, c67);
    const auto c57 = hn::InterleaveUpper(d8, c45, c67);
    const auto left0 = hn::BitCast(d32, hn::InterleaveLower(d8, c02, c13));
    const auto left4 = hn::BitCast(d32, hn::InterleaveUpper(d8, c02, c13));
    const auto right0 = hn::BitCast(d32, hn::InterleaveLower(d8, c46, c57));
    const auto right4 = hn::BitCast(d32, hn::InterleaveUpper(d8, c46, c57));
    const auto store = [&](auto both, int row) HWY_ATTR {
        const auto bytes = hn::BitCast(d8, both);
        hn::StoreU(hn::LowerHalf(half, bytes), half, target + row * stride);
        hn::StoreU(hn::UpperHalf(half, bytes), half, target + (row + 1) * stride);
    };
    store(hn::InterleaveLower(d32, left0, right0), 0);
    store(hn::InterleaveUpper(d32, left0, right0), 2);
    store(hn::InterleaveLower(d32, left4, right4), 4);
    store(hn::InterleaveUpper(d32, left4, right4), 6);
}

void BlendColumns(const std::int16_t* HWY_RESTRICT columns, const std::int32_t* HWY_RESTRICT firstPair,
                  const std::int16_t* HWY_RESTRICT weights, int pairs, int count, std::uint8_t* HWY_RESTRICT target,
                  std::ptrdiff_t stride) {
    const HWY_CAPPED(std::int16_t, 16) d16;
    const hn::Repartition<std::int32_t, decltype(d16)> d32;
    constexpr bool wide = hn::MaxLanes(d16) == 16;
    const hn::Rebind<std::uint8_t, decltype(d32)> narrow;
    alignas(16) std::uint8_t block[rowsInBlock * 8];
    for (int x = 0; x < count; x += 8) {
        for (int i = 0; i < 8; ++i) {
            const std::int16_t* HWY_RESTRICT column = columns + std::ptrdiff_t{firstPair[x + i]} * rowsInBlock * 2;
            auto sum = hn::Set(d32, 1 << 19);
            auto lower = sum;
            for (int k = 0; k < pairs; ++k, weights += 2, column += rowsInBlock * 2) {
                const auto pair = pairOf(d16, weights);
                sum = addProducts(d32, hn::LoadU(d16, column), pair, sum);
                if constexpr (!wide)
                    lower = addProducts(d32, hn::LoadU(d16, column + 8), pair, lower);
            }
            hn::StoreU(hn::DemoteTo(narrow, hn::ShiftRight<20>(sum)), narrow, block + i * rowsInBlock);
            if constexpr (!wide)
                hn::StoreU(hn::DemoteTo(narrow, hn::ShiftRight<20>(lower)), narrow, block + i * rowsInBlock + 4);
        }
        turnBlock(block, target + x, stride);
    }
}

ResampleKernels Table() {
    return {BlendRows, PackColumns, BlendColumns};
}

#endif

} // namespace lumora::HWY_NAMESPACE
HWY_AFTER_NAMESPACE();

#if HWY_ONCE
namespace lumora {

HWY_EXPORT(Table);

const ResampleKernels& bestKernels() {
    static const ResampleKernels kernels = HWY_DYNAMIC_DISPATCH(Table)();
    return kernels;
}

std::vector<NamedKernels> allKernels() {
    bestKernels();
    std::vector<NamedKernels> all{{"plain", plainKernels()}};
    for (std::int64_t targets = hwy::SupportedTargets() & HWY_TARGETS & ~HWY_SCALAR; targets != 0;
         targets &= targets - 1) {
        const std::int64_t target = targets & -targets;
        hwy::SetSupportedTargetsForTest(target);
        hwy::GetChosenTarget().Update(hwy::SupportedTargets());
        all.push_back({hwy::TargetName(target), HWY_DYNAMIC_DISPATCH(Table)()});
        hwy::SetSupportedTargetsForTest(0);
    }
    hwy::GetChosenTarget().Update(hwy::SupportedTargets());
    return all;
}

} // namespace lumora
#endif
