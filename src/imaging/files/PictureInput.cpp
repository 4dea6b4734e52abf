#include "imaging/files/PictureInput.h"

#include "common/HostFile.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr std::int64_t maxSide = 65500;
constexpr std::int64_t maxPixels = 250'000'000;

QString cannotBeRead() {
    return u"can't be read"_s;
}

} // namespace

Failure pictureFailure(const std::filesystem::path& path, Failure::Kind kind, const QString& reason) {
    return {kind, u"%1: %2"_s.arg(shownPath(path), reason)};
}

Result<void> checkPictureBounds(const std::filesystem::path& path, std::int64_t width, std::int64_t height) {
    if (width < 1 || height < 1)
        return pictureFailure(path, Failure::Kind::Damaged, u"the picture has no pixels"_s);
    if (width > maxSide || height > maxSide || width * height > maxPixels) {
        return pictureFailure(path, Failure::Kind::TooLarge,
                              u"the picture is too large, %1 x %2 pixels"_s.arg(width).arg(height));
    }
    return {};
}

Result<PictureInput> PictureInput::open(const std::filesystem::path& path) {
    PictureInput input;
    input.m_path = path;
    // O_NONBLOCK: a pipe called .jpg must not make the page wait for a writer.
    input.m_file = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    struct stat status {};
    if (input.m_file < 0 || ::fstat(input.m_file, &status) != 0)
        return fileFailure(path, cannotBeRead(), errno);
    if (!S_ISREG(status.st_mode))
        return pictureFailure(path, Failure::Kind::Unsupported, u"is not a file"_s);
    input.m_size = status.st_size;

    std::array<unsigned char, 8> head{};
    const ssize_t got = ::pread(input.m_file, head.data(), head.size(), 0);
    if (got < 0)
        return fileFailure(path, cannotBeRead(), errno);
    if (got == 0)
        return pictureFailure(path, Failure::Kind::Damaged, u"the file is empty"_s);
    if (got >= 3 && std::memcmp(head.data(), "\xFF\xD8\xFF", 3) == 0)
        input.m_format = Format::Jpeg;
    else if (got >= 2 && std::memcmp(head.data(), "BM", 2) == 0)
        input.m_format = Format::Bmp;
    else if (got >= 8 && std::memcmp(head.data(), "\x89PNG\r\n\x1A\n", 8) == 0)
        input.m_format = Format::Png;
    else
        return pictureFailure(path, Failure::Kind::Unsupported, u"is no picture of a known kind"_s);
    return input;
}

PictureInput PictureInput::ofJpeg(QByteArray file) {
    PictureInput input;
    input.m_size = file.size();
    input.m_bytes = std::move(file);
    return input;
}

PictureInput::PictureInput(PictureInput&& other) noexcept
    : m_path(std::move(other.m_path))
    , m_file(std::exchange(other.m_file, -1))
    , m_bytes(std::move(other.m_bytes))
    , m_at(other.m_at)
    , m_size(other.m_size)
    , m_format(other.m_format) {}

PictureInput::~PictureInput() {
    if (m_file >= 0)
        ::close(m_file);
}

std::ptrdiff_t PictureInput::read(void* target, std::size_t count) {
    if (m_file < 0) {
        const auto part = std::min(static_cast<std::int64_t>(count), m_size - m_at);
        std::memcpy(target, m_bytes.constData() + m_at, static_cast<std::size_t>(part));
        m_at += part;
        return part;
    }
    ssize_t got = 0;
    do {
        got = ::read(m_file, target, count);
    } while (got < 0 && errno == EINTR);
    return got;
}

} // namespace lumora
