#pragma once

#include "views/kit/CardButtons.h"

namespace lumora {

// The offer of a medium: a sign, what it is, and what it holds. Its place is always there, so that nothing moves when a
// medium comes; while there is nothing to open it lies in the ground.
class CardOffer : public CardButton {
    Q_OBJECT
public:
    enum class Size { Slim, Large };
    CardOffer(const Theme& theme, QWidget* parent, Size size = Size::Slim);

    void setSize(Size size);
    // Below the text, which is the head.
    void setNote(const QString& note);

protected:
    void paintInside(QPainter& painter, const QRectF& room) override;

private:
    Size m_cardSize = Size::Slim;
    QString m_note;
};

} // namespace lumora
