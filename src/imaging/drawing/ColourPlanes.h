#pragma once

#include <QRgb>

namespace lumora {

// One row of pixels to luma and chroma and back, by the full-range matrix of JPEG files (ITU-R BT.601).
void lumaAndChroma(const QRgb* line, int width, unsigned char* y, unsigned char* cb, unsigned char* cr);
void pixelsOf(const unsigned char* y, const unsigned char* cb, const unsigned char* cr, int width, QRgb* line);

} // namespace lumora
