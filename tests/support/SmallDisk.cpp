#include "support/SmallDisk.h"

#include <sys/mount.h>

#include <string>

namespace lumora {

SmallDisk::SmallDisk(int kilobytes) {
    const std::string options = "mode=0700,size=" + std::to_string(kilobytes) + "k";
    m_mounted = ::mount("tmpfs", path().c_str(), "tmpfs", 0, options.c_str()) == 0;
}

SmallDisk::~SmallDisk() {
    if (m_mounted)
        ::umount2(path().c_str(), MNT_DETACH);
}

bool SmallDisk::makeReadOnly() {
    return m_mounted && ::mount("tmpfs", path().c_str(), "tmpfs", MS_REMOUNT | MS_RDONLY, nullptr) == 0;
}

} // namespace lumora
