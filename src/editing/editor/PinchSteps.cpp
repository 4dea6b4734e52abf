#include "editing/editor/PinchSteps.h"

#include <algorithm>
#include <cmath>

namespace lumora {

PinchSteps::Steps PinchSteps::follow(double times, double degrees) {
    Steps steps;
    const double wanted = std::clamp(m_from * times, 40.0, 210.0);
    steps.zoom = static_cast<int>((wanted - m_reached) / zoomStep);
    m_reached += steps.zoom * zoomStep;
    const auto turned = static_cast<int>(std::lround(degrees));
    steps.turn = turned - m_turned;
    m_turned = turned;
    return steps;
}

} // namespace lumora
