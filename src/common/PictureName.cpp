#include "common/PictureName.h"

namespace lumora {

bool isPictureFile(QStringView name) {
    return name.size() > 4 && name.endsWith(u".jpg", Qt::CaseInsensitive);
}

} // namespace lumora
