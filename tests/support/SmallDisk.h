#pragma once

#include "platform/files/HostPath.h"

#include <QTemporaryDir>

#include <string>

#include <sys/mount.h>

namespace lumora {

// A disk of so many kilobytes, mounted on a temporary folder while this lives. Mounting needs root: a test asks
// available() first and is skipped for an ordinary user.
class SmallDisk {
public:
    explicit SmallDisk(int kilobytes) {
        const std::string options = "mode=0700,size=" + std::to_string(kilobytes) + "k";
        m_mounted = ::mount("tmpfs", path().c_str(), "tmpfs", 0, options.c_str()) == 0;
    }
    ~SmallDisk() {
        if (m_mounted)
            ::umount2(path().c_str(), MNT_DETACH);
    }
    SmallDisk(const SmallDisk&) = delete;
    SmallDisk& operator=(const SmallDisk&) = delete;

    bool available() const { return m_mounted; }
    HostPath path() const { return toHostPath(m_folder.path()); }

private:
    QTemporaryDir m_folder;
    bool m_mounted = false;
};

} // namespace lumora
