#include "imaging/drawing/Drawing.h"

#include "imaging/scaling/Resample.h"

#include <QFont>
#include <QFontDatabase>
#include <QFontMetrics>
#include <QPainter>
#include <QTransform>

namespace lumora {

using namespace Qt::StringLiterals;

Bitmap turned(const Bitmap& picture, QuarterTurn turn) {
    if (turn == QuarterTurn::None)
        return picture;
    return Bitmap(picture.image().transformed(QTransform().rotate(static_cast<int>(turn))));
}

QString installedFamily(const QString& family) {
    const QString known = family == u"David"_s ? u"David CLM"_s : family;
    return QFontDatabase::hasFamily(known) ? known : QString();
}

void drawText(Bitmap& target, const QPoint& topLeft, const QString& text, const TextStyle& style) {
    const QString family = installedFamily(style.family);
    if (target.isNull() || family.isEmpty())
        return;
    QFont font(family);
    font.setPixelSize(style.pixelSize);
    font.setBold(style.bold);
    QPainter painter(&target.image());
    painter.setRenderHint(QPainter::TextAntialiasing);
    painter.setLayoutDirection(Qt::LeftToRight);
    painter.setFont(font);
    painter.setPen(style.colour);
    int top = topLeft.y();
    for (QString line : text.split(u'\n')) {
        line.remove(u'\r');
        painter.drawText(QPoint(topLeft.x(), top + painter.fontMetrics().ascent()), line);
        top += painter.fontMetrics().lineSpacing();
    }
}

} // namespace lumora
