#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"

#include <QByteArray>

namespace lumora {

// 4:2:0, the slow integer transform and the standard tables. Quality is held within 0 to 100. What is transparent lies
// on white.
Result<QByteArray> writeJpeg(const Bitmap& picture, int quality);

} // namespace lumora
