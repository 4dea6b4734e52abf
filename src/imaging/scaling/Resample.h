#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/JpegReader.h"
#include "imaging/files/PictureFile.h"
#include "imaging/scaling/ResampleKernels.h"

#include <QByteArray>
#include <QRect>

// Scaling by the antialiased bicubic of PlaneScaler. Pixel centres lie at k + 0.5, the edge of the source is repeated,
// a flat picture stays flat to the last bit.
namespace lumora {

// Null when picture is null, when a side of size is under 1, or when memory is short.
Bitmap resampled(const Bitmap& picture, PictureSize size, const ResampleKernels& kernels = bestKernels());

// Part of the scaled picture. part may reach beyond the picture, where the edge is repeated.
Bitmap resampledPart(const Bitmap& picture, PictureSize size, const QRect& part,
                     const ResampleKernels& kernels = bestKernels());

// Draws part of the paper: the picture stretched over the whole paper. Neither has alpha; both hold 32 bits a pixel.
void drawStretched(Bitmap& paper, const Bitmap& picture, const QRect& part);

// The largest denominator of a scaled decode (1, 2, 4 or 8) that leaves at least twice the wanted size a side; with
// fewer pixels quality suffers.
int decodeDenominator(PictureSize source, PictureSize wanted);

// The reader's picture scaled to size, plane by plane where the file allows it. One call uses the reader up.
Result<Bitmap> readResampled(JpegReader& reader, PictureSize size, const ResampleKernels& kernels = bestKernels());
Result<Bitmap> readResampledPart(JpegReader& reader, PictureSize size, const QRect& part,
                                 const ResampleKernels& kernels = bestKernels());
Result<QByteArray> readResampledToJpeg(JpegReader& reader, PictureSize size, int quality,
                                       const ResampleKernels& kernels = bestKernels(), PictureTimes* times = nullptr,
                                       SmallCopy* small = nullptr);

} // namespace lumora
