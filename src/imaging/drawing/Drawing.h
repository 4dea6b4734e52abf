#pragma once

#include "imaging/Bitmap.h"

#include <QColor>
#include <QPoint>
#include <QRect>
#include <QString>

namespace lumora {

// Clockwise, never mirrored.
enum class QuarterTurn { None = 0, Right = 90, Half = 180, Left = 270 };

Bitmap turned(const Bitmap& picture, QuarterTurn turn);

// The family to draw with: "David" stands for "David CLM". Empty when this machine lacks it.
QString installedFamily(const QString& family);

struct TextStyle {
    QString family; // a family that this machine lacks draws nothing
    int pixelSize = 16;
    QColor colour = Qt::black;
    bool bold = false;
};

// Lines below each other at the font's line spacing, CR LF or LF between them; the first line's box has its top left
// corner at the given point. Base direction left to right: the words of a Hebrew phrase run right to left within the
// line. Needs a QGuiApplication.
void drawText(Bitmap& target, const QPoint& topLeft, const QString& text, const TextStyle& style);

} // namespace lumora
