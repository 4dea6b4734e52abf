#include "editing/redeye/RedEyeSight.h"

#include <algorithm>
#include <utility>

namespace lumora {

void RedEyeSight::open(PictureSize of) {
    picture = of;
    circleSize = std::clamp(std::max(of.width, of.height) / 100, 12, 80);
    Magnification = circleSize >= 48 ? 1 : circleSize >= 24 ? 2 : 4;
    RedSearchX = of.width / 2;
    RedSearchY = of.height / 2;
    bringToCentre(centre());
}

QRect RedEyeSight::circle() const {
    return {RedSearchX - circleSize / 2, RedSearchY - circleSize / 2, circleSize, circleSize};
}

void RedEyeSight::place(QPoint centre) {
    RedSearchX = std::clamp(centre.x(), 0, picture.width - 1);
    RedSearchY = std::clamp(centre.y(), 0, picture.height - 1);
}

void RedEyeSight::moveCircle(int right, int down) {
    const QPoint before = centre();
    place(before + QPoint(right, down));
    movePicture((before - centre()) * Magnification);
}

bool RedEyeSight::resizeCircle(int by) {
    const int largest = std::clamp(std::max(picture.width, picture.height), smallestCircle, largestCircle);
    const int before = std::exchange(circleSize, std::clamp(circleSize + by, smallestCircle, largest));
    return circleSize != before;
}

bool RedEyeSight::magnify(int to, QPointF middle) {
    if (to < 1 || to > largestMagnification)
        return false;
    Magnification = to;
    bringToCentre(middle);
    return true;
}

void RedEyeSight::movePicture(QPointF by) {
    moveTo(QPointF(Picture1Left, Picture1Top) + by);
}

void RedEyeSight::bringToCentre(QPointF at) {
    moveTo(viewingCentre - at * Magnification);
}

void RedEyeSight::moveTo(QPointF corner) {
    const QPointF least = viewingCentre - QPointF(picture.width, picture.height) * Magnification;
    Picture1Left = std::clamp(corner.x(), least.x(), double(viewingCentre.x()));
    Picture1Top = std::clamp(corner.y(), least.y(), double(viewingCentre.y()));
}

} // namespace lumora
