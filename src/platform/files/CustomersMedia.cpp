#include "platform/files/CustomersMedia.h"

#include <algorithm>

namespace lumora {

namespace {

HostPath whole(const HostPath& path) {
    std::error_code error;
    const HostPath real = std::filesystem::canonical(path, error);
    return error ? HostPath() : real;
}

bool isWithin(const HostPath& path, const HostPath& folder) {
    return !path.empty() && !folder.empty() &&
           std::mismatch(folder.begin(), folder.end(), path.begin(), path.end()).first == folder.end();
}

} // namespace

CustomersMedia::CustomersMedia(const Drives& drives) {
    const HostPath own = whole(drives.dataFolder());
    for (Drives::Drive& drive : drives.drives()) {
        if (drive.removable && !isWithin(own, whole(drive.folder)))
            m_media.push_back(std::move(drive));
    }
}

bool CustomersMedia::hold(const HostPath& path) const {
    const HostPath real = whole(path);
    return std::any_of(m_media.begin(), m_media.end(),
                       [&](const Drives::Drive& medium) { return isWithin(real, whole(medium.folder)); });
}

} // namespace lumora
