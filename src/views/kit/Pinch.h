#pragma once

#include <QLineF>

namespace lumora {

// What two fingers have done to what lies below them since the second one came.
class Pinch {
public:
    explicit Pinch(QLineF fingers)
        : m_first(fingers)
        , m_last(fingers) {}

    void follow(QLineF fingers);

    double times() const;                        // their distance, of the first one
    double degrees() const { return m_degrees; } // clockwise, any number of turns

private:
    QLineF m_first;
    QLineF m_last;
    double m_degrees = 0;
};

} // namespace lumora
