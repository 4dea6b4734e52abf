#pragma once

#include <QPainter>

namespace lumora {

// The sample picture on paper of that size in centimetres, beside a grown person's hand, at the scale at which the
// largest paper of a choice fits the room. Sizes are those of paper that lies on its long side.
void drawPaperBesideHand(QPainter& painter, const QRectF& room, QSizeF paper, QSizeF largest);

} // namespace lumora
