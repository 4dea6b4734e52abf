#pragma once

#include "views/kit/CardButtons.h"

namespace lumora {

// What the cards of the album's making show.
enum class AlbumDrawing {
    SmallBook,
    SpiralBook,
    Book,
    LargeBook,
    PhotoBook,
    LargePhotoBook,
    Spread, // an open album in the proportions that the words tell, "30/60"
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

DrawingCard* makeAlbumCard(const Theme& theme, QWidget* parent, AlbumDrawing what, QSizeF size);

} // namespace lumora
