#pragma once

#include "imaging/Bitmap.h"

#include <filesystem>

namespace lumora {

// What shows for a picture until it is decoded: the small picture that its camera has put into the header, in the
// proportions of the picture (cameras add black bars), for a square cell of cell pixels. Null where there is none.
// Programs that change a picture may leave an old one there. Reads the header alone.
enum class Held { AsStored, Upright };
Bitmap pictureDraft(const std::filesystem::path& path, int cell, Held held);
// The same of a small JPEG file that stands upright; null where it is damaged or not small.
Bitmap pictureDraft(const QByteArray& small, int cell);

} // namespace lumora
