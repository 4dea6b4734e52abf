#pragma once

#include <vector>

namespace lumora {

// One plane of samples as a decoder gives it: luma first, then two chroma planes if the picture has colour.
struct PlaneLayout {
    int width = 0; // samples of the picture, without padding
    int height = 0;
    double pitchX = 1; // pixels of the whole picture between two samples
    double pitchY = 1;
    int rowsAtOnce = 1; // rows between two calls of rowsReady
    int rowBytes = 0;   // bytes that are written of a row
    // Samples a side of the blocks in which the file has the plane, and what the mean of a block, less 128, is a
    // multiple of, in eighths. 1 and 0 where the plane is made of pixels.
    int block = 1;
    int meanStep = 0;
};

// Receives the planes of a picture row by row from the top, so that no whole plane lies in memory.
class PlaneTaker {
public:
    virtual ~PlaneTaker() = default;

    virtual void begin(const std::vector<PlaneLayout>& planes) = 0;
    // Where the decoder writes row y of the plane; y may pass the plane's height by padding.
    virtual unsigned char* row(int plane, int y) = 0;
    // Tells that the next rowsAtOnce rows of every plane are written.
    virtual void rowsReady() = 0;
};

} // namespace lumora
