#include "imaging/files/JpegReader.h"

#include "common/HostFile.h"
#include "imaging/drawing/ColourPlanes.h"
#include "imaging/files/JpegErrors.h"

#include <array>
#include <cerrno>
#include <utility>
#include <vector>

#include <jerror.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// A hostile progressive file may have thousands of scans, each over the whole picture; real files have about ten.
constexpr int maxScans = 200;

// Inks to light. Files with the Adobe mark hold the inks inverted, as the light that each ink lets through.
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
        PictureInput* input = nullptr;
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
            return fileFailure(input.path(), u"can't be read"_s, source.readError);
        if (errors.outOfMemory)
            return pictureFailure(input.path(), Failure::Kind::TooLarge, u"memory is short"_s);
        switch (errors.code) {
        case JERR_IMAGE_TOO_BIG:
            return pictureFailure(input.path(), Failure::Kind::TooLarge, u"the picture is too large"_s);
        case JERR_SOF_UNSUPPORTED:
        case JERR_BAD_PRECISION:
        case JERR_CONVERSION_NOTIMPL:
        case JERR_NOTIMPL:
        case JERR_NOT_COMPILED:
        case JERR_ARITH_NOTIMPL:
            return pictureFailure(input.path(), Failure::Kind::Unsupported,
                                  u"a kind of JPEG file that can't be shown (%1)"_s.arg(errors.text));
        default:
            return pictureFailure(input.path(), Failure::Kind::Damaged,
                                  u"the picture is damaged or cut short (%1)"_s.arg(errors.text));
        }
    }

    bool inks() const { return info.jpeg_color_space == JCS_CMYK || info.jpeg_color_space == JCS_YCCK; }

    bool start(int denominator, J_COLOR_SPACE colours) {
        return errors.guarded([&] {
            info.out_color_space = colours;
            info.scale_num = 1;
            info.scale_denom = static_cast<unsigned>(denominator);
            info.dct_method = JDCT_ISLOW;
            jpeg_start_decompress(&info);
        });
    }

    // Reads one row of 32-bit pixels; inkLine is the buffer for a row of inks, empty for other pictures.
    bool readLine(unsigned char* line, std::vector<unsigned char>& inkLine) {
        JSAMPROW target = inkLine.empty() ? line : inkLine.data();
        if (!errors.guarded([&] { jpeg_read_scanlines(&info, &target, 1); }))
            return false;
        if (!inkLine.empty())
            convertInks(inkLine.data(), reinterpret_cast<QRgb*>(line), static_cast<int>(info.output_width),
                        info.saw_Adobe_marker != FALSE);
        return true;
    }

    // Reads to the end of the file, so that a file cut short behind the last row fails too.
    bool finish() {
        return errors.guarded([&] { jpeg_finish_decompress(&info); });
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

Result<std::unique_ptr<JpegReader>> JpegReader::open(PictureInput input, Warnings warnings) {
    auto state = std::make_unique<State>(std::move(input));
    State& s = *state;
    s.info.err = s.errors.install();
    s.errors.warningsPass = warnings == Warnings::Pass;
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
    // A block of 64 pixels takes at least one bit, so a header that claims more pixels than the file can hold is
    // refused before memory is taken. Arithmetic coding has no such bound.
    if (s.info.arith_code == FALSE && width * height / 64 / 8 > s.input.size())
        return pictureFailure(s.input.path(), Failure::Kind::Damaged,
                              u"the file is too short for %1 x %2 pixels"_s.arg(width).arg(height));
    return std::unique_ptr<JpegReader>(new JpegReader(std::move(state)));
}

PictureSize JpegReader::size() const {
    return {static_cast<int>(m_state->info.image_width), static_cast<int>(m_state->info.image_height)};
}

JpegReader::Colours JpegReader::colours() const {
    if (!m_state->inks())
        return Colours::Rgb;
    return m_state->info.saw_Adobe_marker != FALSE ? Colours::InvertedCmyk : Colours::Cmyk;
}

Result<Bitmap> JpegReader::readBitmap(int denominator) {
    return readRows(denominator, false);
}

Result<Bitmap> JpegReader::readStoredInks() {
    return readRows(1, true);
}

Result<Bitmap> JpegReader::readRows(int denominator, bool inksAsStored) {
    State& s = *m_state;
    if (!s.start(denominator, s.inks() ? JCS_CMYK : bitmapColours))
        return s.failure();
    QImage image(static_cast<int>(s.info.output_width), static_cast<int>(s.info.output_height), QImage::Format_RGB32);
    if (image.isNull())
        return pictureFailure(s.input.path(), Failure::Kind::TooLarge, u"memory is short"_s);
    const bool converted = s.inks() && !inksAsStored;
    std::vector<unsigned char> inks(converted ? static_cast<std::size_t>(image.width()) * 4 : 0);
    for (int y = 0; y < image.height(); ++y) {
        if (!s.readLine(image.scanLine(y), inks))
            return s.failure();
    }
    if (!s.finish())
        return s.failure();
    return Bitmap(std::move(image));
}

bool JpegReader::hasPlanes() const {
    return m_state->info.jpeg_color_space == JCS_YCbCr || m_state->info.jpeg_color_space == JCS_GRAYSCALE;
}

std::int64_t JpegReader::heldCoefficients() const {
    State& s = *m_state;
    std::int64_t bytes = 0;
    if (jpeg_has_multiple_scans(&s.info) == FALSE)
        return 0;
    for (int i = 0; i < s.info.num_components; ++i)
        bytes += std::int64_t{s.info.comp_info[i].width_in_blocks} * s.info.comp_info[i].height_in_blocks *
                 std::int64_t{sizeof(JBLOCK)};
    return bytes;
}

Result<void> JpegReader::readPlanes(int denominator, PlaneTaker& taker) {
    State& s = *m_state;
    const bool raw = hasPlanes();
    s.info.raw_data_out = raw ? TRUE : FALSE;
    s.info.do_fancy_upsampling = raw ? FALSE : TRUE;
    if (!s.start(denominator, raw ? s.info.jpeg_color_space : s.inks() ? JCS_CMYK : bitmapColours))
        return s.failure();
    return raw ? readRawPlanes(taker) : readMadePlanes(taker);
}

Result<void> JpegReader::readRawPlanes(PlaneTaker& taker) {
    State& s = *m_state;
    std::vector<PlaneLayout> planes;
    std::vector<std::vector<JSAMPROW>> rows;
    for (int i = 0; i < s.info.num_components; ++i) {
        const jpeg_component_info& component = s.info.comp_info[i];
        // A scaled decode shrinks each component by its own factor, chroma often less than luma.
        const double shrunk = static_cast<double>(DCTSIZE) / component.DCT_scaled_size;
        PlaneLayout plane;
        plane.width = static_cast<int>(component.downsampled_width);
        plane.height = static_cast<int>(component.downsampled_height);
        plane.pitchX = shrunk * s.info.max_h_samp_factor / component.h_samp_factor;
        plane.pitchY = shrunk * s.info.max_v_samp_factor / component.v_samp_factor;
        plane.rowsAtOnce = component.v_samp_factor * component.DCT_scaled_size;
        plane.rowBytes = static_cast<int>(component.width_in_blocks) * component.DCT_scaled_size;
        plane.block = component.DCT_scaled_size;
        plane.meanStep = component.quant_table != nullptr ? component.quant_table->quantval[0] : 0;
        planes.push_back(plane);
        rows.emplace_back(static_cast<std::size_t>(plane.rowsAtOnce));
    }
    taker.begin(planes);

    std::array<JSAMPARRAY, MAX_COMPONENTS> starts{};
    const auto lines = static_cast<JDIMENSION>(s.info.max_v_samp_factor * s.info.min_DCT_scaled_size);
    for (int step = 0; s.info.output_scanline < s.info.output_height; ++step) {
        for (std::size_t i = 0; i < planes.size(); ++i) {
            for (int y = 0; y < planes[i].rowsAtOnce; ++y)
                rows[i][static_cast<std::size_t>(y)] = taker.row(static_cast<int>(i), step * planes[i].rowsAtOnce + y);
            starts[i] = rows[i].data();
        }
        if (!s.errors.guarded([&s, &starts, lines] { jpeg_read_raw_data(&s.info, starts.data(), lines); }))
            return s.failure();
        taker.rowsReady();
    }
    return s.finish() ? Result<void>() : s.failure();
}

Result<void> JpegReader::readMadePlanes(PlaneTaker& taker) {
    State& s = *m_state;
    const int width = static_cast<int>(s.info.output_width);
    const double pitch = static_cast<double>(s.info.scale_denom) / s.info.scale_num;
    taker.begin(std::vector<PlaneLayout>(3, {width, static_cast<int>(s.info.output_height), pitch, pitch, 1, width}));
    std::vector<QRgb> line(static_cast<std::size_t>(width));
    std::vector<unsigned char> inks(s.inks() ? line.size() * 4 : 0);
    for (int y = 0; y < static_cast<int>(s.info.output_height); ++y) {
        if (!s.readLine(reinterpret_cast<unsigned char*>(line.data()), inks))
            return s.failure();
        lumaAndChroma(line.data(), width, taker.row(0, y), taker.row(1, y), taker.row(2, y));
        taker.rowsReady();
    }
    return s.finish() ? Result<void>() : s.failure();
}

} // namespace lumora
