#pragma once

#include "platform/Machine.h"
#include "platform/files/Drives.h"

namespace lumora {

// The serial of the file system that a drive's folder lies on. A FAT medium gives the serial that it was formatted
// with, another file system a checksum of its UUID, both the same at every mount. Where the UUID can't be seen (a
// container, a network share), the file system's own id serves, or else the number of its device.
class StatVolume : public Volume {
public:
    explicit StatVolume(const Drives& drives, HostPath uuidLinks = "/dev/disk/by-uuid")
        : m_drives(drives)
        , m_uuidLinks(std::move(uuidLinks)) {}

    Result<std::int32_t> serial(const QString& driveRoot) const override;

private:
    const Drives& m_drives;
    HostPath m_uuidLinks; // links named by UUID to block devices
};

// The serial for a UUID as the links have it: "ABCD-1234" of a FAT medium is the number itself, any other text gives
// its checksum.
std::int32_t serialOfUuid(const QString& uuid);

} // namespace lumora
