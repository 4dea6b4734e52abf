#pragma once

#include "imaging/Bitmap.h"

#include <QByteArray>

namespace lumora {

// A JPEG file of a kind that our own writer never makes.
struct JpegKind {
    enum class Colours { YCbCr, Grey, Rgb, Inks, InvertedInks, InvertedYcck } colours = Colours::YCbCr;
    int across = 1; // how many luma samples share one chroma sample
    int down = 1;
    bool progressive = false;
    int restartRows = 0;
    int quality = 95;
};

QByteArray jpegOfKind(const Bitmap& picture, const JpegKind& kind);

// A picture with edges, ramps and colours, the same in every run.
Bitmap testPicture(int width, int height);

} // namespace lumora
