#pragma once

#include <vector>

namespace lumora {

// One plane of samples as a decoder gives it: luma first, then the two chroma planes where the picture has colour.
struct PlaneLayout {
    int width = 0; // samples that carry the picture, without padding
    int height = 0;
    double pitchX = 1; // distance of two samples in pixels of the whole picture
    double pitchY = 1;
    int rowsAtOnce = 1; // rows that are written at a time
    int rowBytes = 0;   // how far a row is written
};

// Who takes the rows of planes, from the top down, without ever holding a whole plane.
class PlaneTaker {
public:
    virtual ~PlaneTaker() = default;

    virtual void begin(const std::vector<PlaneLayout>& planes) = 0;
    // Where row y of the plane is to be written. y may pass the plane's height by padding.
    virtual unsigned char* row(int plane, int y) = 0;
    // The next rowsAtOnce rows of every plane are written.
    virtual void rowsReady() = 0;
};

} // namespace lumora
