#pragma once

#include "common/PaperSize.h"
#include "imaging/drawing/PlacedDraw.h"
#include "imaging/files/PictureFile.h"

#include <QSize>

#include <optional>

namespace lumora {

struct EditFields;

// How the numbers of an edit record become places on paper: the preview's box, the reduced work picture, the print, and
// where the picture lands on each. The preview is the reference; the print repeats it with every pixel number
// multiplied by the scale.

enum class PaperOrientation { Landscape, Portrait };

// A square picture counts as portrait.
PaperOrientation orientationOf(PictureSize picture);

// Width and height of the paper in centimetres, lying or upright.
QSize paperSides(PaperSize paper, PaperOrientation orientation);

// The box that stands for the paper: 450 wide in landscape, 300 wide in portrait. The two differ in size on purpose,
// since positions in the record are in these pixels.
PictureSize previewBox(PaperSize paper, PaperOrientation orientation);

// The pan of 781 and more of a record is not set; where one of the two is not, both become the centre of the box.
inline constexpr int unsetPan = 781;
bool isPanUnset(const EditFields& edit);
void placeAtCentreIfUnset(EditFields& edit, PictureSize box);

// The work picture that all previews are drawn from: five times the zoom at which it was opened, at most 700, portrait
// pictures three quarters of that. At least 1 pixel a side; no value for a picture so slim that a side would pass
// 20,000.
std::optional<PictureSize> workPictureSize(PictureSize picture, int zoomPercent);

// Where the work picture lands in the preview's box. Sizes are cut to whole pixels at each step.
Placement previewPlacement(PictureSize workPicture, PictureSize box, const EditFields& edit);

// 100 pixels a centimetre.
struct PrintGeometry {
    PictureSize size;
    double scaleX = 1;
    double scaleY = 1;
};
PrintGeometry printGeometry(PaperSize paper, PaperOrientation orientation);

Placement printPlacement(PictureSize picture, const PrintGeometry& print, const EditFields& edit);

} // namespace lumora
