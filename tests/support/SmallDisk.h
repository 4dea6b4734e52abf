#pragma once

#include "platform/files/HostPath.h"

#include <QTemporaryDir>

namespace lumora {

// A disk of so many kilobytes, mounted on a temporary folder while this lives, or one that can only be read. Mounting
// needs root: a test asks available() first and is skipped for an ordinary user.
class SmallDisk {
public:
    explicit SmallDisk(int kilobytes);
    ~SmallDisk();
    SmallDisk(const SmallDisk&) = delete;
    SmallDisk& operator=(const SmallDisk&) = delete;

    bool available() const { return m_mounted; }
    HostPath path() const { return toHostPath(m_folder.path()); }
    bool makeReadOnly();

private:
    QTemporaryDir m_folder;
    bool m_mounted = false;
};

} // namespace lumora
