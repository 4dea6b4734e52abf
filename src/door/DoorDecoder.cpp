#include "door/DoorDecoder.h"

#include "common/HostFile.h"
#include "door/DoorChild.h"

#include <array>
#include <cerrno>
#include <string>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/mman.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QString nameOf(const std::filesystem::path& path) {
    return QString::fromLocal8Bit(path.c_str());
}

Failure failureOf(const std::filesystem::path& source, Failure::Kind kind, const QString& reason) {
    return {kind, u"%1: %2"_s.arg(nameOf(source), reason)};
}

PictureHeader headerOf(const Descriptor& file) {
    return readPictureHeader(PictureBytes([&file](qint64 at, qint64 count) {
        QByteArray bytes(count, Qt::Uninitialized);
        qint64 filled = 0;
        while (filled < count) {
            const ssize_t got =
                ::pread(file.number(), bytes.data() + filled, static_cast<std::size_t>(count - filled), at + filled);
            if (got < 0 && errno == EINTR)
                continue;
            if (got <= 0)
                break;
            filled += got;
        }
        bytes.truncate(filled);
        return bytes;
    }));
}

Result<DoorNeed> needOf(const PictureHeader& header, const Descriptor& file, const std::filesystem::path& source,
                        DoorRules rules = {true, true, true}) {
    const DoorNeed need = doorNeedOf(header, nameOf(source), rules);
    if (need != DoorNeed::Unreadable)
        return need;
    if (header.kind != PictureKind::None)
        return failureOf(source, Failure::Kind::Damaged, u"this file is damaged"_s);
    if (::lseek(file.number(), 0, SEEK_END) == 0)
        return failureOf(source, Failure::Kind::Damaged, u"the file is empty"_s);
    return failureOf(source, Failure::Kind::Unsupported, u"is no picture of a known kind"_s);
}

class FileActions {
public:
    FileActions() { posix_spawn_file_actions_init(&m_actions); }
    FileActions(const FileActions&) = delete;
    FileActions& operator=(const FileActions&) = delete;
    ~FileActions() { posix_spawn_file_actions_destroy(&m_actions); }

    const posix_spawn_file_actions_t* get() const { return &m_actions; }
    void give(int from, int to) { posix_spawn_file_actions_adddup2(&m_actions, from, to); }
    void closeFrom(int number) { posix_spawn_file_actions_addclosefrom_np(&m_actions, number); }

private:
    posix_spawn_file_actions_t m_actions;
};

// A copy of the descriptor above the numbers that the child's files get.
Descriptor above(int number) {
    return Descriptor(::fcntl(number, F_DUPFD_CLOEXEC, doorTargetNumber + 1));
}

// A child, killed at the latest when this goes.
class Child {
public:
    Child() = default;
    Child(const Child&) = delete;
    Child& operator=(const Child&) = delete;
    ~Child() {
        if (m_id > 0) {
            ::kill(m_id, SIGKILL);
            (void)reap();
        }
    }

    // Gives an errno, or 0.
    int start(const std::filesystem::path& program, const DoorLimits& limits, int source, int target) {
        std::string path = program.string();
        std::string option(doorChildOption);
        std::string seconds = std::to_string(limits.seconds);
        std::string memory = std::to_string(limits.memory);
        const std::array<char*, 5> arguments{path.data(), option.data(), seconds.data(), memory.data(), nullptr};
        const Descriptor nothing(::open("/dev/null", O_RDWR | O_CLOEXEC));
        const Descriptor quiet = above(nothing.number());
        const Descriptor from = above(source);
        const Descriptor to = above(target);
        if (!quiet.valid() || !from.valid() || !to.valid())
            return errno;
        FileActions actions;
        for (const int number : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO})
            actions.give(quiet.number(), number);
        actions.give(from.number(), doorSourceNumber);
        actions.give(to.number(), doorTargetNumber);
        actions.closeFrom(doorTargetNumber + 1);
        pid_t id = -1;
        const int error = posix_spawn(&id, path.c_str(), actions.get(), nullptr, arguments.data(), environ);
        if (error == 0)
            m_id = id;
        return error;
    }

    // The status that waitpid tells, or none when the time is over.
    std::optional<int> ended(int seconds) {
        const Descriptor process(static_cast<int>(::syscall(SYS_pidfd_open, m_id, 0)));
        pollfd waited{process.number(), POLLIN, 0};
        int ready = 0;
        do {
            ready = ::poll(&waited, 1, seconds * 1000);
        } while (ready < 0 && errno == EINTR);
        if (!process.valid() || ready <= 0)
            return {};
        return reap();
    }

private:
    int reap() {
        int status = 0;
        while (::waitpid(m_id, &status, 0) < 0 && errno == EINTR) {
        }
        m_id = -1;
        return status;
    }

    pid_t m_id = -1;
};

Result<DoorDecoder::Made> madeOf(int status, const std::filesystem::path& source) {
    const int code = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    if (WIFSIGNALED(status) && WTERMSIG(status) == SIGXCPU)
        return failureOf(source, Failure::Kind::TimedOut, u"this file takes too long to decode"_s);
    switch (code) {
    case static_cast<int>(DoorStatus::Done):
        return DoorDecoder::Made{false};
    case static_cast<int>(DoorStatus::ProfileIgnored):
        return DoorDecoder::Made{true};
    case static_cast<int>(DoorStatus::TooLarge):
        return failureOf(source, Failure::Kind::TooLarge, u"the picture is too large"_s);
    case static_cast<int>(DoorStatus::Unsupported):
        return failureOf(source, Failure::Kind::Unsupported, u"a kind of picture that can't be shown"_s);
    case static_cast<int>(DoorStatus::NotConfined):
        return failureOf(source, Failure::Kind::Other, u"this machine does not let a decoder be locked in"_s);
    default:
        return failureOf(source, Failure::Kind::Damaged, u"this file is damaged"_s);
    }
}

// The child is not believed: what it wrote has to be a JPEG file of the promised kind from its first bytes to its last.
bool isUprightJpeg(const Descriptor& file, const QByteArray& bytes) {
    const PictureHeader header = headerOf(file);
    const qint64 pixels = qint64(header.size.width) * header.size.height;
    return doorNeedOf(header, u".jpg"_s) == DoorNeed::Nothing && pixels > 0 && pixels <= maxDoorPixels &&
           bytes.endsWith("\xFF\xD9");
}

Result<DoorDecoder::Made> decoded(const std::filesystem::path& program, const DoorLimits& limits,
                                  const Descriptor& file, const std::filesystem::path& source, QByteArray& bytes) {
    const Descriptor made(::memfd_create("picture", MFD_CLOEXEC));
    Child child;
    if (const int error = made.valid() ? child.start(program, limits, file.number(), made.number()) : errno; error != 0)
        return Failure{Failure::Kind::Other, fileFailure(program, u"can't be started"_s, error).message};
    const auto status = child.ended(limits.seconds);
    if (!status)
        return failureOf(source, Failure::Kind::TimedOut, u"this file takes too long to decode"_s);
    auto result = madeOf(*status, source);
    if (!result)
        return result;
    auto read = readWholeFile("/proc/self/fd/" + std::to_string(made.number()), nameOf(source), limits.memory);
    if (!read)
        return read.failure();
    bytes = std::move(*read);
    if (!isUprightJpeg(made, bytes))
        return failureOf(source, Failure::Kind::Damaged, u"this file is damaged"_s);
    return result;
}

} // namespace

DoorDecoder::DoorDecoder(std::filesystem::path program, DoorLimits limits)
    : m_program(std::move(program))
    , m_limits(limits) {}

Result<DoorNeed> DoorDecoder::needOf(const std::filesystem::path& source, DoorRules rules) {
    const auto file = openSource(source, nameOf(source));
    return file ? lumora::needOf(headerOf(*file), *file, source, rules) : file.failure();
}

Result<DoorDecoder::Made> DoorDecoder::make(const std::filesystem::path& source,
                                            const std::filesystem::path& target) const {
    const auto file = openSource(source, nameOf(source));
    if (!file)
        return file.failure();
    const PictureHeader header = headerOf(*file);
    const auto need = lumora::needOf(header, *file, source);
    if (!need)
        return need.failure();
    NewContent content(target, nameOf(target));
    Result<Made> result = Made{};
    if (*need == DoorNeed::Nothing || *need == DoorNeed::Copy) {
        if (const auto copied = appendFrom(*file, toTheEnd, content, nameOf(source)); !copied)
            return copied.failure();
        result->profileIgnored = coloursOf(header).profileIgnored;
    } else {
        QByteArray bytes;
        result = decoded(m_program, m_limits, *file, source, bytes);
        if (!result)
            return result;
        content.append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    }
    // What is lost by a crash is made again from the customer's file.
    if (auto written = content.commit(NewContent::Durability::Passing); !written)
        return written.failure();
    return result;
}

} // namespace lumora
