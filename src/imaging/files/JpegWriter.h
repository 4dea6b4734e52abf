#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"

#include <QByteArray>

#include <array>
#include <memory>

namespace lumora {

// Writes one JPEG file: chroma 4:2:0, the slow integer transform, the standard tables. Quality is held within 0 to 100.
// finish() tells the first error of the encoder.
class JpegWriter {
public:
    enum class Input { Pixels, Planes };

    // The rows of one call of planeRows: a luma plane of the picture's size, two chroma planes of half of it, rounded
    // up.
    static constexpr int lumaRows = 16;
    static constexpr int chromaRows = 8;
    struct PlaneRows {
        std::array<unsigned char*, lumaRows> luma;
        std::array<unsigned char*, chromaRows> cb;
        std::array<unsigned char*, chromaRows> cr;
    };

    JpegWriter(PictureSize size, int quality, Input input);
    ~JpegWriter();
    JpegWriter(const JpegWriter&) = delete;
    JpegWriter& operator=(const JpegWriter&) = delete;

    // The next row of 32-bit pixels; alpha is ignored.
    void line(const unsigned char* pixels);
    // The next 16 rows as planes, each row padded with its last sample to a multiple of 8.
    void planeRows(PlaneRows& rows);

    Result<QByteArray> finish();

private:
    struct State;
    std::unique_ptr<State> m_state;
};

// Transparent pixels become white.
Result<QByteArray> writeJpeg(const Bitmap& picture, int quality);

} // namespace lumora
