#include "imaging/JpegWriter.h"

#include "imaging/JpegErrors.h"

#include <QPainter>

#include <algorithm>
#include <array>
#include <memory>

namespace lumora {

namespace {

constexpr J_COLOR_SPACE bitmapColours = Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? JCS_EXT_BGRX : JCS_EXT_XRGB;

class Writer {
public:
    Writer() {
        m_target.init_destination = [](j_compress_ptr) {};
        m_target.empty_output_buffer = [](j_compress_ptr info) {
            auto* writer = static_cast<Writer*>(info->client_data);
            writer->m_bytes.append(reinterpret_cast<const char*>(writer->m_buffer.data()),
                                   static_cast<qsizetype>(writer->m_buffer.size()));
            writer->rewind();
            return boolean{TRUE};
        };
        m_target.term_destination = [](j_compress_ptr info) {
            auto* writer = static_cast<Writer*>(info->client_data);
            writer->m_bytes.append(reinterpret_cast<const char*>(writer->m_buffer.data()),
                                   static_cast<qsizetype>(writer->m_buffer.size() - writer->m_target.free_in_buffer));
        };
        rewind();
    }
    ~Writer() {
        if (m_created)
            jpeg_destroy_compress(&m_info);
    }
    Writer(const Writer&) = delete;
    Writer& operator=(const Writer&) = delete;

    bool begin(int width, int height, J_COLOR_SPACE input, int quality) {
        m_info.err = m_errors.install();
        return m_errors.guarded([&] {
            jpeg_create_compress(&m_info);
            m_created = true;
            m_info.client_data = this;
            m_info.dest = &m_target;
            m_info.image_width = static_cast<JDIMENSION>(width);
            m_info.image_height = static_cast<JDIMENSION>(height);
            m_info.in_color_space = input;
            m_info.input_components = input == JCS_YCbCr ? 3 : 4;
            jpeg_set_defaults(&m_info);
            jpeg_set_quality(&m_info, std::clamp(quality, 0, 100), TRUE);
            m_info.dct_method = JDCT_ISLOW;
            jpeg_start_compress(&m_info, TRUE);
        });
    }

    bool line(const uchar* pixels) {
        auto* row = const_cast<JSAMPROW>(pixels);
        return m_errors.guarded([&] { jpeg_write_scanlines(&m_info, &row, 1); });
    }

    bool finish() {
        return m_errors.guarded([&] { jpeg_finish_compress(&m_info); });
    }

    QByteArray takeBytes() { return std::move(m_bytes); }
    Failure failure() const { return {Failure::Kind::Other, QStringLiteral("JPEG writer: ") + m_errors.text}; }

private:
    void rewind() {
        m_target.next_output_byte = m_buffer.data();
        m_target.free_in_buffer = m_buffer.size();
    }

    JpegErrors m_errors;
    jpeg_destination_mgr m_target{};
    jpeg_compress_struct m_info{};
    bool m_created = false;
    QByteArray m_bytes;
    std::array<JOCTET, 65536> m_buffer;
};

} // namespace

Result<QByteArray> writeJpeg(const Bitmap& picture, int quality) {
    if (picture.isNull())
        return Failure{Failure::Kind::Other, QStringLiteral("JPEG writer: the picture has no pixels")};
    QImage opaque = picture.image();
    if (opaque.hasAlphaChannel()) {
        opaque = QImage(picture.width(), picture.height(), QImage::Format_RGB32);
        opaque.fill(Qt::white);
        QPainter(&opaque).drawImage(0, 0, picture.image());
    }
    opaque.convertTo(QImage::Format_RGB32);

    auto writer = std::make_unique<Writer>();
    bool ok = writer->begin(opaque.width(), opaque.height(), bitmapColours, quality);
    for (int y = 0; ok && y < opaque.height(); ++y)
        ok = writer->line(opaque.constScanLine(y));
    if (!ok || !writer->finish())
        return writer->failure();
    return writer->takeBytes();
}

} // namespace lumora
