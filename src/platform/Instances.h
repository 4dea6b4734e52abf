#pragma once

#include "common/HostFile.h"
#include "platform/files/HostPath.h"

namespace lumora {

// The running instances of the program on one data folder. Each object holds a shared lock on a hidden file there,
// which the system releases when the process ends, so that a page can ask whether another instance would disturb it.
class Instances {
public:
    explicit Instances(const HostPath& dataFolder);

    // True while another instance holds the lock. False also when the folder takes no lock.
    bool another() const;

private:
    Descriptor m_file;
};

} // namespace lumora
