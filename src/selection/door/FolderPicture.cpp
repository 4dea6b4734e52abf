#include "selection/door/FolderPicture.h"

#include "door/HeaderOfFile.h"
#include "door/Orientation.h"
#include "imaging/files/PictureFile.h"

namespace lumora {

Bitmap folderPicture(const HostPath& path, int cell, DoorRules rules) {
    const Result<PictureHeader> header = rules.any() ? headerOf(path) : PictureHeader();
    if (rules.everyFormat && (!header || header->kind != PictureKind::Jpeg))
        return {};
    const Result<Bitmap> picture = loadSmallPictures({path}, cell).front();
    if (!picture)
        return {};
    return rules.upright && header ? upright(*picture, header->orientation) : *picture;
}

} // namespace lumora
