// peer_zimg WIDTH_LANDSCAPE WIDTH_PORTRAIT FOLDER FILE...: libjpeg's planes, zimg's bicubic (a = -0.5) between, 4:2:0
// only.
#include <zimg++.hpp>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <memory>
#include <vector>

#include <jpeglib.h>

namespace {

struct Planes {
    int width = 0;
    int height = 0;
    int stride[3] = {};
    std::unique_ptr<unsigned char, decltype(&std::free)> data[3] = {
        {nullptr, std::free}, {nullptr, std::free}, {nullptr, std::free}};

    Planes(int w, int h)
        : width(w)
        , height(h) {
        for (int i = 0; i < 3; ++i) {
            const int shift = i == 0 ? 0 : 1;
            stride[i] = ((w >> shift) + 63 + 64) / 64 * 64;
            const std::size_t rows = static_cast<std::size_t>((h >> shift) + 32);
            data[i].reset(
                static_cast<unsigned char*>(std::aligned_alloc(64, rows * static_cast<std::size_t>(stride[i]))));
        }
    }
    unsigned char* row(int plane, int y) { return data[plane].get() + static_cast<std::ptrdiff_t>(y) * stride[plane]; }
};

template <class Step>
void inSteps(Planes& planes, int lines, Step step) {
    for (int top = 0; top < lines; top += 16) {
        JSAMPROW rows[3][16];
        JSAMPARRAY starts[3];
        for (int i = 0; i < 3; ++i) {
            const int shift = i == 0 ? 0 : 1;
            for (int y = 0; y < (16 >> shift); ++y)
                rows[i][y] = planes.row(i, (top >> shift) + y);
            starts[i] = rows[i];
        }
        step(starts);
    }
}

Planes decode(const char* file) {
    jpeg_decompress_struct info{};
    jpeg_error_mgr errors{};
    info.err = jpeg_std_error(&errors);
    jpeg_create_decompress(&info);
    std::FILE* in = std::fopen(file, "rb");
    if (in == nullptr)
        std::exit(1);
    jpeg_stdio_src(&info, in);
    jpeg_read_header(&info, TRUE);
    info.raw_data_out = TRUE;
    info.do_fancy_upsampling = FALSE;
    info.dct_method = JDCT_ISLOW;
    info.out_color_space = JCS_YCbCr;
    jpeg_start_decompress(&info);
    if (info.num_components != 3 || info.comp_info[0].h_samp_factor != 2 || info.comp_info[0].v_samp_factor != 2)
        std::exit(1);
    Planes planes(static_cast<int>(info.output_width), static_cast<int>(info.output_height));
    inSteps(planes, planes.height, [&](JSAMPARRAY* starts) { jpeg_read_raw_data(&info, starts, 16); });
    jpeg_finish_decompress(&info);
    jpeg_destroy_decompress(&info);
    std::fclose(in);
    return planes;
}

void encode(Planes& planes, const char* file) {
    jpeg_compress_struct info{};
    jpeg_error_mgr errors{};
    info.err = jpeg_std_error(&errors);
    jpeg_create_compress(&info);
    std::FILE* out = std::fopen(file, "wb");
    if (out == nullptr)
        std::exit(1);
    jpeg_stdio_dest(&info, out);
    info.image_width = static_cast<JDIMENSION>(planes.width);
    info.image_height = static_cast<JDIMENSION>(planes.height);
    info.input_components = 3;
    info.in_color_space = JCS_YCbCr;
    jpeg_set_defaults(&info);
    jpeg_set_quality(&info, 90, TRUE);
    info.raw_data_in = TRUE;
    info.dct_method = JDCT_ISLOW;
    jpeg_start_compress(&info, TRUE);
    inSteps(planes, planes.height, [&](JSAMPARRAY* starts) { jpeg_write_raw_data(&info, starts, 16); });
    jpeg_finish_compress(&info);
    jpeg_destroy_compress(&info);
    std::fclose(out);
}

zimgxx::zimage_format format(const Planes& planes) {
    zimgxx::zimage_format format;
    format.width = static_cast<unsigned>(planes.width);
    format.height = static_cast<unsigned>(planes.height);
    format.pixel_type = ZIMG_PIXEL_BYTE;
    format.subsample_w = 1;
    format.subsample_h = 1;
    format.color_family = ZIMG_COLOR_YUV;
    format.matrix_coefficients = ZIMG_MATRIX_BT470_BG;
    format.pixel_range = ZIMG_RANGE_FULL;
    format.chroma_location = ZIMG_CHROMA_CENTER;
    return format;
}

} // namespace

int main(int argc, char** argv) try {
    for (int i = 4; i < argc; ++i) {
        Planes source = decode(argv[i]);
        const int width = std::atoi(source.height >= source.width ? argv[2] : argv[1]);
        Planes target(width, static_cast<int>(std::lround(static_cast<double>(source.height) * width / source.width)));
        zimgxx::zfilter_graph_builder_params parameters;
        parameters.resample_filter = ZIMG_RESIZE_BICUBIC;
        parameters.filter_param_a = 0;
        parameters.filter_param_b = 0.5;
        parameters.resample_filter_uv = ZIMG_RESIZE_BICUBIC;
        parameters.filter_param_a_uv = 0;
        parameters.filter_param_b_uv = 0.5;
        parameters.cpu_type = ZIMG_CPU_AUTO_64B;
        const auto graph = zimgxx::FilterGraph::build(format(source), format(target), &parameters);
        std::unique_ptr<void, decltype(&std::free)> room(std::aligned_alloc(64, (graph.get_tmp_size() + 63) / 64 * 64),
                                                         std::free);
        zimgxx::zimage_buffer_const from;
        zimgxx::zimage_buffer to;
        for (unsigned plane = 0; plane < 3; ++plane) {
            from.data(plane) = source.data[plane].get();
            from.stride(plane) = source.stride[plane];
            from.mask(plane) = ZIMG_BUFFER_MAX;
            to.data(plane) = target.data[plane].get();
            to.stride(plane) = target.stride[plane];
            to.mask(plane) = ZIMG_BUFFER_MAX;
        }
        graph.process(from, to, room.get());
        encode(target, (std::filesystem::path(argv[3]) / std::filesystem::path(argv[i]).filename()).c_str());
    }
    return argc > 4 ? 0 : 2;
} catch (const zimgxx::zerror& error) {
    std::fprintf(stderr, "%s\n", error.msg);
    return 1;
}
