#pragma once

#include <QImage>

#include <vector>

class QPainter;

// The frames of the demo lab. Each is drawn on a sheet that is a little wider than high, so that it stretches to lying
// and to upright paper alike; what stays transparent shows the picture.
namespace lumora::demo {

inline constexpr int sheetWidth = 1200;
inline constexpr int sheetHeight = 1000;

struct FrameArt {
    const char* name; // at most three characters
    void (*draw)(QPainter&);
    bool shadow; // throws one on the picture
};

struct FrameCategory {
    const char16_t* folder; // at most ten characters
    std::vector<FrameArt> frames;
};

std::vector<FrameCategory> frameCategories();

// The art as a frame file holds it, where black is transparent: what is drawn is solid, near black at least, and a
// shadow is made of the few values between black and that.
QImage asFrameFile(const FrameArt& art);

} // namespace lumora::demo
