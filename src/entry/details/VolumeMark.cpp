#include "entry/details/VolumeMark.h"

#include "common/FixedText.h"
#include "platform/Machine.h"

namespace lumora {

Result<QString> ReadVolumeSerial(const Volume& volume, const DrivePath& driveRoot) {
    const Result<std::int32_t> serial = volume.serial(driveRoot);
    if (!serial)
        return serial.failure();
    return QString::number(*serial);
}

QString volumeMark(const QString& volumeSerial) {
    return RightPart(volumeSerial, 4);
}

} // namespace lumora
