#include "editing/render/PicturePlacement.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

#include <algorithm>
#include <cmath>

namespace lumora {
namespace {

int cut(double value) {
    return static_cast<int>(std::trunc(value));
}

Placement edited(const EditFields& edit) {
    Placement placement;
    placement.zoomPercent = edit.ZoomPercent;
    placement.rotationCode = edit.RotationCode;
    placement.panX = edit.PanX;
    placement.panY = edit.PanY;
    return placement;
}

} // namespace

PaperOrientation orientationOf(PictureSize picture) {
    return picture.height < picture.width ? PaperOrientation::Landscape : PaperOrientation::Portrait;
}

QSize paperSides(PaperSize paper, PaperOrientation orientation) {
    return orientation == PaperOrientation::Landscape ? QSize(paper.longSide, paper.shortSide)
                                                      : QSize(paper.shortSide, paper.longSide);
}

PictureSize previewBox(PaperSize paper, PaperOrientation orientation) {
    if (orientation == PaperOrientation::Landscape)
        return {450, std::max(1, cut(450.0 * paper.shortSide / paper.longSide))};
    return {300, std::max(1, cut(300.0 * paper.longSide / paper.shortSide))};
}

bool isPanUnset(const EditFields& edit) {
    return edit.PanX >= unsetPan || edit.PanY >= unsetPan;
}

void placeAtCentreIfUnset(EditFields& edit, PictureSize box) {
    if (!isPanUnset(edit))
        return;
    edit.PanX = static_cast<std::int16_t>(box.width / 2);
    edit.PanY = static_cast<std::int16_t>(box.height / 2);
}

std::optional<PictureSize> workPictureSize(PictureSize picture, int zoomPercent) {
    const double aspect = double(picture.height) / std::max(1, picture.width);
    const double size = std::min(700.0, zoomPercent * 5.0);
    const double width = orientationOf(picture) == PaperOrientation::Landscape ? size : size * 0.75;
    const double height = width * aspect;
    constexpr double largest = 20000;
    if (height > largest)
        return std::nullopt;
    return PictureSize{std::max(1, cut(width)), std::max(1, cut(height))};
}

Placement previewPlacement(PictureSize workPicture, PictureSize box, const EditFields& edit) {
    Placement placement = edited(edit);
    const double ratio = double(workPicture.width) / workPicture.height;
    int width = box.width;
    int height = cut(width / ratio);
    if (height < box.height) {
        height = box.height;
        width = cut(height * ratio);
    }
    placement.drawWidth = width;
    placement.drawHeight = height;
    return placement;
}

PrintGeometry printGeometry(PaperSize paper, PaperOrientation orientation) {
    PrintGeometry print;
    const double shortSide = paper.shortSide;
    const double longSide = paper.longSide;
    if (orientation == PaperOrientation::Landscape) {
        const double ratio = shortSide / longSide;
        print.size = {paper.longSide * 100, static_cast<int>(RoundHalfEven(longSide * 100 * ratio))};
        print.scaleX = print.size.width / 450.0;
        print.scaleY = print.size.height / (450.0 * ratio);
    } else {
        const double ratio = longSide / shortSide;
        print.size = {paper.shortSide * 100, static_cast<int>(RoundHalfEven(shortSide * 100 * ratio))};
        print.scaleX = print.size.width / 300.0;
        print.scaleY = print.size.height / (300.0 * ratio);
    }
    return print;
}

Placement printPlacement(PictureSize picture, const PrintGeometry& print, const EditFields& edit) {
    Placement placement = edited(edit);
    const double aspect = double(std::max(1, picture.width)) / std::max(1, picture.height);
    placement.drawWidth = print.size.width;
    placement.drawHeight = print.size.width / aspect;
    if (print.size.height > placement.drawHeight) {
        placement.drawHeight = print.size.height;
        placement.drawWidth = print.size.height * aspect;
    }
    placement.panX *= print.scaleX;
    placement.panY *= print.scaleY;
    return placement;
}

} // namespace lumora
