#include "door/StoredPicture.h"

#include "common/HostFile.h"
#include "imaging/files/JpegReader.h"
#include "imaging/files/OtherPictures.h"

#include <QBuffer>
#include <QColorSpace>
#include <QImageReader>

#include <ctime>
#include <utility>

#include <libheif/heif.h>

namespace lumora {

namespace {

constexpr qint64 maxFile = 256 << 20;
constexpr int largestDraft = 1024;

const char* qtNameOf(PictureKind kind) {
    switch (kind) {
    case PictureKind::Png:
        return "png";
    case PictureKind::WebP:
        return "webp";
    case PictureKind::Tiff:
        return "tiff";
    case PictureKind::Bmp:
        return "bmp";
    case PictureKind::Gif:
        return "gif";
    default:
        return nullptr;
    }
}

template <class Object, void (*release)(Object*)>
struct Releaser {
    void operator()(Object* object) const { release(object); }
};
template <class Object, void (*release)(Object*)>
using Handle = std::unique_ptr<Object, Releaser<Object, release>>;

void releaseImage(const heif_image* image) {
    heif_image_release(image);
}

void releaseHandle(const heif_image_handle* handle) {
    heif_image_handle_release(handle);
}

DoorStatus statusOf(const heif_error& error) {
    switch (error.code) {
    case heif_error_Ok:
        return DoorStatus::Done;
    case heif_error_Memory_allocation_error:
        return DoorStatus::TooLarge;
    case heif_error_Unsupported_filetype:
    case heif_error_Unsupported_feature:
    case heif_error_Plugin_loading_error:
        return DoorStatus::Unsupported;
    default:
        return DoorStatus::Damaged;
    }
}

// Done where a picture of these sides may be decoded.
DoorStatus statusOfSize(qint64 width, qint64 height) {
    if (const auto bounds = checkPictureBounds({}, width, height); !bounds)
        return doorStatusOf(bounds.failure());
    return width * height > maxDoorPixels ? DoorStatus::TooLarge : DoorStatus::Done;
}

// The embedded picture; null where there is none, or it is turned in another way.
Handle<const heif_image_handle, releaseHandle> draftOf(const heif_image_handle* picture) {
    heif_item_id id = 0;
    heif_image_handle* handle = nullptr;
    if (heif_image_handle_get_list_of_thumbnail_IDs(picture, &id, 1) == 1)
        (void)heif_image_handle_get_thumbnail(picture, id, &handle);
    Handle<const heif_image_handle, releaseHandle> draft(handle);
    if (!draft)
        return {};
    const auto isWide = [](const heif_image_handle* one) {
        return heif_image_handle_get_width(one) > heif_image_handle_get_height(one);
    };
    const bool fits = heif_image_handle_get_width(handle) <= largestDraft &&
                      heif_image_handle_get_height(handle) <= largestDraft && isWide(handle) == isWide(picture);
    return fits ? std::move(draft) : Handle<const heif_image_handle, releaseHandle>();
}

HeaderColours heifColours(const heif_image_handle* handle) {
    heif_color_profile_nclx* coded = nullptr;
    if (heif_image_handle_get_nclx_color_profile(handle, &coded).code != heif_error_Ok || coded == nullptr)
        return {};
    const HeaderColours colours = codedColours({coded->color_primaries, coded->transfer_characteristics});
    heif_nclx_color_profile_free(coded);
    return colours;
}

// Qt's reader takes a GIF file that is cut short for whole; the data of a frame ends with an empty block.
bool hasWholeGifFrame(const QByteArray& bytes) {
    const auto byte = [&bytes](qint64 at) { return at < bytes.size() ? static_cast<uchar>(bytes[at]) : -1; };
    const auto tableSize = [](int flags) { return (flags & 0x80) != 0 ? 3 << ((flags & 7) + 1) : 0; };
    qint64 at = 13 + tableSize(byte(10));
    bool isFrame = false;
    while (!isFrame) {
        isFrame = byte(at) == 0x2C;
        if (!isFrame && byte(at) != 0x21)
            return false;
        at += isFrame ? 10 + tableSize(byte(at + 9)) + 1 : 2;
        while (byte(at) > 0)
            at += byte(at) + 1;
        if (byte(at++) < 0)
            return false;
    }
    return true;
}

} // namespace

Result<std::unique_ptr<StoredPictureReader>> StoredPictureReader::open(const std::filesystem::path& path) {
    auto bytes = readWholeFile(path, shownPath(path), maxFile);
    if (!bytes)
        return bytes.failure();
    std::unique_ptr<StoredPictureReader> reader(new StoredPictureReader);
    reader->m_bytes = std::move(*bytes);
    reader->m_kind = pictureKindOf(reader->m_bytes);
    if (reader->m_kind == PictureKind::Jpeg || reader->m_kind == PictureKind::Bmp) {
        auto input = PictureInput::open(path);
        if (!input)
            return input.failure();
        reader->m_input.emplace(std::move(*input));
    } else if (reader->m_kind == PictureKind::Heif || reader->m_kind == PictureKind::Avif) {
        heif_init(nullptr);
    }
    // What asks for files on its first call does so here: the profiles of LittleCMS note the time, Qt's reader loads
    // its plugin.
    tzset();
    QImageReader::setAllocationLimit(0);
    if (const char* name = qtNameOf(reader->m_kind)) {
        QBuffer nothing;
        nothing.open(QIODevice::ReadOnly);
        QImageReader qtReader(&nothing, name);
        if (!qtReader.canRead() && qtReader.error() == QImageReader::UnsupportedFormatError)
            return Failure{Failure::Kind::Unsupported, {}};
    }
    return reader;
}

const PictureHeader& StoredPictureReader::header() {
    if (!m_header) {
        m_header = readPictureHeader(PictureBytes(
            [this](qint64 at, qint64 count) { return at <= m_bytes.size() ? m_bytes.mid(at, count) : QByteArray(); }));
    }
    return *m_header;
}

DoorStatus StoredPictureReader::read(StoredPicture& picture) {
    picture.colours = coloursOf(header());
    picture.profile = header().profile;
    picture.orientation = header().orientation;
    if (picture.colours.source == HeaderColours::Source::Hdr)
        return DoorStatus::Hdr;
    const bool toldBefore = m_kind == PictureKind::Jpeg || m_kind == PictureKind::Png || m_kind == PictureKind::Bmp;
    if (const DoorStatus size = statusOfSize(header().size.width, header().size.height);
        toldBefore && size != DoorStatus::Done)
        return size;
    switch (m_kind) {
    case PictureKind::None:
        return DoorStatus::Unsupported;
    case PictureKind::Jpeg:
        return readJpeg(picture);
    case PictureKind::Heif:
    case PictureKind::Avif:
        return readHeif(picture, Part::Whole);
    case PictureKind::Bmp: {
        auto bitmap = readOtherPicture(*m_input);
        if (!bitmap)
            return doorStatusOf(bitmap.failure());
        picture.image = bitmap->image();
        return DoorStatus::Done;
    }
    default:
        return readByQt(picture);
    }
}

DoorStatus StoredPictureReader::readJpeg(StoredPicture& picture) {
    auto reader = JpegReader::open(std::move(*m_input));
    if (!reader)
        return doorStatusOf(reader.failure());
    using Pixels = SrgbConversion::Pixels;
    const Pixels pixels = (*reader)->colours();
    // Inks whose profile is of no use are turned to light as those without one.
    const bool byProfile = pixels != Pixels::Rgb && picture.colours.source == HeaderColours::Source::Profile &&
                           SrgbConversion::ofProfile(picture.profile, pixels);
    auto bitmap = byProfile ? (*reader)->readStoredInks() : (*reader)->readBitmap();
    if (!bitmap)
        return doorStatusOf(bitmap.failure());
    picture.image = std::move(bitmap->image());
    picture.pixels = byProfile ? pixels : Pixels::Rgb;
    if (pixels != Pixels::Rgb && !byProfile && picture.colours.source != HeaderColours::Source::None)
        picture.colours = {HeaderColours::Source::None, {}, true};
    return DoorStatus::Done;
}

DoorStatus StoredPictureReader::readDraft(StoredPicture& picture) {
    const bool mayHaveOne = m_kind == PictureKind::Heif || m_kind == PictureKind::Avif;
    return mayHaveOne ? readHeif(picture, Part::Draft) : DoorStatus::Unsupported;
}

DoorStatus StoredPictureReader::readHeif(StoredPicture& picture, Part part) {
    const Handle<heif_context, heif_context_free> context(heif_context_alloc());
    heif_context_set_max_decoding_threads(context.get(), 0);
    heif_error error = heif_context_read_from_memory_without_copy(context.get(), m_bytes.constData(),
                                                                  static_cast<std::size_t>(m_bytes.size()), nullptr);
    if (error.code != heif_error_Ok)
        return statusOf(error);
    heif_image_handle* handle = nullptr;
    error = heif_context_get_primary_image_handle(context.get(), &handle);
    if (error.code != heif_error_Ok)
        return statusOf(error);
    const Handle<const heif_image_handle, releaseHandle> handleOwner(handle);
    if (const DoorStatus size = statusOfSize(heif_image_handle_get_width(handle), heif_image_handle_get_height(handle));
        size != DoorStatus::Done)
        return size;

    picture.colours = heifColours(handle);
    if (picture.colours.source == HeaderColours::Source::Hdr)
        return DoorStatus::Hdr;
    if (const std::size_t size = heif_image_handle_get_raw_color_profile_size(handle); size > 0) {
        picture.profile.resize(static_cast<qsizetype>(size));
        (void)heif_image_handle_get_raw_color_profile(handle, picture.profile.data());
        PictureHeader header;
        header.profile = picture.profile;
        const HeaderColours byProfile = coloursOf(header);
        if (byProfile.profileIgnored)
            picture.colours.profileIgnored = true;
        else
            picture.colours = byProfile;
    }
    Handle<const heif_image_handle, releaseHandle> draft;
    if (part == Part::Draft) {
        draft = draftOf(handle);
        if (!draft)
            return DoorStatus::Unsupported;
    }
    const heif_image_handle* drawn = draft ? draft.get() : handle;
    const Handle<heif_decoding_options, heif_decoding_options_free> options(heif_decoding_options_alloc());
    options->convert_hdr_to_8bit = 1;
    heif_image* decoded = nullptr;
    error = heif_decode_image(drawn, &decoded, heif_colorspace_RGB, heif_chroma_interleaved_RGBA, options.get());
    if (error.code != heif_error_Ok)
        return statusOf(error);
    const Handle<const heif_image, releaseImage> image(decoded);
    int stride = 0;
    const uchar* pixels = heif_image_get_plane_readonly(decoded, heif_channel_interleaved, &stride);
    const QImage::Format format = heif_image_handle_has_alpha_channel(drawn) == 0 ? QImage::Format_RGBX8888
                                  : heif_image_handle_is_premultiplied_alpha(drawn) != 0
                                      ? QImage::Format_RGBA8888_Premultiplied
                                      : QImage::Format_RGBA8888;
    const QImage view(pixels, heif_image_get_width(decoded, heif_channel_interleaved),
                      heif_image_get_height(decoded, heif_channel_interleaved), stride, format);
    picture.image =
        view.convertToFormat(format == QImage::Format_RGBX8888 ? QImage::Format_RGB32 : QImage::Format_ARGB32);
    return DoorStatus::Done;
}

DoorStatus StoredPictureReader::readByQt(StoredPicture& picture) {
    if (m_kind == PictureKind::Gif && !hasWholeGifFrame(m_bytes))
        return DoorStatus::Damaged;
    QBuffer buffer(&m_bytes);
    buffer.open(QIODevice::ReadOnly);
    QImageReader reader(&buffer, qtNameOf(m_kind));
    reader.setAutoDetectImageFormat(false);
    reader.setAutoTransform(m_kind == PictureKind::Tiff);
    if (!reader.size().isValid())
        return DoorStatus::Damaged;
    if (const DoorStatus size = statusOfSize(reader.size().width(), reader.size().height()); size != DoorStatus::Done)
        return size;
    picture.image = reader.read();
    if (picture.image.isNull())
        return DoorStatus::Damaged;
    if (picture.colours.source == HeaderColours::Source::Profile || m_kind == PictureKind::Tiff) {
        if (picture.profile.isEmpty()) {
            PictureHeader header;
            header.profile = picture.profile = picture.image.colorSpace().iccProfile();
            header.profileBroken = picture.profile.isEmpty() && m_kind != PictureKind::Tiff;
            picture.colours = coloursOf(header);
        }
    }
    return DoorStatus::Done;
}

} // namespace lumora
