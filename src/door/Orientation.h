#pragma once

#include "imaging/Bitmap.h"

namespace lumora {

// The picture as it was held, by its orientation as EXIF counts it, 1 to 8.
Bitmap upright(Bitmap picture, int orientation);

} // namespace lumora
