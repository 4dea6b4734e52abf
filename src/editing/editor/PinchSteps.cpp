#include "editing/editor/PinchSteps.h"

#include "order/EditRecord.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <limits>

namespace lumora {

PinchSteps::Steps PinchSteps::follow(double times, double degrees) {
    const double least = EditStep::zoom(0, 0);
    const double most = EditStep::zoom(std::numeric_limits<std::int16_t>::max(), 0);
    Steps steps;
    const double wanted = std::clamp(m_from * times, least, most);
    steps.zoom = static_cast<int>((wanted - m_reached) / zoomStep);
    m_reached += steps.zoom * zoomStep;
    const auto turned = static_cast<int>(std::lround(degrees));
    steps.turn = turned - m_turned;
    m_turned = turned;
    return steps;
}

} // namespace lumora
