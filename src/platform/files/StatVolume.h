#pragma once

#include "platform/Machine.h"
#include "platform/files/Drives.h"

namespace lumora {

// The serial of the file system on which a drive's folder lies, the same at every mount: the serial of a FAT medium,
// else a checksum of the UUID. If the UUID is not visible (a container, a network share), it is the file system's id
// or, without one, the device number.
class StatVolume : public Volume {
public:
    explicit StatVolume(const Drives& drives, HostPath uuidLinks = "/dev/disk/by-uuid")
        : m_drives(drives)
        , m_uuidLinks(std::move(uuidLinks)) {}

    Result<std::int32_t> serial(const DrivePath& driveRoot) const override;

private:
    const Drives& m_drives;
    HostPath m_uuidLinks; // folder of links from UUIDs to block devices
};

// The serial of a UUID as the links name it: "ABCD-1234" of a FAT medium as a number, a checksum of any other text.
std::int32_t serialOfUuid(const QString& uuid);

} // namespace lumora
