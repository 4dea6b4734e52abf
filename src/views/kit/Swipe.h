#pragma once

#include <QPointF>

namespace lumora {

// Tells what the way of a finger over pictures means: a press, a swipe to a side, or neither. Lengths are logical
// pixels, since a finger is as large on each screen; times are milliseconds.
class Swipe {
public:
    enum class Way { None, Left, Right };
    static constexpr double press = 24;     // as far as a finger strays that presses
    static constexpr double length = 60;    // of the shortest swipe
    static constexpr qint64 longest = 1500; // a hand that rests and wanders means nothing

    Swipe(QPointF from, qint64 time)
        : m_from(from)
        , m_since(time) {}

    // Whether the finger no longer presses; it does not press again where it comes back.
    bool strays(QPointF to);
    Way end(QPointF to, qint64 time);

private:
    QPointF m_from;
    qint64 m_since;
    bool m_strayed = false;
};

} // namespace lumora
