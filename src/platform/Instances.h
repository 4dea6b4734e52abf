#pragma once

#include "common/HostFile.h"
#include "common/Result.h"
#include "platform/files/HostPath.h"

#include <optional>

namespace lumora {

// The running instances of the program on one data folder. Each object holds a lock on a hidden file there, which the
// system releases when the process ends, so that a page can ask whether another instance would disturb it, and a start
// can be refused.
class Instances {
public:
    enum class Lock { Shared, Exclusive };
    explicit Instances(const HostPath& dataFolder, Lock lock = Lock::Shared);

    // True where the lock of another instance excludes this one. False also when the folder takes no lock.
    bool refused() const { return m_refused; }
    // Why the folder takes no lock, so that no other instance is noticed; no value where it does.
    const std::optional<Failure>& fault() const { return m_fault; }

    // True while another instance holds the lock. False also when the folder takes no lock.
    bool another() const;

private:
    Descriptor m_file;
    bool m_refused = false;
    std::optional<Failure> m_fault;
};

} // namespace lumora
