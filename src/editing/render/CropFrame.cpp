#include "editing/render/CropFrame.h"

#include <algorithm>
#include <cmath>

namespace lumora {
namespace {

constexpr std::size_t topLeft = 0;
constexpr std::size_t bottomLeft = 1;
constexpr std::size_t topRight = 2;

// How much of each side the preset leaves out.
constexpr int insetPart = 8;

template <class Point>
Point fourth(const std::array<Point, 3>& corners) {
    return {corners[topRight].x() - corners[topLeft].x() + corners[bottomLeft].x(),
            corners[bottomLeft].y() - corners[topLeft].y() + corners[topRight].y()};
}

double ratio(double markers, double handles) {
    return std::abs(handles) < 1 ? 1 : markers / handles;
}

} // namespace

QPoint CropFrame::marker(Corner corner) const {
    return corner == Corner::Picture14 ? fourth(m_markers) : m_markers[static_cast<std::size_t>(corner)];
}

QPointF CropFrame::handle(Corner corner) const {
    return corner == Corner::Picture14 ? fourth(m_handles) : m_handles[static_cast<std::size_t>(corner)];
}

void CropFrame::set(QPoint first, QPoint second, QPoint third) {
    m_markers = {first, second, third};
    m_exact = {first, second, third};
    m_handles = m_exact;
}

void CropFrame::toCorners(PictureSize paper) {
    set({0, 0}, {0, paper.height}, {paper.width, 0});
    visible = true;
}

void CropFrame::toInset(PictureSize paper) {
    const int x = paper.width / insetPart;
    const int y = paper.height / insetPart;
    set({x, y}, {x, paper.height - y}, {paper.width - x, y});
    visible = true;
}

void CropFrame::widen(int pixels) {
    const int width = m_markers[topRight].x() - m_markers[topLeft].x();
    const int height = m_markers[bottomLeft].y() - m_markers[topLeft].y();
    if (width + 2 * pixels < 1 || height + 2 * pixels < 1)
        return;
    set(m_markers[topLeft] + QPoint(-pixels, -pixels), m_markers[bottomLeft] + QPoint(-pixels, pixels),
        m_markers[topRight] + QPoint(pixels, -pixels));
}

double CropFrame::ratioX() const {
    return ratio(m_exact[topRight].x() - m_exact[topLeft].x(), m_handles[topRight].x() - m_handles[topLeft].x());
}

double CropFrame::ratioY() const {
    return ratio(m_exact[bottomLeft].y() - m_exact[topLeft].y(), m_handles[bottomLeft].y() - m_handles[topLeft].y());
}

void CropFrame::drag(Corner corner, QPointF distance) {
    if (corner == Corner::Picture14) {
        dragFree(Corner::Picture10, {distance.x(), 0});
        dragFree(Corner::Picture9, {0, distance.y()});
    } else {
        dragFree(corner, distance);
    }
}

void CropFrame::dragFree(Corner corner, QPointF distance) {
    const auto at = static_cast<std::size_t>(corner);
    m_exact[at] += QPointF(distance.x() * ratioX(), distance.y() * ratioY());
    m_handles[at] += distance;
    m_markers[at] = m_exact[at].toPoint();
}

} // namespace lumora
