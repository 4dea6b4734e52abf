#include "selection/door/FolderPicture.h"

#include "door/Orientation.h"
#include "imaging/files/PictureFile.h"

namespace lumora {

Bitmap folderPicture(const HostPath& path, int cell, DoorRules rules) {
    const Result<Bitmap> picture = loadSmallPictures({path}, cell).front();
    if (!picture)
        return {};
    return rules.upright ? upright(*picture, orientationOf(path)) : *picture;
}

} // namespace lumora
