#include "door/DoorChild.h"

#include "door/Confinement.h"
#include "door/UprightJpeg.h"

#include <cerrno>
#include <cstdlib>
#include <new>
#include <string>

#include <unistd.h>

namespace lumora {

namespace {

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

DoorStatus decode(std::string_view task) try {
    auto reader = StoredPictureReader::open("/proc/self/fd/" + std::to_string(doorSourceNumber));
    if (!reader)
        return doorStatusOf(reader.failure());
    if (!enterSandbox())
        return DoorStatus::NotConfined;
    QByteArray jpeg;
    const DoorStatus made = task == doorDraftOption  ? makeDraftJpeg(**reader, jpeg)
                            : task == doorListOption ? makeListJpeg(**reader, jpeg)
                                                     : makeUprightJpeg(**reader, jpeg);
    return jpeg.isEmpty() || writeAll(jpeg) ? made : DoorStatus::TooLarge;
} catch (const std::bad_alloc&) {
    return DoorStatus::TooLarge;
}

} // namespace

bool limitDoorChild(int argc, char** argv) {
    if (argc != 5)
        return false;
    const DoorLimits limits{std::atoi(argv[2]), std::atoll(argv[3])};
    return limits.seconds > 0 && limits.memory > 0 && setLimits(limits, std::atoi(argv[4]));
}

// Ends without the destructors of what is left, which the confined process may not all run.
void runDoorChild(int argc, char** argv) {
    _exit(static_cast<int>(limitDoorChild(argc, argv) ? decode(argv[1]) : DoorStatus::NotConfined));
}

} // namespace lumora
