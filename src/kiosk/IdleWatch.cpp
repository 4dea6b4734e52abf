#include "kiosk/IdleWatch.h"

#include "platform/Machine.h"

#include <algorithm>

namespace lumora {

std::chrono::milliseconds IdleWatch::now() const {
    return m_clock.running();
}

// What a view sends by itself, as entering and leaving where a page changes below a pointer, is no sign.
bool IdleWatch::isSignOfLife(QEvent::Type event) {
    switch (event) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseMove:
    case QEvent::Wheel:
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
    case QEvent::TabletPress:
    case QEvent::TabletMove:
        return true;
    default:
        return false;
    }
}

void IdleWatch::sign() {
    m_phase = Phase::Alive;
    m_since = now();
}

// The time of the question runs from its showing, however late the look came that began it.
IdleWatch::Phase IdleWatch::look(Silence silence) {
    if (silence == Silence::MayNotEnd || silence == Silence::NeedsNone) {
        sign();
    } else if (m_phase == Phase::Asking) {
        if (now() - m_since >= answerTime)
            m_phase = Phase::Over;
    } else if (m_phase == Phase::Alive && now() - m_since >= m_idle) {
        m_phase = silence == Silence::IsAsked ? Phase::Asking : Phase::Over;
        m_since = now();
    }
    return m_phase;
}

int IdleWatch::secondsLeft() const {
    const auto left = std::chrono::ceil<std::chrono::seconds>(answerTime - (now() - m_since));
    return static_cast<int>(std::max<std::chrono::seconds::rep>(left.count(), 0));
}

} // namespace lumora
