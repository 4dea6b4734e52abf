#pragma once

#include <QPointF>

#include <optional>

namespace lumora {

// A handle that the pointer drags. Each move takes it a thirteenth of the pointer's distance from where it was pressed,
// so that a far drag goes faster. The position keeps fractions of a pixel.
class DragHandle {
public:
    static constexpr double slowness = 13;

    void press(QPointF at) { m_anchor = at; }
    void release() { m_anchor.reset(); }
    bool held() const { return m_anchor.has_value(); }

    // How far this move takes the handle; nothing while it is not held.
    QPointF distance(QPointF at) const { return m_anchor ? (at - *m_anchor) / slowness : QPointF(); }
    void move(QPointF at) { m_position += distance(at); }

    QPointF position() const { return m_position; }
    void put(QPointF position) { m_position = position; }

private:
    QPointF m_position;
    std::optional<QPointF> m_anchor;
};

} // namespace lumora
