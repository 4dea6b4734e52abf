// INTER_AREA to the drawn size, then a bicubic warp, on one thread.
#include "Job.h"

#include <opencv2/imgcodecs.hpp>
#include <opencv2/imgproc.hpp>

namespace {

void layFrame(cv::Mat& paper, const cv::Mat& frame) {
    cv::Mat sums;
    cv::transform(frame, sums, cv::Matx13f(11, 11, 11));
    cv::Mat layers[] = {frame, sums};
    cv::Mat withAlpha;
    cv::merge(layers, 2, withAlpha);
    cv::resize(withAlpha, withAlpha, paper.size(), 0, 0, cv::INTER_CUBIC);
    for (int y = 0; y < paper.rows; ++y) {
        auto* under = paper.ptr<unsigned char>(y);
        const auto* over = withAlpha.ptr<unsigned char>(y);
        for (int x = 0; x < paper.cols; ++x, under += 3, over += 4) {
            for (int i = 0; i < 3; ++i)
                under[i] = static_cast<unsigned char>((under[i] * (255 - over[3]) + over[i] * over[3] + 127) / 255);
        }
    }
}

} // namespace

int main(int argc, char** argv) {
    cv::setNumThreads(1);
    const Job job = Job::of(argc, argv);
    for (const auto& file : job.files) {
        const cv::Mat whole = cv::imread(file.string(), cv::IMREAD_COLOR | cv::IMREAD_IGNORE_ORIENTATION);
        if (whole.empty())
            return 1;
        cv::Mat picture;
        cv::resize(whole, picture, cv::Size(job.width(), job.height()), 0, 0, cv::INTER_AREA);
        cv::Mat paper(Job::paperHeight, Job::paperWidth, CV_8UC3);
        if (!job.covers())
            cv::resize(picture, paper, paper.size(), 0, 0, cv::INTER_AREA);
        if (!job.pixelsOnly)
            cv::transform(picture, picture,
                          cv::Matx33f(Job::blue, Job::cross, Job::cross, Job::cross, Job::green, Job::cross, Job::cross,
                                      Job::cross, Job::red));
        const double angle = Job::degrees * CV_PI / 180;
        const double c = std::cos(angle);
        const double s = std::sin(angle);
        // From pixel centre to pixel centre.
        const double x = 0.5 - job.width() / 2;
        const double y = 0.5 - job.height() / 2;
        const cv::Matx23d turn(c, -s, Job::paperWidth / 2 - 0.5 + c * x - s * y, s, c,
                               Job::paperHeight / 2 - 0.5 + s * x + c * y);
        cv::warpAffine(picture, paper, turn, paper.size(), cv::INTER_CUBIC, cv::BORDER_TRANSPARENT);
        if (!job.pixelsOnly) {
            layFrame(paper, cv::imread((job.frames / "f.bmp").string(), cv::IMREAD_COLOR));
            const auto write = [&](int by, const cv::Scalar& colour) {
                cv::putText(paper, Job::caption, {Job::captionX + by, Job::captionY + by}, cv::FONT_HERSHEY_COMPLEX,
                            2.6, colour, 5, cv::LINE_AA);
            };
            write(7, {40, 40, 40});
            write(0, {0, 255, 255});
        }
        std::vector<int> options;
        if (!job.pixelsOnly)
            options = {cv::IMWRITE_JPEG_QUALITY, Job::quality};
        if (!cv::imwrite(job.target(file).string(), paper, options))
            return 1;
    }
    return 0;
}
