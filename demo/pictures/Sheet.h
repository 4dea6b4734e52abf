#pragma once

#include "imaging/Bitmap.h"

#include <QColor>
#include <QPainter>
#include <QPainterPath>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <functional>
#include <initializer_list>

// What the scenes are drawn with. They are drawn in units of their own, so that one drawing serves every size.
namespace lumora::demo {

// The same numbers from the same seed.
class Dice {
public:
    explicit Dice(std::uint32_t seed)
        : m_state(seed * 2654435761U | 1U) {}

    std::uint32_t bits();
    double in(double low, double high) { return low + (high - low) * (bits() / 4294967296.0); }
    // Mostly near the middle, as sizes in nature are.
    double around(double middle, double spread) { return middle + spread * (in(-1, 1) + in(-1, 1)) / 2; }
    int upTo(int end) { return static_cast<int>(bits() % static_cast<unsigned>(end)); }

private:
    std::uint32_t m_state;
};

// Smooth random heights from 0 to 1; octaves adds finer ones of half the height each.
float smoothNoise(float x, float y, std::uint32_t seed);
float layeredNoise(float x, float y, int octaves, std::uint32_t seed);

inline float smoothStep(float from, float to, float value) {
    const float t = std::clamp((value - from) / (to - from), 0.0F, 1.0F);
    return t * t * (3 - 2 * t);
}

// Channels from 0 to 255, a from 0 to 1.
struct Tint {
    float r, g, b, a = 1;
};
Tint mixed(Tint from, Tint to, float share);
QColor mixed(const QColor& from, const QColor& to, double share);
QColor withAlpha(QColor colour, double alpha);

// A closed outline of cubic curves: the first point, then three points a curve.
QPainterPath outline(std::initializer_list<QPointF> curve);
QPainterPath polygon(std::initializer_list<QPointF> corners);

// A spot that fades out at its edge.
void airbrush(QPainter& painter, QPointF at, double radiusX, double radiusY, const QColor& colour, double strength,
              double angle = 0);
void stroke(QPainter& painter, const QPainterPath& path, const QColor& colour, double width);
QPainterPath curve(QPointF from, QPointF by, QPointF to);

// What the camera does to a finished picture.
struct Film {
    float contrast = 0.12F;
    float warmth = 0;      // 1 is an evening lamp
    float vignette = 0.2F; // what the corners lose
    float grain = 5;       // in steps of a channel, at middle grey
};

class Sheet {
public:
    // The unit is the picture's width by unitsAcross.
    Sheet(int width, int height, double unitsAcross, std::uint32_t seed);

    QPainter& painter() { return m_painter; }
    Dice& dice() { return m_dice; }
    double width() const { return m_unitsAcross; }
    double height() const { return m_unitsAcross * m_picture.height() / m_picture.width(); }

    void gradient(const QRectF& area, std::initializer_list<std::pair<double, QColor>> fromTopToBottom);

    // Draws out of focus: radius in units. Only what lies in the area is drawn.
    void soft(const QRectF& area, double radius, const std::function<void(QPainter&)>& draw, double opacity = 1,
              QPainter::CompositionMode mode = QPainter::CompositionMode_SourceOver);
    // Adds light around a lamp.
    void glow(QPointF at, double radius, const QColor& colour, double strength = 1);

    // Asks at(x, y) in units for each dot of the area; the dots are coarse pixels wide.
    template <typename At>
    void dots(const QRectF& area, int coarse, const At& at) {
        const double step = coarse * m_unitsAcross / m_picture.width();
        QImage image(std::max(2, static_cast<int>(std::lround(area.width() / step))),
                     std::max(2, static_cast<int>(std::lround(area.height() / step))),
                     QImage::Format_ARGB32_Premultiplied);
        const auto stepX = static_cast<float>(area.width() / image.width());
        const auto stepY = static_cast<float>(area.height() / image.height());
        for (int y = 0; y < image.height(); ++y) {
            auto* row = reinterpret_cast<QRgb*>(image.scanLine(y));
            const float v = static_cast<float>(area.top()) + (static_cast<float>(y) + 0.5F) * stepY;
            for (int x = 0; x < image.width(); ++x)
                row[x] = premultiplied(at(static_cast<float>(area.left()) + (static_cast<float>(x) + 0.5F) * stepX, v));
        }
        m_painter.drawImage(area, image);
    }

    // A hair or a blade of grass, which tapers off; clipped by nothing. QPainter needs seconds for thousands of them.
    void strand(QPointF from, QPointF by, QPointF to, double width, const QColor& colour);

    // Fine unevenness of a surface: cells of this size in units are lightened and darkened.
    void texture(const QPainterPath& where, double cellX, double cellY, double strength);

    // The picture above the line as still water shows it, down to the bottom.
    void mirror(double line, double bottom, double ripple, const QColor& water, double depth);

    // Ends the drawing.
    Bitmap developed(const Film& film);

private:
    static QRgb premultiplied(const Tint& tint);

    Bitmap m_picture;
    double m_unitsAcross;
    Dice m_dice;
    QPainter m_painter;
};

} // namespace lumora::demo
