#include "door/HeaderOfFile.h"

#include <cerrno>

#include <unistd.h>

namespace lumora {

using namespace Qt::StringLiterals;

QByteArray readPart(const Descriptor& file, qint64 at, qint64 count, int& error) {
    QByteArray bytes(count, Qt::Uninitialized);
    qint64 filled = 0;
    while (filled < count) {
        const ssize_t got =
            ::pread(file.number(), bytes.data() + filled, static_cast<std::size_t>(count - filled), at + filled);
        if (got < 0 && errno == EINTR)
            continue;
        if (got < 0)
            error = errno;
        if (got <= 0)
            break;
        filled += got;
    }
    bytes.truncate(filled);
    return bytes;
}

Result<PictureHeader> headerOf(const Descriptor& file, const std::filesystem::path& shown) {
    int error = 0;
    PictureHeader header =
        readPictureHeader(PictureBytes([&](qint64 at, qint64 count) { return readPart(file, at, count, error); }));
    if (error != 0)
        return fileFailure(shown, u"can't be read"_s, error);
    return header;
}

Result<PictureHeader> headerOf(const std::filesystem::path& path) {
    const auto file = openSource(path, shownPath(path));
    return file ? headerOf(*file, path) : file.failure();
}

} // namespace lumora
