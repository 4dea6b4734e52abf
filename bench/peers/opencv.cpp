// peer_opencv WIDTH_LANDSCAPE WIDTH_PORTRAIT FOLDER FILE...: INTER_AREA on one thread, quality 90 (its writer takes
// 4:2:0).
#include <opencv2/imgcodecs.hpp>
#include <opencv2/imgproc.hpp>

#include <cmath>
#include <cstdlib>
#include <filesystem>

int main(int argc, char** argv) {
    cv::setNumThreads(1);
    for (int i = 4; i < argc; ++i) {
        const cv::Mat image = cv::imread(argv[i], cv::IMREAD_COLOR | cv::IMREAD_IGNORE_ORIENTATION);
        if (image.empty())
            return 1;
        const int width = std::atoi(image.rows >= image.cols ? argv[2] : argv[1]);
        const int height = static_cast<int>(std::lround(static_cast<double>(image.rows) * width / image.cols));
        cv::Mat scaled;
        cv::resize(image, scaled, cv::Size(width, height), 0, 0, cv::INTER_AREA);
        const std::filesystem::path target = std::filesystem::path(argv[3]) / std::filesystem::path(argv[i]).filename();
        if (!cv::imwrite(target.string(), scaled, {cv::IMWRITE_JPEG_QUALITY, 90}))
            return 1;
    }
    return argc > 4 ? 0 : 2;
}
