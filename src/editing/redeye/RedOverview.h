#pragma once

#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"

#include <QRect>

// The small picture of the red-eye page, on which the customer finds the eye. Each of its pixels is the mean of the
// pixels that it stands for, so that after a small change only that part is drawn again.
namespace lumora::RedOverview {

// 250 wide, the height by the proportion; where that is over 270, 300 high. At least 1 pixel a side.
PictureSize size(PictureSize picture);
// The pixels to draw it with: the page may be shown larger.
PictureSize pixels(PictureSize size);

Bitmap draw(const Bitmap& picture, PictureSize size);

// Draws the part again that the picture changed in.
void refresh(Bitmap& overview, const Bitmap& picture, const QRect& part);

} // namespace lumora::RedOverview
