#include "imaging/PlaneScaler.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace lumora {

namespace {

constexpr int weightOne = 16384;

int roundedUp(int value, int multiple) {
    return (value + multiple - 1) / multiple * multiple;
}

double cubic(double x) {
    constexpr double a = -0.5;
    x = std::abs(x);
    if (x < 1)
        return ((a + 2) * x - (a + 3)) * x * x + 1;
    if (x < 2)
        return (((x - 5) * x + 8) * x - 4) * a;
    return 0;
}

// Rounded so that the sum is exact: what is left over goes where rounding took most.
std::vector<int> rounded(const std::vector<double>& exact) {
    const double sum = std::accumulate(exact.begin(), exact.end(), 0.0);
    std::vector<int> weights(exact.size());
    std::vector<double> lost(exact.size());
    int left = weightOne;
    for (std::size_t i = 0; i < exact.size(); ++i) {
        const double weight = exact[i] / sum * weightOne;
        weights[i] = static_cast<int>(std::lround(weight));
        lost[i] = weight - weights[i];
        left -= weights[i];
    }
    for (; left != 0; left -= left > 0 ? 1 : -1) {
        const auto at =
            left > 0 ? std::max_element(lost.begin(), lost.end()) : std::min_element(lost.begin(), lost.end());
        weights[static_cast<std::size_t>(at - lost.begin())] += left > 0 ? 1 : -1;
        *at -= left > 0 ? 1 : -1;
    }
    return weights;
}

} // namespace

CubicWeights CubicWeights::make(const PlaneAxis& axis) {
    const double widened = std::max(1.0, axis.step);
    std::vector<std::vector<int>> all(static_cast<std::size_t>(axis.target));
    CubicWeights result;
    result.first.resize(all.size());
    std::vector<double> exact;
    for (int i = 0; i < axis.target; ++i) {
        const double centre = (axis.first + i + 0.5) * axis.step - 0.5;
        const int low = static_cast<int>(std::floor(centre - 2 * widened)) + 1;
        const int high = static_cast<int>(std::ceil(centre + 2 * widened)) - 1;
        const int first = std::clamp(low, 0, axis.source - 1);
        const int last = std::clamp(high, 0, axis.source - 1);
        exact.assign(static_cast<std::size_t>(last - first) + 1, 0.0);
        for (int k = low; k <= high; ++k)
            exact[static_cast<std::size_t>(std::clamp(k, first, last) - first)] += cubic((k - centre) / widened);
        auto& weights = all[static_cast<std::size_t>(i)];
        weights = rounded(exact);
        int start = first;
        while (weights.front() == 0) {
            weights.erase(weights.begin());
            ++start;
        }
        while (weights.back() == 0)
            weights.pop_back();
        result.first[static_cast<std::size_t>(i)] = start;
        result.taps = std::max(result.taps, static_cast<int>(weights.size()));
    }
    for (auto& weights : all) {
        weights.resize(static_cast<std::size_t>(result.taps));
        for (const int weight : weights)
            result.weights.push_back(static_cast<std::int16_t>(weight));
    }
    return result;
}

PlaneScaler::PlaneScaler(PlaneAxis across, PlaneAxis down, int rowsAtOnce, int rowBytes, const ResampleKernels& kernels)
    : m_kernels(kernels)
    , m_across(across)
    , m_down(down)
    , m_rowWeights(CubicWeights::make(down))
    , m_outputCount(roundedUp(across.target, 8))
    , m_inputRows(m_rowWeights.taps + rowsAtOnce)
    , m_inputStride(roundedUp(std::max(rowBytes, across.source), 64) + ResampleKernels::slack)
    , m_input(static_cast<std::size_t>(m_inputRows) * static_cast<std::size_t>(m_inputStride))
    , m_taps(static_cast<std::size_t>(m_rowWeights.taps) + 1)
    , m_blendedStride(roundedUp(across.source, 64) + ResampleKernels::slack)
    , m_blended(ResampleKernels::rows * static_cast<std::size_t>(m_blendedStride))
    , m_columns([&] {
        // Taps of a row begin at an even sample, since columns are packed in pairs.
        const CubicWeights weights = CubicWeights::make(across);
        const auto [lowest, highest] = std::minmax_element(weights.first.begin(), weights.first.end());
        m_columnBegin = *lowest / 2 * 2;
        m_columnCount = std::min(across.source, *highest + weights.taps) - m_columnBegin;
        m_pairs = (weights.taps + 2) / 2;
        m_pairWeights.assign(static_cast<std::size_t>(m_outputCount) * static_cast<std::size_t>(m_pairs) * 2, 0);
        m_firstPair.resize(static_cast<std::size_t>(m_outputCount));
        for (int i = 0; i < m_outputCount; ++i) {
            const int from = std::min(i, across.target - 1);
            const int first = weights.first[static_cast<std::size_t>(from)];
            m_firstPair[static_cast<std::size_t>(i)] = (first - m_columnBegin) / 2;
            std::copy_n(weights.weights.begin() + std::ptrdiff_t{from} * weights.taps, weights.taps,
                        m_pairWeights.begin() + std::ptrdiff_t{i} * m_pairs * 2 + first % 2);
        }
        return SampleBuffer<std::int16_t>(
            (static_cast<std::size_t>(m_blendedStride) + static_cast<std::size_t>(m_pairs) * 2) *
            ResampleKernels::rows);
    }())
    , m_outputStride(roundedUp(m_outputCount, 64)) {
    // The rows are blended in pairs too.
    if (m_rowWeights.taps % 2 != 0) {
        std::vector<std::int16_t> even;
        for (int i = 0; i < down.target; ++i) {
            const auto begin = m_rowWeights.weights.begin() + std::ptrdiff_t{i} * m_rowWeights.taps;
            even.insert(even.end(), begin, begin + m_rowWeights.taps);
            even.push_back(0);
        }
        m_rowWeights.weights = std::move(even);
        ++m_rowWeights.taps;
    }
}

void PlaneScaler::rowsReady(int end) {
    const int taps = m_rowWeights.taps;
    const int have = std::min(end, m_down.source);
    while (m_outputEnd + m_blendedRows < m_down.target) {
        const auto next = static_cast<std::size_t>(m_outputEnd + m_blendedRows);
        const std::int16_t* weights = m_rowWeights.weights.data() + next * static_cast<std::size_t>(taps);
        const int first = m_rowWeights.first[next];
        int used = taps;
        while (weights[used - 1] == 0)
            --used;
        if (first + used > have)
            return;
        // Where the weight is 0 any row serves.
        for (int k = 0; k < taps; ++k)
            m_taps[static_cast<std::size_t>(k)] = inputRow(first + std::min(k, used - 1)) + m_columnBegin;
        m_kernels.blendRows(m_taps.data(), weights, used + used % 2, m_columnCount,
                            m_blended.data() + m_blendedRows * m_blendedStride);
        if (++m_blendedRows == ResampleKernels::rows)
            finishBlock(ResampleKernels::rows);
    }
    if (m_blendedRows > 0)
        finishBlock(m_blendedRows);
}

void PlaneScaler::finishBlock(int rows) {
    const int held = m_outputEnd - m_outputBegin;
    const auto needed =
        static_cast<std::size_t>(held + ResampleKernels::rows) * static_cast<std::size_t>(m_outputStride);
    if (m_output.size() < needed)
        m_output.resize(needed);
    m_kernels.packColumns(m_blended.data(), m_blendedStride, m_columnCount, m_columns.data());
    m_kernels.blendColumns(m_columns.data(), m_firstPair.data(), m_pairWeights.data(), m_pairs, m_outputCount,
                           m_output.data() + held * m_outputStride, m_outputStride);
    m_outputEnd += rows;
    m_blendedRows = 0;
}

void PlaneScaler::release(int y) {
    const int gone = std::min(y, m_outputEnd) - m_outputBegin;
    if (gone <= 0)
        return;
    const int kept = m_outputEnd - m_outputBegin - gone;
    std::copy_n(m_output.begin() + gone * m_outputStride, kept * m_outputStride, m_output.begin());
    m_outputBegin += gone;
}

} // namespace lumora
