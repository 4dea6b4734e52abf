#include "imaging/drawing/ColourMatrix.h"

#include "imaging/scaling/PixelRows.h"

#include <algorithm>
#include <cmath>

namespace lumora {

ColourMatrix::ColourMatrix()
    : m_entries{1, 0, 0, 0, 1, 0, 0, 0, 1} {}

ColourMatrix ColourMatrix::fromGains(float red, float green, float blue, float crossGain) {
    ColourMatrix matrix;
    matrix.m_entries.fill(crossGain);
    matrix.m_entries[0] = red;
    matrix.m_entries[4] = green;
    matrix.m_entries[8] = blue;
    return matrix;
}

ColourMatrix ColourMatrix::grey(float weight) {
    ColourMatrix matrix;
    matrix.m_entries.fill(weight);
    return matrix;
}

bool ColourMatrix::changesNothing() const {
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) {
            const float value = entry(row, column);
            if (row == column ? value != 1.0F : value < 0.0F || value > 0.0015F)
                return false;
        }
    }
    return true;
}

Bitmap ColourMatrix::applied(const Bitmap& picture) const {
    Bitmap result(picture.image().convertToFormat(QImage::Format_RGB32));
    apply(result);
    return result;
}

void ColourMatrix::apply(Bitmap& picture) const {
    if (changesNothing())
        return;
    const int height = picture.height();
    const int width = picture.width();
    for (int y = 0; y < height; ++y) {
        auto* row = reinterpret_cast<std::uint32_t*>(picture.image().scanLine(y));
        applyMatrixToRow(*this, row, row, width);
    }
}

} // namespace lumora
