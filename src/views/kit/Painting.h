#pragma once

#include "views/kit/Theme.h"

#include <QPainter>

namespace lumora {

// The largest box of that shape in the middle of the place, or a share of it.
QRectF fitted(const QRectF& place, QSizeF shape, double share = 1);
void drawImage(QPainter& painter, const QRectF& place, const QImage& image);
void drawIcon(QPainter& painter, QPointF centre, const QPixmap& icon);

// Draws a box with rounded corners inside the rectangle; returns the rectangle along the middle of its outline.
QRectF drawCard(QPainter& painter, const QRect& place, QColor edge, QColor fill, double thick, double corner,
                Qt::PenStyle style = Qt::SolidLine);

// The round sign in the upper corner of a card where the reading direction ends.
struct Mark {
    QString icon;
    QColor disc;
    QColor ink = Qt::white;
    double radius; // of a 1024 by 768 window, as are the other two
    double inset;
    double rim = 0; // white, around the disc
};
void drawMark(QPainter& painter, const Theme& theme, const QRectF& card, const Mark& mark);

// A landscape with a sun: the picture in all drawings of the program.
void drawSamplePicture(QPainter& painter, const QRectF& box);
// The same as a print on paper of this finish.
enum class PaperFinish { Glossy, Matte, Silk };
void drawSamplePrint(QPainter& painter, const QRectF& paper, PaperFinish finish);
// The same with the border of this code around it.
void drawBorderSample(QPainter& painter, const QRectF& room, const QString& code);
void drawThinLine(QPainter& painter, const QRectF& box);

// A text that was set apart for a line of the other direction, without the signs that do it.
QString withoutIsolation(QString text);

} // namespace lumora
