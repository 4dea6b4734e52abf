#pragma once

#include "imaging/Bitmap.h"

#include <QColor>
#include <QPoint>
#include <QRect>
#include <QString>

namespace lumora {

// Degrees clockwise.
enum class QuarterTurn { None = 0, Right = 90, Half = 180, Left = 270 };

Bitmap turned(const Bitmap& picture, QuarterTurn turn);

// The installed family to draw with: "David" stands for "David CLM". Empty when this machine lacks it.
QString installedFamily(const QString& family);

struct TextStyle {
    QString family; // nothing is drawn with a family that this machine lacks
    int pixelSize = 16;
    QColor colour = Qt::black;
    bool bold = false;
};

// Draws text in lines, separated by CR LF or LF, at the font's line spacing; topLeft is the corner of the first line's
// box. The base direction is left to right; the words of a Hebrew phrase run right to left within the line. Needs a
// QGuiApplication.
void drawText(Bitmap& target, const QPoint& topLeft, const QString& text, const TextStyle& style);

} // namespace lumora
