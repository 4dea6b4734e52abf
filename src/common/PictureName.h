#pragma once

#include <QStringView>

namespace lumora {

// By the ending alone, in any letter case: whether customers are offered the file as a picture.
bool isPictureFile(QStringView name);

} // namespace lumora
