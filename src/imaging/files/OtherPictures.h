#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "imaging/files/PictureInput.h"

namespace lumora {

// BMP and PNG files, read by the kind that was found in them. Transparent places stay transparent.
Result<PictureSize> readOtherPictureSize(const PictureInput& input);
Result<Bitmap> readOtherPicture(const PictureInput& input);

} // namespace lumora
