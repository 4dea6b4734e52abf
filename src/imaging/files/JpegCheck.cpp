#include "imaging/files/JpegCheck.h"

#include "imaging/files/JpegReader.h"
#include "imaging/files/PictureInput.h"

#include <new>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

Result<void> checkJpegDecodes(const std::filesystem::path& path) try {
    auto input = PictureInput::open(path);
    if (!input)
        return input.failure();
    if (input->format() != PictureInput::Format::Jpeg)
        return pictureFailure(path, Failure::Kind::Unsupported, u"no JPEG file"_s);
    auto reader = JpegReader::open(std::move(*input), JpegReader::Warnings::Pass);
    if (!reader)
        return reader.failure();
    const Result<Bitmap> picture = (*reader)->readBitmap(8); // all data is read, in a small picture
    return picture ? Result<void>() : picture.failure();
} catch (const std::bad_alloc&) {
    return pictureFailure(path, Failure::Kind::TooLarge, u"memory is short"_s);
}

} // namespace lumora
