// peer_qt WIDTH_LANDSCAPE WIDTH_PORTRAIT FOLDER FILE...: Qt's own reader, smooth scaling and writer, quality 90.
// peer_qt small SIDE FOLDER FILE...: Qt's reader told the size of a cell, and its writer, quality 75.
#include <QFileInfo>
#include <QImage>
#include <QImageReader>

#include <cmath>
#include <cstdlib>
#include <string_view>

namespace {

QString target(const char* folder, const char* source) {
    return QString::fromLocal8Bit(folder) + u'/' + QFileInfo(QString::fromLocal8Bit(source)).fileName();
}

bool saveSmall(const char* source, int side, const QString& target) {
    QImageReader reader(QString::fromLocal8Bit(source));
    reader.setScaledSize(reader.size().scaled(side, side, Qt::KeepAspectRatio));
    return reader.read().save(target, "JPG", 75);
}

} // namespace

int main(int argc, char** argv) {
    for (int i = 4; i < argc; ++i) {
        if (argv[1] == std::string_view("small")) {
            if (!saveSmall(argv[i], std::atoi(argv[2]), target(argv[3], argv[i])))
                return 1;
            continue;
        }
        const QImage image(QString::fromLocal8Bit(argv[i]));
        const int width = std::atoi(image.height() >= image.width() ? argv[2] : argv[1]);
        const int height = static_cast<int>(std::lround(static_cast<double>(image.height()) * width / image.width()));
        const QImage scaled = image.scaled(width, height, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
        if (!scaled.save(target(argv[3], argv[i]), "JPG", 90))
            return 1;
    }
    return argc > 4 ? 0 : 2;
}
