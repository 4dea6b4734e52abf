#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "imaging/files/PictureInput.h"
#include "imaging/scaling/Planes.h"

#include <memory>

namespace lumora {

// One JPEG file on its way in. libjpeg's own way with an error is to end the process; here it is a failure, and so is a
// warning that data is missing or can't be true.
class JpegReader {
public:
    // Reads the header.
    static Result<std::unique_ptr<JpegReader>> open(PictureInput input);
    ~JpegReader();
    JpegReader(const JpegReader&) = delete;
    JpegReader& operator=(const JpegReader&) = delete;

    PictureSize size() const;

    // The whole picture in colour; the reader is used up. denominator 1, 2, 4 or 8 asks for the picture shrunk by it,
    // each side rounded up.
    Result<Bitmap> readBitmap(int denominator = 1);

    // True when the file holds luma and chroma planes, or luma alone: then readPlanes gives them as they lie there. The
    // planes of other pictures (RGB, inks) are made of whole pixels, which takes longer.
    bool hasPlanes() const;

    // The picture as luma and chroma, row by row; the reader is used up. denominator as above.
    Result<void> readPlanes(int denominator, PlaneTaker& taker);

private:
    struct State;
    explicit JpegReader(std::unique_ptr<State> state);

    Result<void> readRawPlanes(PlaneTaker& taker);
    Result<void> readMadePlanes(PlaneTaker& taker);

    std::unique_ptr<State> m_state;
};

} // namespace lumora
