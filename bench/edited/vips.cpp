// libvips: thumbnail to the drawn size, a bicubic affine draw, composite. The few calls are declared here by hand,
// since the package with the headers brings a hundred others along and the library alone comes with libvips-tools.
#include "Job.h"

struct VipsImage;
struct VipsInterpolate;
struct VipsArrayInt;

extern "C" {
int vips_init(const char* name);
void vips_concurrency_set(int threads);
void vips_error_exit(const char* format, ...);
int vips_thumbnail(const char* file, VipsImage** out, int width, ...);
int vips_affine(VipsImage* in, VipsImage** out, double a, double b, double c, double d, ...);
int vips_recomb(VipsImage* in, VipsImage** out, VipsImage* matrix, ...);
int vips_cast(VipsImage* in, VipsImage** out, int format, ...);
int vips_resize(VipsImage* in, VipsImage** out, double scale, ...);
int vips_addalpha(VipsImage* in, VipsImage** out, ...);
int vips_composite2(VipsImage* base, VipsImage* overlay, VipsImage** out, int mode, ...);
int vips_text(VipsImage** out, const char* text, ...);
int vips_linear(VipsImage* in, VipsImage** out, const double* a, const double* b, int count, ...);
int vips_bandjoin2(VipsImage* a, VipsImage* b, VipsImage** out, ...);
int vips_copy(VipsImage* in, VipsImage** out, ...);
int vips_image_write_to_file(VipsImage* image, const char* name, ...);
VipsImage* vips_image_new_from_file(const char* name, ...);
VipsImage* vips_image_new_matrixv(int width, int height, ...);
VipsImage* vips_image_copy_memory(VipsImage* image);
VipsInterpolate* vips_interpolate_new(const char* name);
VipsArrayInt* vips_array_int_newv(int count, ...);
int vips_image_get_width(const VipsImage* image);
int vips_image_get_height(const VipsImage* image);
}

namespace {

constexpr int over = 2;   // VIPS_BLEND_MODE_OVER
constexpr int uchars = 0; // VIPS_FORMAT_UCHAR
constexpr int force = 3;  // VIPS_SIZE_FORCE
constexpr int srgb = 22;  // VIPS_INTERPRETATION_sRGB
const void* const end = nullptr;

void check(int failed) {
    if (failed != 0)
        vips_error_exit(nullptr);
}

VipsImage* letters(double r, double g, double b, double opacity) {
    VipsImage* mask = nullptr;
    check(vips_text(&mask, Job::caption, "font", "DejaVu Sans", "width", 620, "height", 90, end));
    const double none[] = {0, 0, 0};
    const double colour[] = {r, g, b};
    VipsImage* filled = nullptr;
    check(vips_linear(mask, &filled, none, colour, 3, "uchar", 1, end));
    VipsImage* tagged = nullptr;
    check(vips_copy(filled, &tagged, "interpretation", srgb, end));
    VipsImage* alpha = nullptr;
    const double zero = 0;
    check(vips_linear(mask, &alpha, &opacity, &zero, 1, "uchar", 1, end));
    VipsImage* both = nullptr;
    check(vips_bandjoin2(tagged, alpha, &both, end));
    return both;
}

} // namespace

int main(int argc, char** argv) {
    const Job job = Job::of(argc, argv);
    check(vips_init(argv[0]));
    vips_concurrency_set(1);
    for (const auto& file : job.files) {
        VipsImage* scaled = nullptr;
        check(vips_thumbnail(file.c_str(), &scaled, job.width(), "height", job.height(), "size", force, "no_rotate", 1,
                             end));
        VipsImage* picture = vips_image_copy_memory(scaled); // it is read twice, and not in order
        VipsImage* paper = nullptr;
        VipsImage* toned = picture;
        if (!job.pixelsOnly) {
            VipsImage* matrix = vips_image_new_matrixv(3, 3, Job::red, Job::cross, Job::cross, Job::cross, Job::green,
                                                       Job::cross, Job::cross, Job::cross, Job::blue);
            VipsImage* exact = nullptr;
            check(vips_recomb(picture, &exact, matrix, end));
            check(vips_cast(exact, &toned, uchars, end));
        }
        VipsImage* drawn = toned;
        if (!job.covers())
            check(vips_addalpha(toned, &drawn, end));
        const double angle = Job::degrees * 3.14159265358979323846 / 180;
        const double c = std::cos(angle);
        const double s = std::sin(angle);
        VipsImage* turned = nullptr;
        check(vips_affine(drawn, &turned, c, -s, s, c, "interpolate", vips_interpolate_new("bicubic"), "oarea",
                          vips_array_int_newv(4, 0, 0, Job::paperWidth, Job::paperHeight), "idx",
                          -double(job.width() / 2), "idy", -double(job.height() / 2), "odx", Job::paperWidth / 2.0,
                          "ody", Job::paperHeight / 2.0, end));
        paper = turned;
        if (!job.covers()) {
            VipsImage* stretched = nullptr;
            check(vips_resize(picture, &stretched, double(Job::paperWidth) / job.width(), "vscale",
                              double(Job::paperHeight) / job.height(), end));
            check(vips_composite2(stretched, turned, &paper, over, end));
        }
        if (!job.pixelsOnly) {
            VipsImage* frame = vips_image_new_from_file((job.frames / "f.png").c_str(), end);
            if (frame == nullptr)
                return 1;
            VipsImage* wide = nullptr;
            check(vips_resize(frame, &wide, double(Job::paperWidth) / vips_image_get_width(frame), "vscale",
                              double(Job::paperHeight) / vips_image_get_height(frame), end));
            VipsImage* framed = nullptr;
            check(vips_composite2(paper, wide, &framed, over, end));
            VipsImage* shaded = nullptr;
            check(vips_composite2(framed, letters(40, 40, 40, 0.7), &shaded, over, "x", Job::captionX + 7, "y",
                                  Job::captionY - 53, end));
            check(vips_composite2(shaded, letters(255, 255, 0, 1), &paper, over, "x", Job::captionX, "y",
                                  Job::captionY - 60, end));
        }
        const std::string target = job.target(file).string();
        if (job.pixelsOnly)
            check(vips_image_write_to_file(paper, target.c_str(), end));
        else
            check(vips_image_write_to_file(paper, target.c_str(), "Q", Job::quality, "subsample_mode", 1, end));
    }
    return 0;
}
