#pragma once

#include "platform/files/Drives.h"

#include <vector>

namespace lumora {

// What of this machine is its customers': the cards and sticks that are in. The program's own drive, the root of the
// file system and a medium that holds the data folder are not, whatever their letters.
class CustomersMedia {
public:
    explicit CustomersMedia(const Drives& drives);

    const std::vector<Drives::Drive>& all() const { return m_media; }
    // A link on a medium counts as what it leads to.
    bool hold(const HostPath& path) const;

private:
    std::vector<Drives::Drive> m_media;
};

} // namespace lumora
