#pragma once

#include "door/PictureColours.h"
#include "imaging/files/JpegReader.h"

#include <QByteArray>
#include <QImage>

#include <memory>
#include <optional>

namespace lumora {

// Pixels of given colours as sRGB: perceptual, with black point compensation. Alpha is kept.
class SrgbConversion {
public:
    // What the pixels of a picture are; of inks each pixel is four bytes in the place of an RGB32 one.
    using Pixels = JpegReader::Colours;

    // None where the profile can't be read or is not one of such pixels.
    static std::optional<SrgbConversion> ofProfile(const QByteArray& profile, Pixels pixels);
    static std::optional<SrgbConversion> ofColours(const PictureColours& colours);

    // A profile of greys needs a picture of greys.
    bool fits(const QImage& picture) const { return !m_grey || picture.allGray(); }

    // Gives RGB32 or ARGB32; null when memory is short. Takes 8 or 16 bits a channel.
    QImage converted(QImage picture) const;

private:
    struct Transforms;
    std::shared_ptr<const Transforms> m_transforms;
    bool m_grey = false;
    Pixels m_pixels = Pixels::Rgb;
};

} // namespace lumora
