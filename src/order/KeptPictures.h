#pragma once

#include "common/DrivePath.h"
#include "platform/files/Files.h"

#include <cstdint>

namespace lumora {

// What tells a picture from another one that lies at its path later: another card may have been put in.
struct PictureStamp {
    std::uintmax_t length = 0;
    std::filesystem::file_time_type time;
    bool isThere = false;
    bool operator==(const PictureStamp&) const = default;
};
PictureStamp stampOf(const HostPath& path);

// A customer's file, and what it was when it was seen.
struct PictureSource {
    HostPath file;
    PictureStamp stamp;
};

// The copies of what an order has chosen from cards, in its folder of zmany\door, so that a card may go. Basket, log
// and names have the path on the card; which file is opened for that path is asked here alone.
class KeptPictures {
public:
    // orderFolder: as order/DoorFolders.h has it. Without one each path stands for itself.
    KeptPictures(const Files& files, DrivePath orderFolder)
        : m_files(files)
        , m_orderFolder(std::move(orderFolder)) {}

    void setOrderFolder(const DrivePath& folder) { m_orderFolder = folder; }

    // The copy, where there is one; a copy is always whole. Else the path itself.
    DrivePath fileOf(const DrivePath& picture) const;
    // No value for a path that leads nowhere on this machine.
    std::optional<HostPath> hostOf(const DrivePath& picture) const;

    bool has(const DrivePath& picture) const;
    // Where the copy lies, once it is there. It has the length and the time of the picture on the card.
    DrivePath copyOf(const DrivePath& picture) const;
    PictureStamp copiedStamp(const DrivePath& picture) const;
    // The same for writing it: the folder is made.
    Result<HostPath> targetOf(const DrivePath& picture) const;

private:
    const Files& m_files;
    DrivePath m_orderFolder;
};

} // namespace lumora
