#include "JpegOfKind.h"

#include <QPainter>

#include <cstdio>
#include <cstdlib>
#include <vector>

#include <jpeglib.h>

namespace lumora {

QByteArray jpegOfKind(const Bitmap& picture, const JpegKind& kind) {
    using Colours = JpegKind::Colours;
    const bool inks = kind.colours >= Colours::Inks;
    const bool inverted = kind.colours >= Colours::InvertedInks;
    jpeg_compress_struct info{};
    jpeg_error_mgr errors{};
    info.err = jpeg_std_error(&errors);
    jpeg_create_compress(&info);
    unsigned char* memory = nullptr;
    unsigned long size = 0;
    jpeg_mem_dest(&info, &memory, &size);
    info.image_width = static_cast<JDIMENSION>(picture.width());
    info.image_height = static_cast<JDIMENSION>(picture.height());
    info.input_components = inks ? 4 : 3;
    info.in_color_space = inks ? JCS_CMYK : JCS_RGB;
    jpeg_set_defaults(&info);
    // In the order of Colours.
    constexpr J_COLOR_SPACE stored[] = {JCS_YCbCr, JCS_GRAYSCALE, JCS_RGB, JCS_CMYK, JCS_CMYK, JCS_YCCK};
    jpeg_set_colorspace(&info, stored[static_cast<int>(kind.colours)]);
    if (kind.colours == Colours::Inks)
        info.write_Adobe_marker = FALSE;
    for (int i = 0; i < info.num_components; ++i) {
        info.comp_info[i].h_samp_factor = 1;
        info.comp_info[i].v_samp_factor = 1;
    }
    info.comp_info[0].h_samp_factor = kind.across;
    info.comp_info[0].v_samp_factor = kind.down;
    jpeg_set_quality(&info, kind.quality, TRUE);
    info.restart_in_rows = kind.restartRows;
    if (kind.progressive)
        jpeg_simple_progression(&info);
    jpeg_start_compress(&info, TRUE);
    std::vector<unsigned char> line;
    for (int y = 0; y < picture.height(); ++y) {
        line.clear();
        for (int x = 0; x < picture.width(); ++x) {
            const QRgb c = picture.image().pixel(x, y);
            for (const int light : {qRed(c), qGreen(c), qBlue(c)})
                line.push_back(static_cast<unsigned char>(inks && !inverted ? 255 - light : light));
            if (inks)
                line.push_back(inverted ? 255 : 0);
        }
        JSAMPROW row = line.data();
        jpeg_write_scanlines(&info, &row, 1);
    }
    jpeg_finish_compress(&info);
    QByteArray bytes(reinterpret_cast<const char*>(memory), static_cast<qsizetype>(size));
    jpeg_destroy_compress(&info);
    std::free(memory);
    return bytes;
}

Bitmap testPicture(int width, int height) {
    Bitmap picture(width, height, Qt::white);
    for (int i = 0; i < width * height; ++i) {
        const int x = i % width, y = i / width;
        picture.image().setPixel(x, y, qRgb(40 + 180 * x / width, 60 + 150 * y / height, 200 - 120 * x / width));
    }
    QPainter painter(&picture.image());
    painter.fillRect(width / 4, height / 4, width / 4, height / 3, QColor(220, 200, 40));
    painter.fillRect(width / 2, height / 2, width / 3, height / 8, QColor(30, 40, 60));
    return picture;
}

} // namespace lumora
