#pragma once

#include "common/Result.h"
#include "door/StoredPicture.h"

#include <QByteArray>

namespace lumora {

// The JPEG file that the pages work with: upright, sRGB, without a tag but the place of its small picture.
struct UprightJpeg {
    QByteArray bytes;
    bool profileIgnored = false; // the file's colour profile is broken; its pixels were taken as sRGB
};

// Turns a JPEG file that needs no more without a loss where its sides allow that; decodes all others.
Result<UprightJpeg> makeUprightJpeg(StoredPictureReader& reader);

} // namespace lumora
