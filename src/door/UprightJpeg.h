#pragma once

#include "door/StoredPicture.h"

#include <QByteArray>

namespace lumora {

// Makes the JPEG file that the pages work with, upright and in sRGB. A JPEG file that needs no more is turned without a
// loss where its sides allow that, in its own pixels, also of inks, and has no tag; all others are decoded, and the
// only tag is the place of the small picture. Done or ProfileIgnored, or why there is none.
DoorStatus makeUprightJpeg(StoredPictureReader& reader, QByteArray& jpeg);

// The same of the small picture that a HEIC or AVIF file carries beside its own; Unsupported where there is none.
DoorStatus makeDraftJpeg(StoredPictureReader& reader, QByteArray& jpeg);

// The same of any file, for a list: where there is no small picture, of the whole one, which is decoded for it.
DoorStatus makeListJpeg(StoredPictureReader& reader, QByteArray& jpeg);

} // namespace lumora
