#include "imaging/Bitmap.h"

namespace lumora {

Bitmap::Bitmap(int width, int height, QColor fill)
    : m_image(width < 1 || height < 1
                  ? QImage()
                  : QImage(width, height,
                           fill.alpha() == 255 ? QImage::Format_RGB32 : QImage::Format_ARGB32_Premultiplied)) {
    if (!m_image.isNull())
        m_image.fill(fill);
}

} // namespace lumora
