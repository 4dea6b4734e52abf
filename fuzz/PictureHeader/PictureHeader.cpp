#include "door/PictureHeader.h"

#include "door/DoorNeed.h"
#include "door/ProfileJudge.h"

#include <cstdint>
#include <cstdlib>

// Headers are read in the program itself, before the child process that decodes. Whatever the bytes: no part is asked
// for outside of a bounded number of steps, and what is told lies within the file.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    int reads = 0;
    const lumora::PictureHeader header = lumora::readPictureHeader(lumora::PictureBytes([&](qint64 at, qint64 count) {
        if (at < 0 || count < 0 || ++reads > 110'000)
            std::abort();
        return at < bytes.size() ? bytes.mid(at, count) : QByteArray();
    }));
    const auto& small = header.thumbnail;
    if (small.at < 0 || small.length < 0 || small.at + small.length > bytes.size())
        std::abort();
    if (header.orientation < 1 || header.orientation > 8 || (header.profileBroken && !header.profile.isEmpty()))
        std::abort();
    (void)lumora::doorNeedOf(header, QStringLiteral("picture.jpg"));
    (void)lumora::judgeProfile(bytes);
    return 0;
}
