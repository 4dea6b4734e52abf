#pragma once

#include "common/Result.h"
#include "imaging/files/PictureFile.h"

#include <QByteArray>

#include <filesystem>
#include <vector>

// Generated pictures that cost a decoder, a scaler and an encoder as much as photographs do: a scene with soft and hard
// edges, texture of all sizes in some places and calm in others, and the noise of a camera (about 1.9 bits a pixel at
// quality 92). The same seed gives the same bytes.
namespace lumora {

Bitmap samplePhotograph(PictureSize size, unsigned seed);

// As a camera would store it: JPEG, quality 92, 4:2:0.
QByteArray samplePhotographFile(PictureSize size, unsigned seed);

// count files of 12 megapixels (or of about the megapixels given) into an existing folder, "IMG_0001.jpg" and so on, in
// turn mostly landscape, some portrait, some square. The paths, or the first failure.
Result<std::vector<std::filesystem::path>> writeSamplePhotographs(const std::filesystem::path& folder, int count,
                                                                  double megapixels = 12);

} // namespace lumora
