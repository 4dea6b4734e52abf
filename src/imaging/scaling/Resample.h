#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/JpegReader.h"
#include "imaging/files/PictureFile.h"
#include "imaging/scaling/ResampleKernels.h"

#include <QByteArray>
#include <QRect>

// Scaling by the antialiased bicubic of PlaneScaler. Pixel centres lie at k + 0.5, the source repeats its edge, a flat
// picture stays flat to the last bit.
namespace lumora {

// Null when the picture is, when a side of size is under 1, or when memory is short.
Bitmap resampled(const Bitmap& picture, PictureSize size, const ResampleKernels& kernels = bestKernels());

// A part of the picture so scaled. It may reach beyond the picture, whose edge is repeated there.
Bitmap resampledPart(const Bitmap& picture, PictureSize size, const QRect& part,
                     const ResampleKernels& kernels = bestKernels());

// A part of the paper, which is 32 bits without alpha, under the picture stretched over the whole of it. The picture
// has no alpha either.
void drawStretched(Bitmap& paper, const Bitmap& picture, const QRect& part);

// The strongest scaled decode (1, 2, 4 or 8) that still leaves at least twice the pixels wanted: nearer than that,
// quality suffers.
int decodeDenominator(PictureSize source, PictureSize wanted);

// The reader's picture in size; from plane to plane, without whole pixels, where the file allows it. The reader is used
// up.
Result<Bitmap> readResampled(JpegReader& reader, PictureSize size, const ResampleKernels& kernels = bestKernels());
Result<Bitmap> readResampledPart(JpegReader& reader, PictureSize size, const QRect& part,
                                 const ResampleKernels& kernels = bestKernels());
Result<QByteArray> readResampledToJpeg(JpegReader& reader, PictureSize size, int quality,
                                       const ResampleKernels& kernels = bestKernels(), PictureTimes* times = nullptr);

} // namespace lumora
