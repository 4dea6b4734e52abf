#include "FrameArt.h"

#include "imaging/Bitmap.h"
#include "imaging/drawing/PlacedDraw.h"

#include <QDir>
#include <QGuiApplication>
#include <QLinearGradient>
#include <QPainter>

#include <cstdio>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

// The preview's frame is half as large as the print's.
constexpr QSize previewSize(demo::sheetWidth / 2, demo::sheetHeight / 2);

// What stands for a frame in the list: the frame around a little landscape.
QImage listPicture(const QImage& frame) {
    Bitmap picture(180, 120, QColor(120, 176, 220));
    {
        QPainter painter(&picture.image());
        painter.setRenderHint(QPainter::Antialiasing);
        QLinearGradient sky(0, 0, 0, 80);
        sky.setColorAt(0, QColor(110, 170, 222));
        sky.setColorAt(1, QColor(214, 232, 240));
        painter.fillRect(0, 0, 180, 120, sky);
        painter.setPen(Qt::NoPen);
        painter.setBrush(QColor(250, 220, 130));
        painter.drawEllipse(QPointF(128, 40), 13, 13);
        painter.setBrush(QColor(112, 158, 118));
        painter.drawEllipse(QPointF(50, 150), 110, 78);
        painter.setBrush(QColor(86, 134, 98));
        painter.drawEllipse(QPointF(150, 158), 110, 72);
    }
    drawKeyedFrame(picture, keyedFrame(Bitmap(frame), {picture.width(), picture.height()}));
    return picture.image();
}

bool save(const QImage& image, const QString& path) {
    if (image.save(path))
        return true;
    std::fprintf(stderr, "%s can't be written\n", qUtf8Printable(path));
    return false;
}

} // namespace

// Fills a folder with the frames of the demo lab: a sub-folder a category, in it for each frame "<name>.bmp" for the
// print, "k<name>.bmp" for the preview and "<name>.png" for the list.
int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication application(argc, argv); // a frame has lettering
    if (argc != 2) {
        std::fprintf(stderr, "usage: %s FOLDER\n", argv[0]);
        return 2;
    }
    const QString folder = QString::fromLocal8Bit(argv[1]);
    for (const demo::FrameCategory& category : demo::frameCategories()) {
        const QString inside = folder + u'/' + QString::fromUtf16(category.folder) + u'/';
        if (!QDir().mkpath(inside)) {
            std::fprintf(stderr, "%s can't be made\n", qUtf8Printable(inside));
            return 1;
        }
        for (const demo::FrameArt& art : category.frames) {
            const QString name = QString::fromLatin1(art.name);
            const QImage frame = demo::asFrameFile(art);
            // Each pixel of the preview's frame is one of the print's: a mixture would give the art a dark rim.
            const QImage small = frame.scaled(previewSize, Qt::IgnoreAspectRatio, Qt::FastTransformation);
            if (!save(frame, inside + name + u".bmp"_s) || !save(small, inside + u'k' + name + u".bmp"_s) ||
                !save(listPicture(frame), inside + name + u".png"_s))
                return 1;
        }
    }
    return 0;
}
