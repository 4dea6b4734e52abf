#include "imaging/scaling/PlaneScaler.h"

#include <algorithm>
#include <cmath>
#include <numeric>
#include <span>

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

// Rounds the weights so that their sum is exact; the remainder goes to those that lost most. exact becomes the rounding
// errors.
void roundToSum(std::span<double> exact, std::span<std::int16_t> weights) {
    const double sum = std::accumulate(exact.begin(), exact.end(), 0.0);
    int left = weightOne;
    for (std::size_t i = 0; i < exact.size(); ++i) {
        const double weight = exact[i] / sum * weightOne;
        weights[i] = static_cast<std::int16_t>(std::lround(weight));
        exact[i] = weight - weights[i];
        left -= weights[i];
    }
    for (; left != 0; left -= left > 0 ? 1 : -1) {
        const auto at =
            left > 0 ? std::max_element(exact.begin(), exact.end()) : std::min_element(exact.begin(), exact.end());
        weights[static_cast<std::size_t>(at - exact.begin())] += left > 0 ? 1 : -1;
        *at -= left > 0 ? 1 : -1;
    }
}

} // namespace

CubicWeights CubicWeights::make(const PlaneAxis& axis) {
    const double widened = std::max(1.0, axis.step);
    const int most = std::min(axis.source, static_cast<int>(std::ceil(4 * widened)) + 2);
    const auto target = static_cast<std::size_t>(axis.target);
    const auto stride = static_cast<std::size_t>(most);
    // A row of weights begins at its first weight that is not 0; places behind the last stay 0.
    std::vector<std::int16_t> wide(target * stride, 0);
    CubicWeights result;
    result.first.resize(target);
    std::vector<double> exact(stride);
    std::vector<std::int16_t> whole(stride);
    for (int i = 0; i < axis.target; ++i) {
        const double centre = (axis.first + i + 0.5) * axis.step - 0.5;
        const int low = static_cast<int>(std::floor(centre - 2 * widened)) + 1;
        const int high = static_cast<int>(std::ceil(centre + 2 * widened)) - 1;
        const int first = std::clamp(low, 0, axis.source - 1);
        const int last = std::clamp(high, 0, axis.source - 1);
        const auto count = static_cast<std::size_t>(last - first) + 1;
        std::fill_n(exact.begin(), count, 0.0);
        for (int k = low; k <= high; ++k)
            exact[static_cast<std::size_t>(std::clamp(k, first, last) - first)] += cubic((k - centre) / widened);
        roundToSum(std::span(exact).first(count), std::span(whole).first(count));
        std::size_t begin = 0;
        std::size_t end = count;
        while (whole[begin] == 0)
            ++begin;
        while (whole[end - 1] == 0)
            --end;
        const auto row = static_cast<std::size_t>(i);
        std::copy(whole.begin() + std::ptrdiff_t(begin), whole.begin() + std::ptrdiff_t(end),
                  wide.begin() + std::ptrdiff_t(row * stride));
        result.first[row] = first + static_cast<int>(begin);
        result.taps = std::max(result.taps, static_cast<int>(end - begin));
    }
    result.weights.reserve(target * static_cast<std::size_t>(result.taps));
    for (std::size_t row = 0; row < target; ++row) {
        const auto begin = wide.begin() + std::ptrdiff_t(row * stride);
        result.weights.insert(result.weights.end(), begin, begin + result.taps);
    }
    return result;
}

PlaneScaler::Weights::Weights(const PlaneAxis& acrossAxis, const PlaneAxis& downAxis, int outputCount)
    : across(acrossAxis)
    , down(downAxis)
    , rows(CubicWeights::make(downAxis)) {
    // The first tap of a column lies at an even sample, since the kernels read columns in pairs.
    const CubicWeights columns = CubicWeights::make(across);
    const auto [lowest, highest] = std::minmax_element(columns.first.begin(), columns.first.end());
    columnBegin = *lowest / 2 * 2;
    columnCount = std::min(across.source, *highest + columns.taps) - columnBegin;
    pairs = (columns.taps + 2) / 2;
    pairWeights.assign(static_cast<std::size_t>(outputCount) * static_cast<std::size_t>(pairs) * 2, 0);
    firstPair.resize(static_cast<std::size_t>(outputCount));
    for (int i = 0; i < outputCount; ++i) {
        const int from = std::min(i, across.target - 1);
        const int first = columns.first[static_cast<std::size_t>(from)];
        firstPair[static_cast<std::size_t>(i)] = (first - columnBegin) / 2;
        std::copy_n(columns.weights.begin() + std::ptrdiff_t{from} * columns.taps, columns.taps,
                    pairWeights.begin() + std::ptrdiff_t{i} * pairs * 2 + first % 2);
    }
    // The kernels read rows in pairs too.
    if (rows.taps % 2 != 0) {
        std::vector<std::int16_t> even;
        even.reserve(rows.weights.size() + static_cast<std::size_t>(down.target));
        for (int i = 0; i < down.target; ++i) {
            const auto begin = rows.weights.begin() + std::ptrdiff_t{i} * rows.taps;
            even.insert(even.end(), begin, begin + rows.taps);
            even.push_back(0);
        }
        rows.weights = std::move(even);
        ++rows.taps;
    }
}

PlaneScaler::PlaneScaler(PlaneAxis across, PlaneAxis down, int rowsAtOnce, int rowBytes, const ResampleKernels& kernels,
                         const PlaneScaler* like)
    : m_kernels(kernels)
    , m_down(down)
    , m_outputCount(roundedUp(across.target, 8))
    , m_weights(like != nullptr && like->m_weights->across == across && like->m_weights->down == down
                    ? like->m_weights
                    : std::make_shared<const Weights>(across, down, m_outputCount))
    , m_inputRows(m_weights->rows.taps + rowsAtOnce)
    , m_inputStride(roundedUp(std::max(rowBytes, across.source), 64) + ResampleKernels::slack)
    , m_input(static_cast<std::size_t>(m_inputRows) * static_cast<std::size_t>(m_inputStride))
    , m_taps(static_cast<std::size_t>(m_weights->rows.taps))
    , m_blendedStride(roundedUp(across.source, 64) + ResampleKernels::slack)
    , m_blended(ResampleKernels::rows * static_cast<std::size_t>(m_blendedStride))
    , m_columns((static_cast<std::size_t>(m_blendedStride) + static_cast<std::size_t>(m_weights->pairs) * 2) *
                ResampleKernels::rows)
    , m_outputStride(roundedUp(m_outputCount, 64)) {}

PlaneScaler::Range PlaneScaler::inputRows() const {
    const auto [lowest, highest] = std::minmax_element(m_weights->rows.first.begin(), m_weights->rows.first.end());
    return {*lowest, std::min(m_down.source, *highest + m_weights->rows.taps)};
}

void PlaneScaler::rowsReady(int end) {
    const int taps = m_weights->rows.taps;
    const int have = std::min(end, m_down.source);
    while (m_outputEnd + m_blendedRows < m_down.target) {
        const auto next = static_cast<std::size_t>(m_outputEnd) + static_cast<std::size_t>(m_blendedRows);
        const std::int16_t* weights = m_weights->rows.weights.data() + next * static_cast<std::size_t>(taps);
        const int first = m_weights->rows.first[next];
        int used = taps;
        while (weights[used - 1] == 0)
            --used;
        if (first + used > have)
            return;
        // Places behind the last used row have the weight 0, so that row serves for them.
        for (int k = 0; k < taps; ++k)
            m_taps[static_cast<std::size_t>(k)] = inputRow(first + std::min(k, used - 1)) + m_weights->columnBegin;
        m_kernels.blendRows(m_taps.data(), weights, used + used % 2, m_weights->columnCount,
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
    m_kernels.packColumns(m_blended.data(), m_blendedStride, m_weights->columnCount, m_columns.data());
    m_kernels.blendColumns(m_columns.data(), m_weights->firstPair.data(), m_weights->pairWeights.data(),
                           m_weights->pairs, m_outputCount, m_output.data() + held * m_outputStride, m_outputStride);
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
