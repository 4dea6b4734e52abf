#pragma once

#include "editing/render/PicturePlacement.h"

#include <QRectF>
#include <QString>

namespace lumora {

// A picture that prints as it is: the pixels of its print file, and where the lab's printer puts them on the paper. The
// file keeps the proportions of the picture; the printer cuts what the paper has no room for, or leaves it white.

inline constexpr int pixelsPerCentimetre = 120; // of the paper; about 300 dots an inch

// The size of the print file. A portrait or square picture takes the paper's short side as its width, a landscape
// picture the long side; the height follows the picture, in double precision, ties to even. What would be enlarged
// keeps its own size. The height is 0 for a picture so flat that nothing of it is left.
PictureSize paperPictureSize(PictureSize source, PaperSize paper);

// Fill: the picture covers the paper and loses what reaches beyond. Fit: the whole picture prints, and the rest of the
// paper stays white.
enum class PaperFit { Fill, Fit };
// Of the order's FillFit: any other text than "FIT" fills.
PaperFit paperFitOf(const QString& fillFit);

// Pixels of the picture on a centimetre of its paper.
double pixelsPerCentimetreOf(PictureSize pixels, PaperSize paper, PaperFit fit);

// The paper in the middle of the picture, in shares of the picture's width and height: within 0 to 1 where it cuts,
// beyond where it stays white.
QRectF paperOnPicture(PictureSize picture, PaperSize paper, PaperFit fit);

} // namespace lumora
