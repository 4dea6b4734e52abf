#include "imaging/JpegReader.h"

#include "common/WholeFile.h"
#include "imaging/JpegErrors.h"

#include <QSysInfo>

#include <array>
#include <cerrno>
#include <utility>
#include <vector>

#include <jerror.h>

namespace lumora {

namespace {

// A progressive file may ask for the whole picture to be gone over again and again; real ones have about ten scans.
constexpr int maxScans = 200;

constexpr J_COLOR_SPACE bitmapColours = Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? JCS_EXT_BGRX : JCS_EXT_XRGB;

// Ink on paper to light. Files with the Adobe mark hold the inks inverted, as light passed by each ink.
void convertInks(const unsigned char* inks, QRgb* line, int width, bool inverted) {
    for (int x = 0; x < width; ++x, inks += 4) {
        const auto light = [&](int ink) {
            const int a = inverted ? inks[ink] : 255 - inks[ink];
            const int black = inverted ? inks[3] : 255 - inks[3];
            return (a * black + 127) / 255;
        };
        line[x] = qRgb(light(0), light(1), light(2));
    }
}

} // namespace

struct JpegReader::State {
    struct Source {
        jpeg_source_mgr manager{};
        const PictureInput* input = nullptr;
        int readError = 0;
        std::array<JOCTET, 65536> buffer;
    };

    explicit State(PictureInput file)
        : input(std::move(file)) {
        source.input = &input;
        source.manager.init_source = [](j_decompress_ptr) {};
        source.manager.fill_input_buffer = fill;
        source.manager.skip_input_data = skip;
        source.manager.resync_to_restart = jpeg_resync_to_restart;
        source.manager.term_source = [](j_decompress_ptr) {};
        progress.progress_monitor = countScans;
    }
    ~State() {
        if (created)
            jpeg_destroy_decompress(&info);
    }
    State(const State&) = delete;
    State& operator=(const State&) = delete;

    static boolean fill(j_decompress_ptr info) {
        auto* source = reinterpret_cast<Source*>(info->src);
        const std::ptrdiff_t got = source->input->read(source->buffer.data(), source->buffer.size());
        if (got < 0) {
            source->readError = errno;
            ERREXIT(info, JERR_FILE_READ);
        }
        if (got == 0)
            ERREXIT(info, JERR_INPUT_EOF);
        source->manager.next_input_byte = source->buffer.data();
        source->manager.bytes_in_buffer = static_cast<std::size_t>(got);
        return TRUE;
    }

    static void skip(j_decompress_ptr info, long count) {
        while (count > static_cast<long>(info->src->bytes_in_buffer)) {
            count -= static_cast<long>(info->src->bytes_in_buffer);
            fill(info);
        }
        if (count > 0) {
            info->src->next_input_byte += count;
            info->src->bytes_in_buffer -= static_cast<std::size_t>(count);
        }
    }

    static void countScans(j_common_ptr common) {
        if (common->is_decompressor != 0 && reinterpret_cast<j_decompress_ptr>(common)->input_scan_number > maxScans)
            ERREXIT(common, JERR_BAD_PROGRESSION);
    }

    Failure failure() const {
        if (source.readError != 0)
            return fileFailure(input.path(), QStringLiteral("can't be read"), source.readError);
        if (errors.outOfMemory)
            return pictureFailure(input.path(), Failure::Kind::TooLarge, QStringLiteral("memory is short"));
        switch (errors.code) {
        case JERR_IMAGE_TOO_BIG:
            return pictureFailure(input.path(), Failure::Kind::TooLarge, QStringLiteral("the picture is too large"));
        case JERR_SOF_UNSUPPORTED:
        case JERR_BAD_PRECISION:
        case JERR_CONVERSION_NOTIMPL:
        case JERR_NOTIMPL:
        case JERR_NOT_COMPILED:
        case JERR_ARITH_NOTIMPL:
            return pictureFailure(input.path(), Failure::Kind::Unsupported,
                                  QStringLiteral("a kind of JPEG file that can't be shown (%1)").arg(errors.text));
        default:
            return pictureFailure(input.path(), Failure::Kind::Damaged,
                                  QStringLiteral("the picture is damaged or cut short (%1)").arg(errors.text));
        }
    }

    PictureInput input;
    JpegErrors errors;
    Source source;
    jpeg_progress_mgr progress{};
    jpeg_decompress_struct info{};
    bool created = false;
};

JpegReader::JpegReader(std::unique_ptr<State> state)
    : m_state(std::move(state)) {}

JpegReader::~JpegReader() = default;

Result<std::unique_ptr<JpegReader>> JpegReader::open(PictureInput input) {
    auto state = std::make_unique<State>(std::move(input));
    State& s = *state;
    s.info.err = s.errors.install();
    const bool ok = s.errors.guarded([&s] {
        jpeg_create_decompress(&s.info);
        s.created = true;
        s.info.src = &s.source.manager;
        s.info.progress = &s.progress;
        jpeg_read_header(&s.info, TRUE);
    });
    if (!ok)
        return s.failure();

    const auto width = static_cast<std::int64_t>(s.info.image_width);
    const auto height = static_cast<std::int64_t>(s.info.image_height);
    if (auto bounds = checkPictureBounds(s.input.path(), width, height); !bounds)
        return bounds.failure();
    // A block of 64 pixels takes at least one bit, so a header that claims more than the file can hold is refused
    // before memory is taken for it. Arithmetic coding knows no such bound.
    if (s.info.arith_code == FALSE && width * height / 64 / 8 > s.input.size())
        return pictureFailure(s.input.path(), Failure::Kind::Damaged,
                              QStringLiteral("the file is too short for %1 x %2 pixels").arg(width).arg(height));
    return std::unique_ptr<JpegReader>(new JpegReader(std::move(state)));
}

PictureSize JpegReader::size() const {
    return {static_cast<int>(m_state->info.image_width), static_cast<int>(m_state->info.image_height)};
}

Result<Bitmap> JpegReader::readBitmap(int denominator) {
    State& s = *m_state;
    const bool inks = s.info.jpeg_color_space == JCS_CMYK || s.info.jpeg_color_space == JCS_YCCK;
    const bool started = s.errors.guarded([&s, inks, denominator] {
        s.info.out_color_space = inks ? JCS_CMYK : bitmapColours;
        s.info.scale_num = 1;
        s.info.scale_denom = static_cast<unsigned>(denominator);
        s.info.dct_method = JDCT_ISLOW;
        jpeg_start_decompress(&s.info);
    });
    if (!started)
        return s.failure();

    const int width = static_cast<int>(s.info.output_width);
    QImage image(width, static_cast<int>(s.info.output_height), QImage::Format_RGB32);
    if (image.isNull())
        return pictureFailure(s.input.path(), Failure::Kind::TooLarge, QStringLiteral("memory is short"));
    std::vector<unsigned char> inkLine(inks ? static_cast<std::size_t>(width) * 4 : 0);
    for (int y = 0; y < image.height(); ++y) {
        auto* line = image.scanLine(y);
        JSAMPROW target = inks ? inkLine.data() : line;
        if (!s.errors.guarded([&s, &target] { jpeg_read_scanlines(&s.info, &target, 1); }))
            return s.failure();
        if (inks)
            convertInks(inkLine.data(), reinterpret_cast<QRgb*>(line), width, s.info.saw_Adobe_marker != FALSE);
    }
    if (!s.errors.guarded([&s] { jpeg_finish_decompress(&s.info); }))
        return s.failure();
    return Bitmap(std::move(image));
}

} // namespace lumora
