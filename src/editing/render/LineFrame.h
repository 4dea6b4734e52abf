#pragma once

#include <QChar>
#include <QColor>
#include <QString>

#include <optional>

namespace lumora {

class Bitmap;

// The colour of a letter of the palette; none for another letter.
std::optional<QColor> lineFrameColour(QChar letter);

// Draws a line frame on a box: a letter of the palette and two digits of style, 01 to 50, as "W21". Shapes grow or
// shrink by a pixel a step while their lines fade. "000", a letter that the palette lacks and a style that has no shape
// draw nothing. No page shows line frames so far: the record carries them to the lab.
void PaintLineFrame(Bitmap& box, const QString& code);

} // namespace lumora
