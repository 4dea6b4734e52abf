// peer_qt WIDTH_LANDSCAPE WIDTH_PORTRAIT FOLDER FILE...: Qt's own reader, smooth scaling and writer, quality 90.
#include <QFileInfo>
#include <QImage>

#include <cmath>
#include <cstdlib>

int main(int argc, char** argv) {
    for (int i = 4; i < argc; ++i) {
        const QImage image(QString::fromLocal8Bit(argv[i]));
        const int width = std::atoi(image.height() >= image.width() ? argv[2] : argv[1]);
        const int height = static_cast<int>(std::lround(static_cast<double>(image.height()) * width / image.width()));
        const QImage scaled = image.scaled(width, height, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
        if (!scaled.save(QString::fromLocal8Bit(argv[3]) + u'/' + QFileInfo(QString::fromLocal8Bit(argv[i])).fileName(),
                         "JPG", 90))
            return 1;
    }
    return argc > 4 ? 0 : 2;
}
