#include "views/kit/Pinch.h"

#include <algorithm>

namespace lumora {

namespace {

constexpr double closest = 20; // logical pixels, of two fingers side by side

} // namespace

void Pinch::follow(QLineF fingers) {
    const double turned = fingers.angleTo(m_last); // 0 to 360, where the angles of a line run counterclockwise
    m_degrees += turned > 180 ? turned - 360 : turned;
    m_last = fingers;
}

double Pinch::times() const {
    return std::max(closest, m_last.length()) / std::max(closest, m_first.length());
}

} // namespace lumora
