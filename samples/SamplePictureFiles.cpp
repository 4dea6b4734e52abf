#include "samples/SamplePictureFiles.h"

#include <QBuffer>
#include <QTransform>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <jpeglib.h>
#include <lcms2.h>
#include <libheif/heif.h>

namespace lumora {

QImage patches(int width, int height) {
    QImage picture(width, height, QImage::Format_RGB32);
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            const int column = x * patchesAcross / width, row = y * patchesDown / height;
            picture.setPixel(x, y, qRgb(20 + 30 * column, 30 + 40 * row, 30 + (column * 5 + row * 3) % 8 * 27));
        }
    }
    return picture;
}

std::vector<QRgb> middlesOf(const QImage& picture, int across, int down) {
    std::vector<QRgb> colours;
    for (int i = 0; i < across * down; ++i) {
        const int x = (2 * (i % across) + 1) * picture.width() / (2 * across);
        colours.push_back(picture.pixel(x, (2 * (i / across) + 1) * picture.height() / (2 * down)));
    }
    return colours;
}

QByteArray saved(const QImage& picture, const char* format, int quality) {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    return picture.save(&buffer, format, quality) ? bytes : QByteArray();
}

// Where the first stored row and the first stored column lie in the upright picture, as the standard words it.
QImage heldFor(const QImage& upright, int orientation) {
    const bool onSide = orientation >= 5;
    const int w = upright.width(), h = upright.height();
    QImage held(onSide ? h : w, onSide ? w : h, upright.format());
    const bool fromRight[] = {false, false, true, true, false, false, true, true, false};
    const bool fromBottom[] = {false, false, false, true, true, false, false, true, true};
    for (int y = 0; y < held.height(); ++y) {
        for (int x = 0; x < held.width(); ++x) {
            const int seenX = onSide ? y : x, seenY = onSide ? x : y;
            held.setPixel(x, y,
                          upright.pixel(fromRight[orientation] ? w - 1 - seenX : seenX,
                                        fromBottom[orientation] ? h - 1 - seenY : seenY));
        }
    }
    return held;
}

QByteArray bigEndian(std::initializer_list<unsigned> numbers) {
    QByteArray bytes;
    for (const unsigned number : numbers)
        for (int shift = 24; shift >= 0; shift -= 8)
            bytes += static_cast<char>(number >> shift);
    return bytes;
}

QByteArray exif(int orientation, bool adobeRgb, const QByteArray& small) {
    QByteArray bytes("II*\0", 4);
    const auto put = [&bytes](unsigned number, int size) {
        for (int i = 0; i < size; ++i)
            bytes += static_cast<char>(number >> 8 * i);
    };
    const auto entry = [&put](unsigned tag, unsigned type, unsigned count, unsigned value) {
        put(tag, 2);
        put(type, 2);
        put(count, 4);
        put(value, 4);
    };
    put(8, 4);
    put(2, 2);
    entry(0x0112, 3, 1, static_cast<unsigned>(orientation));
    entry(0x8769, 4, 1, 38);
    put(small.isEmpty() ? 0 : 74, 4);
    put(1, 2);
    entry(0xA005, 4, 1, 56);
    put(0, 4);
    put(1, 2);
    entry(0x0001, 2, 4, adobeRgb ? 0x00333052 : 0x00383952);
    put(0, 4);
    put(2, 2);
    entry(0x0201, 4, 1, 104);
    entry(0x0202, 4, 1, static_cast<unsigned>(small.size()));
    put(0, 4);
    return bytes + small;
}

namespace {

QByteArray segment(char marker, const QByteArray& content) {
    const auto size = static_cast<unsigned>(content.size() + 2);
    return QByteArray("\xFF") + marker + static_cast<char>(size >> 8) + static_cast<char>(size & 255) + content;
}

unsigned checkSum(const QByteArray& bytes) {
    unsigned sum = 0xFFFFFFFF;
    for (const char byte : bytes) {
        sum ^= static_cast<unsigned char>(byte);
        for (int i = 0; i < 8; ++i)
            sum = (sum & 1) != 0 ? sum >> 1 ^ 0xEDB88320 : sum >> 1;
    }
    return ~sum;
}

QByteArray bytesOf(cmsHPROFILE profile) {
    cmsUInt32Number size = 0;
    cmsSaveProfileToMem(profile, nullptr, &size);
    QByteArray bytes(static_cast<qsizetype>(size), '\0');
    cmsSaveProfileToMem(profile, bytes.data(), &size);
    cmsCloseProfile(profile);
    return bytes;
}

} // namespace

QByteArray jpegWith(const QByteArray& jpeg, const QByteArray& exif, const QByteArray& profile, int part) {
    QByteArray head;
    if (!exif.isEmpty())
        head += segment('\xE1', QByteArray("Exif\0\0", 6) + exif);
    const qsizetype parts = (profile.size() + part - 1) / part;
    for (qsizetype i = 0; i < parts; ++i) {
        const QByteArray number{QByteArray(1, char(i + 1)) + char(parts)};
        head += segment('\xE2', QByteArray("ICC_PROFILE\0", 12) + number + profile.mid(i * part, part));
    }
    return jpeg.left(2) + head + jpeg.mid(2);
}

QByteArray pngWith(const QByteArray& png, const std::vector<std::pair<const char*, QByteArray>>& chunks) {
    constexpr qsizetype behindSize = 33;
    QByteArray added;
    for (const auto& [name, content] : chunks)
        added += bigEndian({unsigned(content.size())}) + name + content + bigEndian({checkSum(name + content)});
    return png.left(behindSize) + added + png.mid(behindSize);
}

QByteArray webPWith(const QByteArray& webP, const QByteArray& exif, const QByteArray& profile) {
    const auto number = [](qsizetype value, int size) {
        QByteArray bytes;
        for (int i = 0; i < size; ++i)
            bytes += static_cast<char>(value >> 8 * i);
        return bytes;
    };
    const auto chunk = [&number](const char* name, const QByteArray& content) {
        return name + number(content.size(), 4) + content + QByteArray(content.size() % 2, '\0');
    };
    const QImage picture = QImage::fromData(webP);
    const QByteArray chunks =
        chunk("VP8X", number(0x28, 4) + number(picture.width() - 1, 3) + number(picture.height() - 1, 3)) +
        chunk("ICCP", profile) + webP.mid(12) + chunk("EXIF", exif);
    return "RIFF" + number(chunks.size() + 4, 4) + "WEBP" + chunks;
}

// Two frames, the second one of a black pixel. Codes of eight bits that are begun anew before they would need nine.
QByteArray gif(const QImage& picture) {
    const auto word = [](int value) { return QByteArray(1, char(value & 255)) + char(value >> 8); };
    const QByteArray size = word(picture.width()) + word(picture.height());
    QByteArray bytes = "GIF89a" + size + QByteArray("\xF6\0\0", 3);
    const std::vector<QRgb> table = middlesOf(picture);
    for (std::size_t i = 0; i < 128; ++i) {
        const QRgb colour = i < table.size() ? table[i] : qRgb(0, 0, 0);
        bytes += QByteArray(1, char(qRed(colour))) + char(qGreen(colour)) + char(qBlue(colour));
    }
    bytes += ',' + word(0) + word(0) + size + QByteArray("\0\x07", 2);
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); x += 100) {
            const int count = std::min(100, picture.width() - x);
            bytes += QByteArray(1, char(count + 1)) + '\x80';
            for (int i = x; i < x + count; ++i)
                bytes += char(std::find(table.begin(), table.end(), picture.pixel(i, y)) - table.begin());
        }
    }
    bytes += QByteArray("\x01\x81\0", 3);
    return bytes + ',' + word(0) + word(0) + word(1) + word(1) + QByteArray("\0\x07\x03\x80\x7F\x81\0;", 8);
}

QByteArray inksJpeg(const QImage& picture, const QByteArray& profile) {
    jpeg_compress_struct info{};
    jpeg_error_mgr errors{};
    info.err = jpeg_std_error(&errors);
    jpeg_create_compress(&info);
    unsigned char* memory = nullptr;
    unsigned long size = 0;
    jpeg_mem_dest(&info, &memory, &size);
    info.image_width = static_cast<JDIMENSION>(picture.width());
    info.image_height = static_cast<JDIMENSION>(picture.height());
    info.input_components = 4;
    info.in_color_space = JCS_CMYK;
    jpeg_set_defaults(&info);
    jpeg_set_quality(&info, 100, TRUE);
    jpeg_start_compress(&info, TRUE);
    QByteArray line(picture.width() * 4, '\xE0');
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x) {
            const QRgb c = picture.pixel(x, y);
            line[4 * x] = char(qRed(c)), line[4 * x + 1] = char(qGreen(c)), line[4 * x + 2] = char(qBlue(c));
        }
        auto* row = reinterpret_cast<JSAMPROW>(line.data());
        jpeg_write_scanlines(&info, &row, 1);
    }
    jpeg_finish_compress(&info);
    const QByteArray bytes(reinterpret_cast<const char*>(memory), static_cast<qsizetype>(size));
    jpeg_destroy_compress(&info);
    std::free(memory);
    return jpegWith(bytes, {}, profile);
}

QByteArray heif(const QImage& picture, const HeifKind& kind) {
    const bool alpha = picture.hasAlphaChannel();
    const QImage pixels = picture.convertToFormat(alpha ? QImage::Format_RGBA8888 : QImage::Format_RGB888);
    heif_image* image = nullptr;
    heif_image_create(pixels.width(), pixels.height(), heif_colorspace_RGB,
                      alpha ? heif_chroma_interleaved_RGBA : heif_chroma_interleaved_RGB, &image);
    heif_image_add_plane(image, heif_channel_interleaved, pixels.width(), pixels.height(), 8);
    int stride = 0;
    uint8_t* plane = heif_image_get_plane(image, heif_channel_interleaved, &stride);
    for (int y = 0; y < pixels.height(); ++y)
        std::memcpy(plane + y * stride, pixels.constScanLine(y), std::size_t(pixels.width()) * (alpha ? 4 : 3));
    if (!kind.profile.isEmpty())
        heif_image_set_raw_color_profile(image, "prof", kind.profile.constData(), std::size_t(kind.profile.size()));
    heif_color_profile_nclx* coded = heif_nclx_color_profile_alloc();
    coded->matrix_coefficients = heif_matrix_coefficients_ITU_R_BT_601_6;
    if (kind.codes) {
        heif_nclx_color_profile_set_color_primaries(coded, static_cast<uint16_t>(kind.codes->first));
        heif_nclx_color_profile_set_transfer_characteristics(coded, static_cast<uint16_t>(kind.codes->second));
        heif_image_set_nclx_color_profile(image, coded);
    }
    heif_context* context = heif_context_alloc();
    heif_encoder* encoder = nullptr;
    heif_context_get_encoder_for_format(context, kind.avif ? heif_compression_AV1 : heif_compression_HEVC, &encoder);
    heif_encoder_set_lossy_quality(encoder, kind.quality);
    heif_encoder_set_parameter(encoder, "chroma", kind.chroma);
    heif_encoding_options* options = heif_encoding_options_alloc();
    options->image_orientation = static_cast<heif_orientation>(kind.orientation);
    options->macOS_compatibility_workaround_no_nclx_profile = 0;
    options->save_two_colr_boxes_when_ICC_and_nclx_available = 1;
    if (kind.codes)
        options->output_nclx_profile = coded;
    heif_image_handle* handle = nullptr;
    heif_context_encode_image(context, image, encoder, options, &handle);
    if (kind.small > 0) {
        heif_image_handle* small = nullptr;
        heif_context_encode_thumbnail(context, image, handle, encoder, options, kind.small, &small);
        heif_image_handle_release(small);
    }
    if (!kind.exif.isEmpty())
        heif_context_add_exif_metadata(context, handle, kind.exif.constData(), static_cast<int>(kind.exif.size()));
    heif_writer writer{1, [](heif_context*, const void* data, std::size_t size, void* target) {
                           static_cast<QByteArray*>(target)->append(static_cast<const char*>(data), qsizetype(size));
                           return heif_error{heif_error_Ok, heif_suberror_Unspecified, ""};
                       }};
    QByteArray bytes;
    heif_context_write(context, &writer, &bytes);
    heif_image_handle_release(handle);
    heif_encoding_options_free(options);
    heif_encoder_release(encoder);
    heif_context_free(context);
    heif_nclx_color_profile_free(coded);
    heif_image_release(image);
    return bytes;
}

QByteArray rgbProfile(const std::array<double, 6>& p, double gamma) {
    const cmsCIExyY white{0.3127, 0.3290, 1};
    const cmsCIExyYTRIPLE primaries{{p[0], p[1], 1}, {p[2], p[3], 1}, {p[4], p[5], 1}};
    const double srgb[] = {2.4, 1 / 1.055, 0.055 / 1.055, 1 / 12.92, 0.04045};
    cmsToneCurve* curve = gamma > 0 ? cmsBuildGamma(nullptr, gamma) : cmsBuildParametricToneCurve(nullptr, 4, srgb);
    cmsToneCurve* curves[] = {curve, curve, curve};
    const QByteArray bytes = bytesOf(cmsCreateRGBProfile(&white, &primaries, curves));
    cmsFreeToneCurve(curve);
    return bytes;
}

QByteArray p3Profile() {
    return rgbProfile({0.680, 0.320, 0.265, 0.690, 0.150, 0.060}, 0);
}

QByteArray adobeProfile() {
    return rgbProfile({0.64, 0.33, 0.21, 0.71, 0.15, 0.06}, 563.0 / 256);
}

QByteArray srgbProfile(const char* name) {
    cmsHPROFILE profile = cmsCreate_sRGBProfile();
    cmsMLU* text = cmsMLUalloc(nullptr, 1);
    cmsMLUsetASCII(text, "en", "US", name);
    cmsWriteTag(profile, cmsSigProfileDescriptionTag, text);
    cmsMLUfree(text);
    return bytesOf(profile);
}

QByteArray greyProfile(double gamma) {
    cmsToneCurve* curve = cmsBuildGamma(nullptr, gamma);
    const QByteArray bytes = bytesOf(cmsCreateGrayProfile(cmsD50_xyY(), curve));
    cmsFreeToneCurve(curve);
    return bytes;
}

// Inks that darken more than one by one, each a little impure.
QByteArray inksProfile() {
    cmsHPROFILE profile = cmsCreateProfilePlaceholder(nullptr);
    cmsSetProfileVersion(profile, 2.4);
    cmsSetDeviceClass(profile, cmsSigOutputClass);
    cmsSetColorSpace(profile, cmsSigCmykData);
    cmsSetPCS(profile, cmsSigLabData);
    cmsPipeline* pipeline = cmsPipelineAlloc(nullptr, 4, 3);
    cmsStage* table = cmsStageAllocCLut16bit(nullptr, 9, 4, 3, nullptr);
    cmsStageSampleCLut16bit(
        table,
        [](const cmsUInt16Number* in, cmsUInt16Number* out, void*) -> cmsInt32Number {
            const double c = in[0] / 65535.0, m = in[1] / 65535.0, y = in[2] / 65535.0, k = in[3] / 65535.0;
            const cmsCIELab lab{(100 - 35 * c - 45 * m - 10 * y) * (1 - 0.85 * k) + 5,
                                (65 * m - 35 * c) * (1 - 0.8 * k), (80 * y - 40 * c - 5 * m) * (1 - 0.8 * k)};
            cmsFloat2LabEncodedV2(out, &lab);
            return 1;
        },
        nullptr, 0);
    cmsPipelineInsertStage(pipeline, cmsAT_END, table);
    cmsWriteTag(profile, cmsSigAToB0Tag, pipeline);
    cmsPipelineFree(pipeline);
    return bytesOf(profile);
}

std::vector<std::pair<std::string, QByteArray>> samplePictureFiles() {
    const QImage picture = patches(96, 64);
    QImage alpha = picture.convertToFormat(QImage::Format_ARGB32);
    alpha.setPixelColor(3, 3, QColor(10, 20, 30, 40));
    const QByteArray jpeg = saved(picture, "JPG");
    return {
        {"turned.jpg", jpegWith(jpeg, exif(6))},
        {"p3.jpg", jpegWith(jpeg, exif(6), p3Profile())},
        {"inks.jpg", inksJpeg(picture, inksProfile())},
        {"alpha.png", saved(alpha, "PNG")},
        {"deep.png", pngWith(saved(picture.convertToFormat(QImage::Format_RGBA64), "PNG"), {{"eXIf", exif(3)}})},
        {"palette.png", saved(picture.convertToFormat(QImage::Format_Indexed8), "PNG")},
        {"plain.bmp", saved(picture, "BMP")},
        {"alpha.webp", saved(alpha, "WEBP")},
        {"lossy.webp", saved(picture, "WEBP", 80)},
        {"plain.tiff", saved(picture, "TIFF")},
        {"two.gif", gif(picture)},
        {"p3.heic", heif(picture, {.profile = p3Profile(), .orientation = 6, .small = 32})},
        {"alpha.heic", heif(alpha, {})},
        {"plain.avif", heif(picture, {.avif = true, .codes = {{12, 13}}})},
    };
}

} // namespace lumora
