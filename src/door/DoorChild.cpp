#include "door/DoorChild.h"

#include "common/HostFile.h"
#include "door/UprightJpeg.h"

#include <cerrno>
#include <cstdlib>
#include <new>
#include <string>

#include <unistd.h>

namespace lumora {

namespace {

DoorStatus statusOf(Failure::Kind kind) {
    switch (kind) {
    case Failure::Kind::TooLarge:
        return DoorStatus::TooLarge;
    case Failure::Kind::Unsupported:
        return DoorStatus::Unsupported;
    default:
        return DoorStatus::Damaged;
    }
}

bool writeAll(const QByteArray& bytes) {
    for (qsizetype done = 0; done < bytes.size();) {
        const ssize_t count =
            ::write(doorTargetNumber, bytes.constData() + done, static_cast<std::size_t>(bytes.size() - done));
        if (count < 0 && errno != EINTR)
            return false;
        done += count > 0 ? count : 0;
    }
    return true;
}

DoorStatus decode() try {
    auto reader = StoredPictureReader::open("/proc/self/fd/" + std::to_string(doorSourceNumber));
    if (!reader)
        return statusOf(reader.failure().kind);
    if (!confineMyself())
        return DoorStatus::NotConfined;
    const auto made = makeUprightJpeg(**reader);
    if (!made)
        return statusOf(made.failure().kind);
    if (!writeAll(made->bytes))
        return DoorStatus::TooLarge;
    return made->profileIgnored ? DoorStatus::ProfileIgnored : DoorStatus::Done;
} catch (const std::bad_alloc&) {
    return DoorStatus::TooLarge;
}

} // namespace

bool limitDoorChild(int argc, char** argv) {
    if (argc != 4)
        return false;
    const DoorLimits limits{std::atoi(argv[2]), std::atoll(argv[3])};
    return limits.seconds > 0 && limits.memory > 0 && limitMyself(limits);
}

// Ends without the destructors of what is left, which the confined process may not all run.
int runDoorChild(int argc, char** argv) {
    _exit(static_cast<int>(limitDoorChild(argc, argv) ? decode() : DoorStatus::NotConfined));
}

} // namespace lumora
