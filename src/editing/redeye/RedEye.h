#pragma once

#include "imaging/Bitmap.h"

#include <QColor>
#include <QPoint>
#include <QRect>
#include <QStringList>

// Red-eye: the rules that work on pixels. Positions are those of the picture, or of the patch where a rule takes a
// patch.
namespace lumora::RedEye {

// 2R - G - B: how red a pixel is.
int redness(QRgb pixel);

// (222 R + 707 G + 71 B) / 1000 as a whole number: the weights of the luma of ITU-R BT.709, in thousandths.
int brightness(QRgb pixel);

struct Peak {
    int redness = 0;
    int x = 0;
    int y = 0;
    int brightness = 1;

    // Peak divided by brightness: an input of the correction.
    double ratio() const { return double(redness) / brightness; }
};

// The reddest pixel of the square of 60 pixels each way round centre, row by row, the first one of equals; then the
// same round the pixel found, where only a stronger one replaces it. Points outside the picture are skipped. No red at
// all gives the centre and a ratio of 0.
Peak findPeak(const Bitmap& picture, QPoint centre);

// Greys each pixel under the circle's square whose redness stands above its brightness by more than ratio times 7 less
// level, to its own brightness. Returns the pixels changed, "x^y" within the square, column by column.
QStringList correct(Bitmap& picture, QRect square, double ratio, int level);

// Takes 5 from each channel above 5 of the listed pixels of the square.
void darken(Bitmap& picture, QRect square, const QStringList& pixels);

// Each item once, in the order of its first place.
QStringList withoutRepeats(const QStringList& pixels);

// The hand-placed variant, on a patch of its own.
struct PatchStats {
    Peak peak;
    double averageRedness = 0;
    double averageBrightness = 0;
};

// Looks from (1, 1) on: the strongest pixel, and the averages over those with a redness over 20.
PatchStats patchStats(const Bitmap& patch);

// Walks circles round centre; where a pixel has more than three quarters of the peak's redness, the pixel at the same
// place round the peak becomes grey of its own brightness.
void fixAround(Bitmap& patch, QPoint centre, const Peak& peak);

} // namespace lumora::RedEye
