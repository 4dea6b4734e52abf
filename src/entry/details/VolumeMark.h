#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"

#include <QString>

namespace lumora {

class Volume;

// The serial of the program's volume as signed 32-bit decimal text.
Result<QString> ReadVolumeSerial(const Volume& volume, const DrivePath& driveRoot);

// Its last four characters, or all of a shorter one: how an order names the machine it comes from.
QString volumeMark(const QString& volumeSerial);

} // namespace lumora
