#pragma once

#include "editing/render/PlainPrint.h"

namespace lumora {

struct EditFields;

// How finely a picture prints on its paper, in dots per inch: the pixels of the print that come from the picture,
// divided by the paper's inches, the lower of both directions. What is enlarged adds none.
class PrintResolution {
public:
    // Sharp from 200 on, fair from 120 on, coarse below.
    enum class Grade { Sharp, Fair, Coarse };

    // Scaled: the print file has the size of paperPictureSize(). Whole: deep compression sends the picture as it is.
    enum class Sent { Scaled, Whole };
    static PrintResolution ofPlain(PictureSize picture, PaperSize paper, PaperFit fit, Sent sent = Sent::Scaled);
    // At the scale of the record's zoom. A picture that was never opened covers the paper too.
    static PrintResolution ofEdited(PictureSize picture, PaperSize paper, const EditFields& edit);

    // The whole dots; a part of one does not count.
    int dotsPerInch() const { return m_dots; }
    Grade grade() const;

private:
    explicit PrintResolution(double pixelsOnCentimetre);

    int m_dots;
};

} // namespace lumora
