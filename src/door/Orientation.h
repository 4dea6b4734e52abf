#pragma once

#include "imaging/Bitmap.h"

#include <filesystem>

namespace lumora {

// As EXIF counts it, 1 to 8; 1 where the file tells none.
int orientationOf(const std::filesystem::path& path);

// The picture as it was held, by its orientation.
Bitmap upright(Bitmap picture, int orientation);

} // namespace lumora
