#pragma once

#include "common/DoorRules.h"
#include "door/PictureHeader.h"

#include <QString>

namespace lumora {

// What a file needs to be an upright sRGB JPEG of the ending .jpg; inks without a profile may stay.
enum class DoorNeed {
    Nothing,
    Copy, // only its ending is another
    Turn,
    Decode, // another format, or other colours
    Unreadable,
};

// The colours of a picture by its header, the strongest word first: PNG's codes, profile, named colours, EXIF.
struct HeaderColours {
    enum class Source { None, Profile, Named, Hdr } source = Source::None;
    PictureColours named;
    bool profileIgnored = false;
};
HeaderColours coloursOf(const PictureHeader& header);

// Colours by the numbers of a video standard; none where they are sRGB's, or not told.
HeaderColours codedColours(PictureHeader::CodedColours coded);

// What the rules do not ask for is not done to a JPEG. What goes through for another reason comes out upright and in
// sRGB all the same.
DoorNeed doorNeedOf(const PictureHeader& header, const QString& fileName, DoorRules rules = {true, true, true});

} // namespace lumora
