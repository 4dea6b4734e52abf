#pragma once

#include <QColor>
#include <QImage>

#include <utility>

namespace lumora {

// A picture in memory, 32 bits a pixel, origin top left.
class Bitmap {
public:
    Bitmap() = default;
    explicit Bitmap(QImage image)
        : m_image(std::move(image)) {}
    // Filled with the colour. Null when width or height is under 1 or memory is short.
    Bitmap(int width, int height, QColor fill);

    bool isNull() const { return m_image.isNull(); }
    int width() const { return m_image.width(); }
    int height() const { return m_image.height(); }

    // For QPainter and for views.
    const QImage& image() const { return m_image; }
    QImage& image() { return m_image; }

private:
    QImage m_image;
};

// The picture with white behind what is transparent.
Bitmap onWhite(const Bitmap& picture);

} // namespace lumora
