#pragma once

#include "common/Result.h"

#include <QString>

namespace lumora {

class Files;
struct SessionState;

// Packs a lab's frame so that nobody opens it by chance: the first two blocks of 23,000 bytes change places, and the
// same step undoes it. A file under 100,000 bytes is left alone. The file itself is only read; the result is
// 2000lumora\!!moozpanim\!k.bmp, there whole or as it was before. Both that folder and 2000lumora\!!benaime are made,
// and pieces of an interrupted packing in the latter are cleared away. The value is the result's drive path, empty when
// the file was left alone.
Result<QString> ScrambleFrameFile(const SessionState& state, const Files& files, const QString& path);

} // namespace lumora
