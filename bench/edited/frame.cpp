// edited_frame FOLDER: the frame that every program here lays over its print, in FOLDER/bench.
#include <QDir>
#include <QImage>

using namespace Qt::StringLiterals;

int main(int argc, char** argv) {
    if (argc != 2)
        return 2;
    const QString folder = QString::fromLocal8Bit(argv[1]) + u"/bench/"_s;
    QImage frame(900, 600, QImage::Format_RGB32);
    frame.fill(Qt::black);
    QImage clear(frame.size(), QImage::Format_ARGB32);
    clear.fill(Qt::transparent);
    for (int y = 0; y < 600; ++y) {
        for (int x = 0; x < 900; ++x) {
            const int edge = std::min(std::min(x, 899 - x), std::min(y, 599 - y));
            if (edge < 45 - (x / 30 % 2) * 12) {
                frame.setPixel(x, y, qRgb(40 + edge * 4, 90, 160 - edge * 2));
                clear.setPixel(x, y, frame.pixel(x, y));
            }
        }
    }
    return QDir().mkpath(folder) && frame.save(folder + u"f.bmp"_s) && frame.save(folder + u"kf.bmp"_s) &&
                   clear.save(folder + u"f.png"_s)
               ? 0
               : 1;
}
