#pragma once

#include "imaging/files/PictureFile.h"

#include <QPoint>
#include <QPointF>
#include <QRect>

namespace lumora {

// Where the circle of the red-eye page stands and which part of the picture is in sight.
//
// A point of the picture is in its own pixels. The viewing area is a surface whose middle is viewingCentre, on which
// the picture's corner lies at (Picture1Left, Picture1Top) and one pixel takes Magnification units. The picture never
// leaves the middle of the viewing area, and the circle's centre never leaves the picture.
struct RedEyeSight {
    static constexpr int smallestCircle = 4;
    static constexpr int largestCircle = 1000;
    static constexpr int largestMagnification = 4;
    static constexpr QPoint viewingCentre{500, 400};

    PictureSize picture;
    double Picture1Left = 0;
    double Picture1Top = 0;
    int Magnification = 1; // 1, 2 or 4
    int RedSearchX = 0;    // the middle of the search, and of the circle
    int RedSearchY = 0;
    int circleSize = 40; // pixels a side

    // The middle of a picture, with a circle and a magnification that suit an eye in a picture of that size.
    void open(PictureSize of);

    QPoint centre() const { return {RedSearchX, RedSearchY}; }
    QRect circle() const; // its square; may reach over the edge
    QPointF middle() const { return (viewingCentre - QPointF(Picture1Left, Picture1Top)) / Magnification; }

    void place(QPoint centre);
    // The picture moves along, so that the circle stays where it is in sight.
    void moveCircle(int right, int down);
    bool resizeCircle(int by);            // false: it has that limit already
    bool magnify(int to, QPointF middle); // false: there is no such magnification
    void movePicture(QPointF by);         // units of the viewing area
    void bringToCentre(QPointF at);       // a point of the picture

private:
    void moveTo(QPointF corner);
};

} // namespace lumora
