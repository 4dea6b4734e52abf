#pragma once

#include "common/Result.h"

namespace lumora {

// How the decoding of one file ends, as the status of its process.
enum class DoorStatus {
    Done = 0,
    ProfileIgnored = 10, // done; the colour profile is broken, and the pixels were taken as sRGB
    TooLarge = 11,
    Unsupported = 12,
    Damaged = 13,
    NotConfined = 14,
    NotRead = 15,
    Hdr = 16,
};

inline DoorStatus doorStatusOf(const Failure& failure) {
    switch (failure.kind) {
    case Failure::Kind::TooLarge:
        return DoorStatus::TooLarge;
    case Failure::Kind::Unsupported:
        return DoorStatus::Unsupported;
    case Failure::Kind::Damaged:
        return DoorStatus::Damaged;
    default:
        return DoorStatus::NotRead;
    }
}

} // namespace lumora
