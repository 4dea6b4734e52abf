#include "start/StartMotion.h"

namespace lumora {

void StartMotion::moveArrow() {
    if (m_arrow >= arrowBottom)
        m_arrow = arrowTop;
    ++m_arrow;
}

void StartMotion::movePicture() {
    if (m_picture >= pictureWidth)
        m_pictureStep = -1;
    m_picture += m_pictureStep;
    if (m_picture < 5)
        m_pictureStep = 1;
}

bool StartMotion::unfoldPanel() {
    const bool folded = m_panel < panelWidth;
    if (folded)
        m_panel += 5;
    return folded;
}

} // namespace lumora
