// What the page must have and nothing calls: the grey step of the second work surface.
#include "editing/editor/BigPics.h"

#include "imaging/drawing/ColourMatrix.h"

namespace lumora {

void BigPics::openSecond(Bitmap picture) {
    Picture1 = std::move(picture);
}

void BigPics::Picture1Grey_Click() {
    if (Picture1.isNull())
        return;
    Picture1 = ColourMatrix::grey(greyWeight).applied(Picture1);
    Q_EMIT changed();
}

} // namespace lumora
