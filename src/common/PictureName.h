#pragma once

#include <QString>
#include <QStringView>

// Which files customers are offered as pictures, by their endings alone and in any letter case: .jpg, or all that
// DoorRules::everyFormat lets through.
namespace lumora {

bool isPictureFile(QStringView name, bool everyFormat = false);
// The same as patterns for the names of a folder: "*.jpg;*.jpeg".
QString picturePatterns(bool everyFormat);

} // namespace lumora
