#include "imaging/files/JpegWriter.h"

#include "imaging/files/JpegErrors.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

struct JpegWriter::State {
    State() {
        target.init_destination = [](j_compress_ptr) {};
        target.empty_output_buffer = [](j_compress_ptr compress) {
            static_cast<State*>(compress->client_data)->take(bufferSize);
            return boolean{TRUE};
        };
        target.term_destination = [](j_compress_ptr compress) {
            auto* state = static_cast<State*>(compress->client_data);
            state->take(bufferSize - state->target.free_in_buffer);
        };
    }
    ~State() {
        if (created)
            jpeg_destroy_compress(&info);
    }
    State(const State&) = delete;
    State& operator=(const State&) = delete;

    void take(std::size_t count) {
        bytes.append(reinterpret_cast<const char*>(buffer.data()), static_cast<qsizetype>(count));
        target.next_output_byte = buffer.data();
        target.free_in_buffer = bufferSize;
    }

    template <class Calls>
    void run(const Calls& calls) {
        ok = ok && errors.guarded(calls);
    }

    static constexpr std::size_t bufferSize = 65536;
    JpegErrors errors;
    jpeg_destination_mgr target{};
    jpeg_compress_struct info{};
    bool created = false;
    bool ok = true;
    QByteArray bytes;
    std::array<JOCTET, bufferSize> buffer;
};

JpegWriter::JpegWriter(PictureSize size, int quality, Input input)
    : m_state(std::make_unique<State>()) {
    State& s = *m_state;
    s.info.err = s.errors.install();
    s.run([&s, size, quality, input] {
        jpeg_create_compress(&s.info);
        s.created = true;
        s.info.client_data = &s;
        s.info.dest = &s.target;
        s.target.next_output_byte = s.buffer.data();
        s.target.free_in_buffer = State::bufferSize;
        s.info.image_width = static_cast<JDIMENSION>(size.width);
        s.info.image_height = static_cast<JDIMENSION>(size.height);
        s.info.in_color_space = input == Input::Planes ? JCS_YCbCr : bitmapColours;
        s.info.input_components = input == Input::Planes ? 3 : 4;
        jpeg_set_defaults(&s.info);
        jpeg_set_quality(&s.info, std::clamp(quality, 0, 100), TRUE);
        s.info.dct_method = JDCT_ISLOW;
        s.info.raw_data_in = input == Input::Planes ? TRUE : FALSE;
        jpeg_start_compress(&s.info, TRUE);
    });
}

JpegWriter::~JpegWriter() = default;

void JpegWriter::line(const unsigned char* pixels) {
    State& s = *m_state;
    auto* row = const_cast<JSAMPROW>(pixels);
    s.run([&s, &row] { jpeg_write_scanlines(&s.info, &row, 1); });
}

void JpegWriter::planeRows(PlaneRows& rows) {
    State& s = *m_state;
    std::array<JSAMPARRAY, 3> planes{rows.luma.data(), rows.cb.data(), rows.cr.data()};
    s.run([&s, &planes] { jpeg_write_raw_data(&s.info, planes.data(), lumaRows); });
}

Result<QByteArray> JpegWriter::finish() {
    State& s = *m_state;
    s.run([&s] { jpeg_finish_compress(&s.info); });
    if (!s.ok)
        return Failure{Failure::Kind::Other, u"JPEG writer: "_s + s.errors.text};
    return std::move(s.bytes);
}

Result<QByteArray> writeJpeg(const Bitmap& picture, int quality) {
    if (picture.isNull())
        return Failure{Failure::Kind::Other, u"JPEG writer: the picture has no pixels"_s};
    const QImage image = onWhite(picture).image();
    JpegWriter writer({image.width(), image.height()}, quality, JpegWriter::Input::Pixels);
    for (int y = 0; y < image.height(); ++y)
        writer.line(image.constScanLine(y));
    return writer.finish();
}

} // namespace lumora
