#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "imaging/files/PictureInput.h"
#include "imaging/scaling/Planes.h"

#include <cstdint>
#include <memory>

namespace lumora {

// Reads one JPEG file. Errors of libjpeg and a file that is cut short are failures, and so are, unless they pass, its
// warnings that data is missing or wrong.
class JpegReader {
public:
    enum class Warnings { Fail, Pass };
    // Reads the header.
    static Result<std::unique_ptr<JpegReader>> open(PictureInput input, Warnings warnings = Warnings::Fail);
    ~JpegReader();
    JpegReader(const JpegReader&) = delete;
    JpegReader& operator=(const JpegReader&) = delete;

    PictureSize size() const;

    // The whole picture in colour, shrunk by denominator (1, 2, 4 or 8), each side rounded up. One call of readBitmap
    // or readPlanes uses the reader up.
    Result<Bitmap> readBitmap(int denominator = 1);

    // Rgb is given by readBitmap. Of inks readStoredInks gives the four bytes of each pixel as the file has them: Cmyk
    // the ink, InvertedCmyk the light that it lets through.
    enum class Colours { Rgb, Cmyk, InvertedCmyk };
    Colours colours() const;
    Result<Bitmap> readStoredInks();

    // True when the file stores luma and chroma planes, or luma alone; readPlanes gives them as stored. For other
    // pictures (RGB, inks) readPlanes converts pixels, which takes longer.
    bool hasPlanes() const;

    // Bytes in which a decode keeps the whole picture, since its scans follow each other: 0 for most files.
    std::int64_t heldCoefficients() const;

    // The picture as luma and chroma planes, row by row; denominator as in readBitmap.
    Result<void> readPlanes(int denominator, PlaneTaker& taker);

private:
    struct State;
    explicit JpegReader(std::unique_ptr<State> state);

    Result<Bitmap> readRows(int denominator, bool inksAsStored);
    Result<void> readRawPlanes(PlaneTaker& taker);
    Result<void> readMadePlanes(PlaneTaker& taker);

    std::unique_ptr<State> m_state;
};

} // namespace lumora
