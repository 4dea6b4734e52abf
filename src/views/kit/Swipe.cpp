#include "views/kit/Swipe.h"

#include <cmath>

namespace lumora {

bool Swipe::strays(QPointF to) {
    const QPointF way = to - m_from;
    m_strayed = m_strayed || std::hypot(way.x(), way.y()) > press;
    return m_strayed;
}

Swipe::Way Swipe::end(QPointF to, qint64 time) {
    const QPointF way = to - m_from;
    const double across = std::abs(way.x());
    if (across < length || across < 2 * std::abs(way.y()) || time - m_since > longest)
        return Way::None;
    return way.x() < 0 ? Way::Left : Way::Right;
}

} // namespace lumora
