#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"

#include <QString>

#include <array>

namespace lumora {

class Files;

// The least values of a picture's channels, three of each. The file that keeps them is the lab's; no page of this
// program reads or writes it.
struct ChannelMinimums {
    std::array<float, 3> A_R_MIN{};
    std::array<float, 3> A_G_MIN{};
    std::array<float, 3> A_B_MIN{};

    // Sets the values of the keys in the file of a drive path, in any order. A value whose key the file lacks stays,
    // an unknown key is passed over, and a missing file is no failure.
    Result<void> readFrom(const Files& files, const DrivePath& path);
    Result<void> writeTo(const Files& files, const DrivePath& path) const;

    bool operator==(const ChannelMinimums&) const = default;
};

} // namespace lumora
