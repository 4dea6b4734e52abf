#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"

namespace lumora {

class Files;
struct SessionState;

// Packs a lab's frame so that nobody opens it by chance: the first two blocks of 23,000 bytes change places, and the
// same step undoes it. The file itself is only read. The result is 2000lumora\!!moozpanim\!k.bmp, written whole or not
// at all. Makes that folder and 2000lumora\!!benaime, and removes pieces that an interrupted packing left in the
// latter. Returns the path of the result; a file under 100,000 bytes is left alone and gives an empty one.
Result<DrivePath> ScrambleFrameFile(const SessionState& state, const Files& files, const DrivePath& path);

} // namespace lumora
