#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "imaging/files/PictureInput.h"

namespace lumora {

// BMP and PNG files, read as the format that PictureInput found in the content. Transparency is kept.
Result<PictureSize> readOtherPictureSize(PictureInput& input);
Result<Bitmap> readOtherPicture(PictureInput& input);

} // namespace lumora
