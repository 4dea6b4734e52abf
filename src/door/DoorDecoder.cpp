#include "door/DoorDecoder.h"

#include "common/HostFile.h"
#include "door/DoorChild.h"
#include "door/DoorStatus.h"
#include "door/HeaderOfFile.h"
#include "imaging/files/PictureInput.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <string>
#include <string_view>
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

Failure damaged(const std::filesystem::path& source) {
    return pictureFailure(source, Failure::Kind::Damaged, u"this file is damaged"_s);
}

Failure takesTooLong(const std::filesystem::path& source) {
    return pictureFailure(source, Failure::Kind::TimedOut, u"this file takes too long to decode"_s);
}

Failure tooLarge(const std::filesystem::path& source) {
    return pictureFailure(source, Failure::Kind::TooLarge, u"the picture is too large"_s);
}

Failure notRead(const std::filesystem::path& source, int error) {
    return fileFailure(source, u"can't be read"_s, error);
}

// A card that is pulled out, or breaks, says so in many ways.
Failure ofSource(Failure failure) {
    if (failure.kind == Failure::Kind::Other)
        failure.kind = Failure::Kind::NotFound;
    return failure;
}

Result<DoorNeed> needOf(const PictureHeader& header, const Descriptor& file, const std::filesystem::path& source,
                        DoorRules rules = {true, true, true}) {
    const DoorNeed need = doorNeedOf(header, shownPath(source), rules);
    if (need != DoorNeed::Unreadable)
        return need;
    if (header.kind != PictureKind::None)
        return damaged(source);
    if (::lseek(file.number(), 0, SEEK_END) == 0)
        return pictureFailure(source, Failure::Kind::Damaged, u"the file is empty"_s);
    return pictureFailure(source, Failure::Kind::Unsupported, u"is no picture of a known kind"_s);
}

class FileActions {
public:
    FileActions()
        : m_error(posix_spawn_file_actions_init(&m_actions))
        , m_made(m_error == 0) {}
    FileActions(const FileActions&) = delete;
    FileActions& operator=(const FileActions&) = delete;
    ~FileActions() {
        if (m_made)
            posix_spawn_file_actions_destroy(&m_actions);
    }

    const posix_spawn_file_actions_t* get() const { return &m_actions; }
    // The first fault, an errno, or 0.
    int error() const { return m_error; }
    void give(int from, int to) {
        if (m_error == 0)
            m_error = posix_spawn_file_actions_adddup2(&m_actions, from, to);
    }
    void closeFrom(int number) {
        if (m_error == 0)
            m_error = posix_spawn_file_actions_addclosefrom_np(&m_actions, number);
    }

private:
    posix_spawn_file_actions_t m_actions;
    int m_error;
    const bool m_made;
};

// A copy of the descriptor above the numbers that the child's files get.
Descriptor above(int number) {
    return Descriptor(::fcntl(number, F_DUPFD_CLOEXEC, doorTargetNumber + 1));
}

constexpr qint64 largestDraftFile = 4 << 20;
constexpr qint64 betweenLooks = 100; // milliseconds, for a stop

// A child, killed at the latest when this goes.
class Child {
public:
    Child() = default;
    Child(const Child&) = delete;
    Child& operator=(const Child&) = delete;
    ~Child() {
        if (m_id > 0) {
            ::kill(m_id, SIGKILL);
            int status = 0;
            (void)reap(status);
        }
    }

    // Gives an errno, or 0.
    int start(const std::filesystem::path& program, std::string_view task, const DoorLimits& limits, int source,
              int target) {
        std::string path = program.string();
        std::string option(task);
        std::string seconds = std::to_string(limits.seconds);
        std::string memory = std::to_string(limits.memory);
        std::string parent = std::to_string(::getpid());
        const std::array<char*, 6> arguments{path.data(),   option.data(), seconds.data(),
                                             memory.data(), parent.data(), nullptr};
        const Descriptor nothing(::open("/dev/null", O_RDWR | O_CLOEXEC));
        if (!nothing.valid())
            return errno;
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
        if (actions.error() != 0)
            return actions.error();
        pid_t id = -1;
        const int error = posix_spawn(&id, path.c_str(), actions.get(), nullptr, arguments.data(), environ);
        if (error == 0)
            m_id = id;
        return error;
    }

    // Waits for the end. Gives an errno, ETIMEDOUT when the time is over, ECANCELED at a stop, or 0 and the status that
    // waitpid tells.
    int ended(int seconds, const std::stop_token& stop, int& status) {
        using namespace std::chrono;
        const Descriptor process(static_cast<int>(::syscall(SYS_pidfd_open, m_id, 0)));
        if (!process.valid())
            return errno;
        const auto end = steady_clock::now() + std::chrono::seconds(seconds);
        for (;;) {
            const auto left = ceil<milliseconds>(end - steady_clock::now()).count();
            if (left <= 0)
                return ETIMEDOUT;
            if (stop.stop_requested())
                return ECANCELED;
            pollfd waited{process.number(), POLLIN, 0};
            const int ready = ::poll(&waited, 1, static_cast<int>(std::min<qint64>(left, betweenLooks)));
            if (ready > 0)
                return reap(status);
            if (ready < 0 && errno != EINTR)
                return errno;
        }
    }

private:
    int reap(int& status) {
        const pid_t id = std::exchange(m_id, -1);
        while (::waitpid(id, &status, 0) < 0) {
            if (errno != EINTR)
                return errno;
        }
        return 0;
    }

    pid_t m_id = -1;
};

Failure failureOfSignal(int signal, const std::filesystem::path& source) {
    switch (signal) {
    case SIGXCPU:
        return takesTooLong(source);
    case SIGKILL: // the machine is short of memory
        return tooLarge(source);
    case SIGSYS:
        return pictureFailure(source, Failure::Kind::Other,
                              u"this machine's library makes a call that is not allowed (SIGSYS)"_s);
    default:
        return damaged(source);
    }
}

// True where the colour profile was ignored.
Result<bool> madeOf(int status, const std::filesystem::path& source) {
    using Kind = Failure::Kind;
    if (WIFSIGNALED(status))
        return failureOfSignal(WTERMSIG(status), source);
    switch (static_cast<DoorStatus>(WEXITSTATUS(status))) {
    case DoorStatus::Done:
        return false;
    case DoorStatus::ProfileIgnored:
        return true;
    case DoorStatus::TooLarge:
        return tooLarge(source);
    case DoorStatus::Unsupported:
        return pictureFailure(source, Kind::Unsupported, u"a kind of picture that can't be shown"_s);
    case DoorStatus::Hdr:
        return pictureFailure(source, Kind::Unsupported, u"a picture of high dynamic range can't be shown"_s);
    case DoorStatus::NotRead:
        return ofSource(notRead(source, EIO));
    case DoorStatus::NotConfined:
        return pictureFailure(source, Kind::Other, u"this machine does not let a decoder be locked in"_s);
    case DoorStatus::Damaged:
        break;
    }
    return damaged(source);
}

// The child is not believed: what it wrote has to be a JPEG file of the promised kind from its first bytes to its last.
bool isUprightJpeg(const Descriptor& file) {
    const auto header = headerOf(file, {});
    int error = 0;
    const qint64 size = ::lseek(file.number(), 0, SEEK_END);
    return header && doorNeedOf(*header, u".jpg"_s) == DoorNeed::Nothing &&
           checkPictureBounds({}, header->size.width, header->size.height) && size >= 2 &&
           readPart(file, size - 2, 2, error) == "\xFF\xD9";
}

struct Decoded {
    Descriptor file;
    bool profileIgnored;
};

Result<Decoded> decoded(const std::filesystem::path& program, std::string_view task, const DoorLimits& limits,
                        const Descriptor& file, const std::filesystem::path& source, const std::stop_token& stop) {
    Descriptor made(::memfd_create("picture", MFD_CLOEXEC));
    Child child;
    if (const int error = made.valid() ? child.start(program, task, limits, file.number(), made.number()) : errno;
        error != 0)
        return Failure{Failure::Kind::NoProgram, fileFailure(program, u"can't be started"_s, error).message};
    int status = 0;
    const int error = child.ended(limits.seconds, stop, status);
    if (error == ETIMEDOUT)
        return takesTooLong(source);
    if (error != 0)
        return fileFailure(program, u"its end can't be known"_s, error);
    const auto profileIgnored = madeOf(status, source);
    if (!profileIgnored)
        return profileIgnored.failure();
    if (!isUprightJpeg(made))
        return damaged(source);
    if (const auto begun = skipTo(made, 0, shownPath(source)); !begun)
        return begun.failure();
    return Decoded{std::move(made), *profileIgnored};
}

Result<QByteArray> smallPicture(const Result<Decoded>& picture) {
    if (!picture)
        return picture.failure();
    int error = 0;
    const qint64 size = ::lseek(picture->file.number(), 0, SEEK_END);
    return readPart(picture->file, 0, std::min(size, largestDraftFile), error);
}

} // namespace

DoorDecoder::DoorDecoder(std::filesystem::path program, DoorLimits limits)
    : m_program(std::move(program))
    , m_limits(limits) {}

Result<DoorNeed> DoorDecoder::needOf(const std::filesystem::path& source, DoorRules rules) {
    const auto file = openSource(source, shownPath(source));
    const auto header = file ? headerOf(*file, source) : file.failure();
    return header ? lumora::needOf(*header, *file, source, rules) : ofSource(header.failure());
}

Result<DoorDecoder::Made> DoorDecoder::make(const std::filesystem::path& source, const std::filesystem::path& target,
                                            const std::stop_token& stop) const {
    const auto file = openSource(source, shownPath(source));
    const auto header = file ? headerOf(*file, source) : file.failure();
    if (!header)
        return ofSource(header.failure());
    const auto need = lumora::needOf(*header, *file, source);
    if (!need)
        return need.failure();
    const bool copied = *need == DoorNeed::Nothing || *need == DoorNeed::Copy;
    auto picture = copied ? Decoded{Descriptor(), coloursOf(*header).profileIgnored}
                          : decoded(m_program, doorChildOption, m_limits, *file, source, stop);
    if (!picture)
        return picture.failure();
    NewContent content(target, shownPath(target));
    if (const auto done = appendFrom(copied ? *file : picture->file, toTheEnd, content, shownPath(source)); !done)
        return ofSource(done.failure());
    // The card may go once this is there.
    if (auto written = content.commit(); !written)
        return targetFailure(written.failure());
    return Made{picture->profileIgnored};
}

Result<QByteArray> DoorDecoder::draft(const std::filesystem::path& source, const std::stop_token& stop) const {
    const auto file = openSource(source, shownPath(source));
    const auto header = file ? headerOf(*file, source) : file.failure();
    if (!header)
        return ofSource(header.failure());
    if (header->kind != PictureKind::Heif && header->kind != PictureKind::Avif)
        return pictureFailure(source, Failure::Kind::Unsupported, u"has no small picture"_s);
    return smallPicture(decoded(m_program, doorDraftOption, m_limits, *file, source, stop));
}

Result<QByteArray> DoorDecoder::listed(const std::filesystem::path& source, const std::stop_token& stop) const {
    const auto file = openSource(source, shownPath(source));
    const auto header = file ? headerOf(*file, source) : file.failure();
    if (!header)
        return ofSource(header.failure());
    if (const auto need = lumora::needOf(*header, *file, source); !need)
        return need.failure();
    return smallPicture(decoded(m_program, doorListOption, m_limits, *file, source, stop));
}

} // namespace lumora
