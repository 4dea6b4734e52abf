#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"

namespace lumora {

class Files;
struct SessionState;

// The small view that the editor stored of a changed picture, so that the page of pictures shows it changed. One file a
// picture, named by its flat name, bitmap data whatever the name's ending says.
namespace StoredSmallView {

// The path of a picture's stored view.
DrivePath path(const SessionState& state, const DrivePath& picturePath);

// Makes the folder when it is missing.
Result<void> store(const SessionState& state, const Files& files, const DrivePath& picturePath, const Bitmap& preview);

// Forgets the stored view, if there is one.
void discard(const SessionState& state, const Files& files, const DrivePath& picturePath);

} // namespace StoredSmallView
} // namespace lumora
