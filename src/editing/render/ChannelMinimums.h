#pragma once

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

    // Sets each key that the file of a drive path has, in whatever order; keys that it lacks keep their value, and a
    // key that is unknown is passed over. A file that is missing is no failure and changes nothing.
    Result<void> readFrom(const Files& files, const QString& path);
    Result<void> writeTo(const Files& files, const QString& path) const;

    bool operator==(const ChannelMinimums&) const = default;
};

} // namespace lumora
