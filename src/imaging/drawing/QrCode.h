#pragma once

#include "imaging/Bitmap.h"

#include <QString>

namespace lumora {

// The text as a QR code, black on white, with the empty edge of four modules around it that a reader needs; null where
// the text is empty or too long for one. A module is a square of so many pixels.
Bitmap qrCode(const QString& text, int modulePixels);

} // namespace lumora
