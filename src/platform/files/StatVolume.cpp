#include "platform/files/StatVolume.h"

#include <sys/stat.h>
#include <sys/vfs.h>

#include <cerrno>
#include <cstring>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;
namespace {

// The data folder may not exist yet; its nearest existing parent lies on the same file system.
HostPath nearestExisting(HostPath folder) {
    struct stat status {};
    while (::stat(folder.c_str(), &status) != 0 && errno == ENOENT && folder != folder.root_path())
        folder = folder.parent_path();
    return folder;
}

std::optional<QString> uuidOfDevice(const HostPath& links, dev_t device) {
    std::error_code error;
    for (fs::directory_iterator at(links, error), end; !error && at != end; at.increment(error)) {
        struct stat status {};
        if (::stat(at->path().c_str(), &status) == 0 && S_ISBLK(status.st_mode) && status.st_rdev == device)
            return toText(at->path().filename());
    }
    return std::nullopt;
}

} // namespace

std::int32_t serialOfUuid(const QString& uuid) {
    if (uuid.size() == 9 && uuid[4] == u'-') {
        bool isNumber = false;
        const auto number = QString(uuid).remove(4, 1).toUInt(&isNumber, 16);
        if (isNumber)
            return static_cast<std::int32_t>(number);
    }
    std::uint32_t checksum = 2166136261U; // FNV-1a
    for (const char c : uuid.toLower().toUtf8())
        checksum = (checksum ^ static_cast<unsigned char>(c)) * 16777619U;
    return static_cast<std::int32_t>(checksum);
}

Result<std::int32_t> StatVolume::serial(const DrivePath& driveRoot) const {
    const auto folder = m_drives.toHost(driveRoot);
    if (!folder)
        return Failure{Failure::Kind::NotFound, u"%1: no such drive"_s.arg(driveRoot.text())};
    const HostPath existing = nearestExisting(*folder);
    struct stat status {};
    struct statfs system {};
    if (::stat(existing.c_str(), &status) != 0 || ::statfs(existing.c_str(), &system) != 0)
        return Failure{Failure::Kind::Other,
                       u"%1: %2"_s.arg(driveRoot.text(), QString::fromLocal8Bit(std::strerror(errno)))};
    if (const auto uuid = uuidOfDevice(m_uuidLinks, status.st_dev))
        return serialOfUuid(*uuid);
    static_assert(sizeof(system.f_fsid) == 2 * sizeof(std::uint32_t));
    std::uint32_t id[2];
    std::memcpy(id, &system.f_fsid, sizeof(id));
    if ((id[0] ^ id[1]) != 0)
        return static_cast<std::int32_t>(id[0] ^ id[1]);
    return static_cast<std::int32_t>(status.st_dev);
}

} // namespace lumora
