#include "imaging/files/PictureFile.h"

#include <cstdint>
#include <cstdlib>
#include <string>
#include <sys/mman.h>
#include <unistd.h>

// Picture files come from cards and mails of people we do not know. Whatever the bytes: a picture or a failure with a
// message, within the bounds, and the two ways of reading agree on the size.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const int file = memfd_create("picture", MFD_CLOEXEC);
    if (file < 0 || write(file, data, size) != static_cast<ssize_t>(size))
        std::abort();
    const std::string path = "/proc/self/fd/" + std::to_string(file);

    const auto header = lumora::readPictureSize(path);
    if (!header && header.failure().message.isEmpty())
        std::abort();
    // Very large pictures are allowed, but they would keep the search from its work.
    if (header && header->width * static_cast<std::int64_t>(header->height) < 4'000'000) {
        const auto print = lumora::scalePictureToJpeg(path, {48, 32}, 90);
        const auto small = lumora::loadPictureScaled(path, lumora::smallPictureSize(*header, 40));
        const auto whole = lumora::loadPicture(path);
        if (whole && (whole->width() != header->width || whole->height() != header->height))
            std::abort();
        if (whole.ok() != print.ok() || whole.ok() != small.ok())
            std::abort();
    }
    close(file);
    return 0;
}
