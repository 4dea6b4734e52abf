#pragma once

#include "imaging/files/PictureFile.h"

#include <QPoint>
#include <QPointF>

#include <array>

namespace lumora {

// The corner markers that the operator may lay over the paper. Neither preview nor print is cut by them. Three corners
// are free and the fourth follows, so that the four are always a parallelogram. Each corner has a handle that is
// dragged; its marker moves in the proportion of marker size to handle size.
class CropFrame {
public:
    // Top left, bottom left, top right, and the one that follows.
    enum class Corner { Picture11, Picture9, Picture10, Picture14 };

    static constexpr int step = 6; // of widening and narrowing, a side

    bool visible = false;

    QPoint marker(Corner corner) const;
    QPointF handle(Corner corner) const;

    void toCorners(PictureSize paper);
    void toInset(PictureSize paper);
    // Every side moves outwards by so many pixels, or inwards; sides never pass one another.
    void widen(int pixels);

    // Dragging the fourth corner moves the side that each of its two neighbours holds.
    void drag(Corner corner, QPointF distance);

private:
    void set(QPoint topLeft, QPoint bottomLeft, QPoint topRight);
    void dragFree(Corner corner, QPointF distance);
    double ratioX() const;
    double ratioY() const;

    std::array<QPoint, 3> m_markers{};
    std::array<QPointF, 3> m_exact{}; // the markers with the fractions of small drags
    std::array<QPointF, 3> m_handles{};
};

} // namespace lumora
