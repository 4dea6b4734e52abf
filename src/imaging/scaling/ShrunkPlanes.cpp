#include "imaging/scaling/ShrunkPlanes.h"

#include "imaging/scaling/PixelRows.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace lumora {

namespace {

constexpr int largestBlock = 8;

// What is added to a sum of samples to give the sum that they would have without their rounding: the mean of area
// samples is 128 and a multiple of step eighths.
int lostToRounding(int sum, int area, int step, float blocksAStep) {
    constexpr int upwards = 1 << 18; // the cut to a whole number is then a rounding
    const int above = 8 * (sum - 128 * area);
    const int times =
        static_cast<int>(static_cast<float>(above) * blocksAStep + (static_cast<float>(upwards) + 0.5F)) - upwards;
    return times * step * area / 8 + 128 * area - sum;
}

// Makes Parts x Parts samples of each block, each the mean of Side x Side with halves upwards; the parts of a block
// share what its mean has lost. sums: of the columns of each part, one part behind the other.
template <int Side, int Parts>
void writeMeans(const std::uint16_t* sums, int width, int step, unsigned char* const* to) {
    constexpr int area = Side * Side * Parts * Parts;
    const float blocksAStep = 1.0F / static_cast<float>(step * area);
    for (int block = 0; block < width / (Side * Parts); ++block, sums += Side * Parts) {
        std::array<int, Parts * Parts> parts{};
        auto* part = parts.data();
        int whole = 0;
        for (int y = 0; y < Parts; ++y) {
            for (int x = 0; x < Parts; ++x) {
                int sum = 0;
                for (int k = 0; k < Side; ++k)
                    sum += sums[y * width + x * Side + k];
                *part++ = sum;
                whole += sum;
            }
        }
        const int lost = lostToRounding(whole, area, step, blocksAStep) + area / 2;
        part = parts.data();
        for (int y = 0; y < Parts; ++y) {
            for (int x = 0; x < Parts; ++x) {
                const int sum = *part++ * Parts * Parts + lost;
                to[y][block * Parts + x] = static_cast<unsigned char>(std::clamp(sum / area, 0, 255));
            }
        }
    }
}

} // namespace

void ShrunkPlanes::begin(const std::vector<PlaneLayout>& planes) {
    m_whole.begin(planes);
    std::vector<PlaneLayout> small;
    std::size_t sums = 0;
    for (const PlaneLayout& plane : planes) {
        int side = 1;
        while (side < plane.block && std::min(plane.pitchX, plane.pitchY) * side < m_denominator)
            side *= 2;
        if (plane.block > largestBlock || plane.block % side != 0 || plane.meanStep == 0 ||
            (m_planes.empty() && plane.pitchX * side != m_denominator)) {
            m_planes.clear();
            return;
        }
        const auto shrunk = [side](int samples) { return (samples + side - 1) / side; };
        small.push_back({shrunk(plane.width), shrunk(plane.height), plane.pitchX * side, plane.pitchY * side,
                         plane.rowsAtOnce / side, plane.rowBytes / side});
        m_planes.push_back({side, plane});
        sums = std::max(sums, static_cast<std::size_t>(plane.rowBytes) * static_cast<std::size_t>(plane.block / side));
    }
    m_sums.resize(sums);
    m_small.begin(small);
}

void ShrunkPlanes::rowsReady() {
    for (int i = 0; i < static_cast<int>(m_planes.size()); ++i) {
        const auto& [side, plane] = m_planes[static_cast<std::size_t>(i)];
        const int top = m_step * plane.rowsAtOnce;
        for (int y = top; y < top + plane.rowsAtOnce; y += side == 1 ? 1 : plane.block) {
            if (side == 1)
                std::copy_n(m_whole.row(i, y), plane.rowBytes, m_small.row(i, y));
            else
                shrinkBlocks(i, y);
        }
    }
    ++m_step;
    m_whole.rowsReady();
    if (reachesSmall())
        m_small.rowsReady();
}

void ShrunkPlanes::shrinkBlocks(int plane, int top) {
    const auto& [side, layout] = m_planes[static_cast<std::size_t>(plane)];
    const int parts = layout.block / side;
    std::array<const std::uint8_t*, largestBlock> rows{};
    std::array<unsigned char*, largestBlock> to{};
    for (int part = 0; part < parts; ++part) {
        for (int k = 0; k < side; ++k)
            rows[static_cast<std::size_t>(k)] = m_whole.row(plane, top + part * side + k);
        to[static_cast<std::size_t>(part)] = m_small.row(plane, top / side + part);
        addRows({rows.data(), static_cast<std::size_t>(side)}, m_sums.data() + part * layout.rowBytes, layout.rowBytes);
    }
    const auto write = side == 8                 ? writeMeans<8, 1>
                       : side == 4 && parts == 2 ? writeMeans<4, 2>
                       : side == 4               ? writeMeans<4, 1>
                       : parts == 4              ? writeMeans<2, 4>
                       : parts == 2              ? writeMeans<2, 2>
                                                 : writeMeans<2, 1>;
    write(m_sums.data(), layout.rowBytes, layout.meanStep, to.data());
}

} // namespace lumora
