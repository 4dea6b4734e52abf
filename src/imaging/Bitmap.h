#pragma once

#include <QColor>
#include <QImage>

#include <utility>

namespace lumora {

// A picture in memory: 32 bits a pixel, origin top left.
class Bitmap {
public:
    Bitmap() = default;
    explicit Bitmap(QImage image)
        : m_image(std::move(image)) {}
    // Every pixel gets the colour fill. The bitmap is null when width or height is under 1 or when memory is short.
    Bitmap(int width, int height, QColor fill);

    bool isNull() const { return m_image.isNull(); }
    int width() const { return m_image.width(); }
    int height() const { return m_image.height(); }

    const QImage& image() const { return m_image; }
    QImage& image() { return m_image; }

private:
    QImage m_image;
};

// The picture on a white ground; null when memory is short.
Bitmap onWhite(const Bitmap& picture);

} // namespace lumora
