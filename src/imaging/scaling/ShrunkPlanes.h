#pragma once

#include "imaging/scaling/Planes.h"

#include <cstdint>
#include <vector>

namespace lumora {

// Hands the planes of one decode to two takers: as they come to the first, and to the second as a scaled decode by
// denominator would give them. A scaled decode gives means of the file's blocks, so that the two differ by a rounding
// here and there at most.
class ShrunkPlanes : public PlaneTaker {
public:
    ShrunkPlanes(PlaneTaker& whole, PlaneTaker& small, int denominator)
        : m_whole(whole)
        , m_small(small)
        , m_denominator(denominator) {}

    void begin(const std::vector<PlaneLayout>& planes) override;
    unsigned char* row(int plane, int y) override { return m_whole.row(plane, y); }
    void rowsReady() override;

    // False when the planes come coarser than the second taker's would be, or made of pixels; it then gets nothing.
    bool reachesSmall() const { return !m_planes.empty(); }

private:
    struct Shrunk {
        int side; // samples of which one is made
        PlaneLayout layout;
    };
    void shrinkBlocks(int plane, int top);

    PlaneTaker& m_whole;
    PlaneTaker& m_small;
    const int m_denominator;
    std::vector<Shrunk> m_planes;
    std::vector<std::uint16_t> m_sums;
    int m_step = 0;
};

} // namespace lumora
