#pragma once

#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"

#include <QRect>

// The small picture of the red-eye page, on which the customer finds the eye. Each of its pixels is the mean of the
// pixels that it stands for, so that a change of a small part is shown by working out that part alone.
namespace lumora::RedOverview {

// 250 wide, the height by the proportion; where that is over 270, 300 high. At least 1 pixel a side.
PictureSize size(PictureSize picture);

Bitmap draw(const Bitmap& picture, PictureSize size);

// After a change of part of the picture.
void refresh(Bitmap& overview, const Bitmap& picture, const QRect& part);

} // namespace lumora::RedOverview
