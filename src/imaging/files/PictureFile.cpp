#include "imaging/files/PictureFile.h"

#include "common/FixedText.h"
#include "common/HostFile.h"
#include "imaging/Stopwatch.h"
#include "imaging/files/JpegReader.h"
#include "imaging/files/JpegWriter.h"
#include "imaging/files/OtherPictures.h"
#include "imaging/files/PictureInput.h"
#include "imaging/scaling/Resample.h"

#include <algorithm>
#include <atomic>
#include <functional>
#include <new>
#include <optional>
#include <thread>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

Failure memoryIsShort(const std::filesystem::path& path) {
    return pictureFailure(path, Failure::Kind::TooLarge, u"memory is short"_s);
}

struct Wanted {
    PictureSize size;
    QRect part;

    explicit Wanted(PictureSize whole)
        : size(whole)
        , part(0, 0, whole.width, whole.height) {}
    Wanted(PictureSize whole, const QRect& some)
        : size(whole)
        , part(some) {}
};
using SizeRule = std::function<Wanted(PictureSize)>;

Result<Bitmap> readScaled(PictureInput input, const SizeRule& wantedFor) {
    auto reader = JpegReader::open(std::move(input));
    if (!reader)
        return reader.failure();
    const Wanted wanted = wantedFor((*reader)->size());
    return readResampledPart(**reader, wanted.size, wanted.part);
}

Result<Bitmap> loadScaled(const std::filesystem::path& path, const SizeRule& wantedFor) try {
    auto input = PictureInput::open(path);
    if (!input)
        return input.failure();
    if (input->format() == PictureInput::Format::Jpeg)
        return readScaled(std::move(*input), wantedFor);
    auto whole = readOtherPicture(*input);
    if (!whole)
        return whole.failure();
    const Wanted wanted = wantedFor({whole->width(), whole->height()});
    Bitmap scaled = resampledPart(*whole, wanted.size, wanted.part);
    if (scaled.isNull())
        return memoryIsShort(path);
    return scaled;
} catch (const std::bad_alloc&) {
    return memoryIsShort(path);
}

} // namespace

Result<PictureSize> readPictureSize(const std::filesystem::path& path) {
    auto input = PictureInput::open(path);
    if (!input)
        return input.failure();
    if (input->format() != PictureInput::Format::Jpeg)
        return readOtherPictureSize(*input);
    auto reader = JpegReader::open(std::move(*input));
    if (!reader)
        return reader.failure();
    return (*reader)->size();
}

std::int64_t decodingMemory(const std::filesystem::path& path, Decode decode) {
    constexpr std::int64_t rows = 8 << 20;
    auto input = PictureInput::open(path);
    if (!input)
        return rows;
    const auto bitmap = [](PictureSize size) { return std::int64_t{4} * size.width * size.height; };
    if (input->format() == PictureInput::Format::Bmp)
        return rows + input->size() / 3 * 4; // most hold three bytes a pixel
    if (input->format() == PictureInput::Format::Png) {
        const auto size = readOtherPictureSize(*input);
        return rows + input->size() + (size ? 2 * bitmap(*size) : 0); // as it is, and on white
    }
    auto reader = JpegReader::open(std::move(*input));
    if (!reader)
        return rows;
    const bool whole = decode == Decode::Whole || !(*reader)->hasPlanes();
    return rows + (*reader)->heldCoefficients() + (whole ? bitmap((*reader)->size()) : 0);
}

Result<Bitmap> loadPicture(const std::filesystem::path& path) {
    auto input = PictureInput::open(path);
    if (!input)
        return input.failure();
    if (input->format() != PictureInput::Format::Jpeg)
        return readOtherPicture(*input);
    auto reader = JpegReader::open(std::move(*input));
    if (!reader)
        return reader.failure();
    return (*reader)->readBitmap();
}

Result<Bitmap> loadPictureScaled(const std::filesystem::path& path, PictureSize size) {
    if (auto bounds = checkPictureBounds(path, size.width, size.height); !bounds)
        return bounds.failure();
    return loadScaled(path, [size](PictureSize) { return Wanted(size); });
}

Result<Bitmap> loadPicturePart(const std::filesystem::path& path, PictureSize size, const QRect& part) {
    if (auto bounds = checkPictureBounds(path, size.width, size.height); !bounds)
        return bounds.failure();
    if (auto bounds = checkPictureBounds(path, part.width(), part.height()); !bounds)
        return bounds.failure();
    return loadScaled(path, [&](PictureSize) { return Wanted(size, part); });
}

Result<Bitmap> scaledFromJpeg(const QByteArray& file, int width) try {
    return readScaled(PictureInput::ofJpeg(file), [width](PictureSize size) {
        const double height = static_cast<double>(width) * size.height / size.width;
        return Wanted({width, std::max(1, static_cast<int>(RoundHalfEven(height)))});
    });
} catch (const std::bad_alloc&) {
    return memoryIsShort({});
}

PictureSize smallPictureSize(PictureSize picture, int cell) {
    const double ratio = static_cast<double>(picture.width) / std::max(1, picture.height);
    const auto other = [cell](double length) {
        return std::clamp(static_cast<int>(RoundHalfEven(length)), 1, std::max(1, cell));
    };
    return ratio > 1 ? PictureSize{cell, other(cell / ratio)} : PictureSize{other(cell * ratio), cell};
}

std::vector<Result<Bitmap>> loadSmallPictures(const std::vector<std::filesystem::path>& paths, int cell) {
    std::vector<std::optional<Result<Bitmap>>> loaded(paths.size());
    std::atomic<std::size_t> next{0};
    const auto work = [&] {
        for (std::size_t i = next++; i < paths.size(); i = next++) {
            loaded[i].emplace(
                loadScaled(paths[i], [cell](PictureSize size) { return Wanted(smallPictureSize(size, cell)); }));
        }
    };
    {
        const std::size_t cores = std::max(1U, std::thread::hardware_concurrency());
        std::vector<std::jthread> others;
        for (std::size_t i = 1; i < std::min(cores, paths.size()); ++i)
            others.emplace_back(work);
        work();
    }
    std::vector<Result<Bitmap>> results;
    results.reserve(loaded.size());
    for (auto& one : loaded)
        results.push_back(std::move(*one));
    return results;
}

Result<QByteArray> encodeJpeg(const Bitmap& picture, int quality) {
    return writeJpeg(picture, quality);
}

Result<void> saveJpeg(const Bitmap& picture, const std::filesystem::path& path, int quality) {
    auto bytes = encodeJpeg(picture, quality);
    if (!bytes)
        return bytes.failure();
    return writeWholeFile(path, *bytes);
}

Result<QByteArray> scalePictureToJpeg(const std::filesystem::path& source, PictureSize size, int quality,
                                      PictureTimes* times, SmallCopy* small) try {
    Stopwatch watch(times);
    if (auto bounds = checkPictureBounds(source, size.width, size.height); !bounds)
        return bounds.failure();
    auto input = PictureInput::open(source);
    if (!input)
        return input.failure();
    if (input->format() == PictureInput::Format::Jpeg) {
        auto reader = JpegReader::open(std::move(*input));
        return reader ? readResampledToJpeg(**reader, size, quality, bestKernels(), times, small) : reader.failure();
    }
    auto whole = readOtherPicture(*input);
    if (!whole)
        return whole.failure();
    watch.add(&PictureTimes::decode);
    if (small != nullptr)
        small->pixels = resampled(*whole, small->size);
    const Bitmap scaled = resampled(onWhite(*whole), size);
    watch.add(&PictureTimes::draw);
    if (scaled.isNull())
        return memoryIsShort(source);
    auto bytes = writeJpeg(scaled, quality);
    watch.add(&PictureTimes::encode);
    return bytes;
} catch (const std::bad_alloc&) {
    return memoryIsShort(source);
}

} // namespace lumora
