#include "imaging/Bitmap.h"

#include <QPainter>

namespace lumora {

Bitmap::Bitmap(int width, int height, QColor fill)
    : m_image(width < 1 || height < 1
                  ? QImage()
                  : QImage(width, height,
                           fill.alpha() == 255 ? QImage::Format_RGB32 : QImage::Format_ARGB32_Premultiplied)) {
    if (!m_image.isNull())
        m_image.fill(fill);
}

Bitmap onWhite(const Bitmap& picture) {
    if (!picture.image().hasAlphaChannel())
        return Bitmap(picture.image().convertToFormat(QImage::Format_RGB32));
    Bitmap white(picture.width(), picture.height(), Qt::white);
    if (!white.isNull())
        QPainter(&white.image()).drawImage(0, 0, picture.image());
    return white;
}

} // namespace lumora
