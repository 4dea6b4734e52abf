#pragma once

#include "common/DoorRules.h"
#include "imaging/Bitmap.h"
#include "platform/files/HostPath.h"

namespace lumora {

// What a list of files shows of a picture, in a square cell of cell pixels: upright where the lab wants that. Null for
// a file that can't be read, and for one of another format where those go through the door.
Bitmap folderPicture(const HostPath& path, int cell, DoorRules rules);

} // namespace lumora
