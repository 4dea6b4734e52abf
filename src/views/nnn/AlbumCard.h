#pragma once

#include "views/kit/Cards.h"

namespace lumora {

// A choice of the album's making, told by a drawing of the thing itself and its name.
class AlbumCard : public CardButton {
    Q_OBJECT
public:
    enum class Drawing {
        SmallBook,
        SpiralBook,
        Book,
        LargeBook,
        PhotoBook,
        LargePhotoBook,
        Spread, // an open album in the proportions that the text tells, "30/60"
        Brown,
        Cream,
        Glossy,
        Matte,
        Silk,
        Nothing,
        Canvas,
        Plate,
        Perspex,
    };
    AlbumCard(const Theme& theme, QWidget* parent, Drawing drawing);

    // The colour of the ribbon that hangs from the card; none until it is set.
    void setRibbon(QColor colour);

protected:
    void paintInside(QPainter& painter, const QRectF& room) override;

private:
    void draw(QPainter& painter, const QRectF& place) const;
    void drawBook(QPainter& painter, const QRectF& place, double share) const;
    void drawSpread(QPainter& painter, const QRectF& place) const;
    void drawCover(QPainter& painter, const QRectF& place, QColor colour) const;
    void drawPaper(QPainter& painter, const QRectF& place) const;
    void drawExtra(QPainter& painter, const QRectF& place) const;

    Drawing m_drawing;
    QColor m_ribbon;
};

} // namespace lumora
