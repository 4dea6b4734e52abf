#pragma once

#include "common/Result.h"
#include "door/Confinement.h"
#include "door/DoorNeed.h"

#include <filesystem>
#include <stop_token>

namespace lumora {

// What is said behind the name of a file where DoorDecoder::Made tells it.
inline constexpr QStringView profileIgnoredWords = u": its colour profile is broken and was ignored";

// Makes the JPEG file that the pages work with of a picture file of any kind. What takes more than a copy is done by a
// child process without rights, since decoders of strangers' formats are where attacks come in. Calls block; several
// threads may call.
class DoorDecoder {
public:
    // program is lumora-door; where it is missing every decoding fails.
    explicit DoorDecoder(std::filesystem::path program, DoorLimits limits = {});

    // Reads the header alone.
    static Result<DoorNeed> needOf(const std::filesystem::path& source, DoorRules rules = {true, true, true});

    struct Made {
        bool profileIgnored = false; // the colour profile is broken, so that the colours were taken as sRGB
    };
    // The target holds the whole new picture, or what it held before: Damaged, TooLarge, TimedOut and Unsupported are
    // the picture's failures, NoSpace and others the disk's. A stop ends the child.
    Result<Made> make(const std::filesystem::path& source, const std::filesystem::path& target,
                      const std::stop_token& stop = {}) const;

    // The small picture that a HEIC or AVIF file carries beside its own, as an upright JPEG file in sRGB; Unsupported
    // where there is none.
    Result<QByteArray> draft(const std::filesystem::path& source, const std::stop_token& stop = {}) const;

    // The same of any picture file, for a list: where it carries none, of the whole picture, decoded for it.
    Result<QByteArray> listed(const std::filesystem::path& source, const std::stop_token& stop = {}) const;

private:
    std::filesystem::path m_program;
    DoorLimits m_limits;
};

} // namespace lumora
