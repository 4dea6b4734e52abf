// Qt's own reader, smooth scaling to the drawn size, its painter's turned draw and its writer.
#include "Job.h"

#include <QGuiApplication>
#include <QImage>
#include <QPainter>

#include <algorithm>

using namespace Qt::StringLiterals;

namespace {

void tone(QImage& picture) {
    const auto floored = [](double value) { return std::clamp(static_cast<int>(value), 0, 255); };
    for (int y = 0; y < picture.height(); ++y) {
        auto* row = reinterpret_cast<QRgb*>(picture.scanLine(y));
        for (int x = 0; x < picture.width(); ++x) {
            const double r = qRed(row[x]);
            const double g = qGreen(row[x]);
            const double b = qBlue(row[x]);
            row[x] = qRgb(floored(r * Job::red + (g + b) * Job::cross), floored(g * Job::green + (r + b) * Job::cross),
                          floored(b * Job::blue + (r + g) * Job::cross));
        }
    }
}

QImage keyed(QImage frame) {
    frame = frame.convertToFormat(QImage::Format_ARGB32);
    for (int y = 0; y < frame.height(); ++y) {
        auto* row = reinterpret_cast<QRgb*>(frame.scanLine(y));
        for (int x = 0; x < frame.width(); ++x)
            row[x] = qRgba(qRed(row[x]), qGreen(row[x]), qBlue(row[x]),
                           std::min(255, 11 * (qRed(row[x]) + qGreen(row[x]) + qBlue(row[x]))));
    }
    return frame.convertToFormat(QImage::Format_ARGB32_Premultiplied);
}

} // namespace

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    const Job job = Job::of(argc, argv);
    for (const auto& file : job.files) {
        const QImage whole(QString::fromStdString(file.string()));
        QImage picture = whole.scaled(job.width(), job.height(), Qt::IgnoreAspectRatio, Qt::SmoothTransformation)
                             .convertToFormat(QImage::Format_RGB32);
        QImage paper = job.covers() ? QImage(Job::paperWidth, Job::paperHeight, QImage::Format_RGB32)
                                    : picture.scaled(Job::paperWidth, Job::paperHeight, Qt::IgnoreAspectRatio,
                                                     Qt::SmoothTransformation);
        if (!job.pixelsOnly)
            tone(picture);
        QPainter painter(&paper);
        painter.setRenderHints(QPainter::SmoothPixmapTransform | QPainter::Antialiasing);
        painter.translate(Job::paperWidth / 2, Job::paperHeight / 2);
        painter.rotate(Job::degrees);
        painter.drawImage(QPointF(-(job.width() / 2), -(job.height() / 2)), picture);
        painter.resetTransform();
        if (!job.pixelsOnly) {
            const QImage frame = keyed(QImage(QString::fromStdString((job.frames / "f.bmp").string())));
            painter.drawImage(
                0, 0, frame.scaled(Job::paperWidth, Job::paperHeight, Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
            QFont font(u"DejaVu Sans"_s);
            font.setPixelSize(Job::captionSize);
            painter.setFont(font);
            painter.setPen(QColor(40, 40, 40, 180));
            painter.drawText(Job::captionX + 7, Job::captionY + 7, QString::fromLatin1(Job::caption));
            painter.setPen(Qt::yellow);
            painter.drawText(Job::captionX, Job::captionY, QString::fromLatin1(Job::caption));
        }
        painter.end();
        if (!paper.save(QString::fromStdString(job.target(file).string()), job.pixelsOnly ? "PNG" : "JPG",
                        job.pixelsOnly ? 100 : Job::quality))
            return 1;
    }
    return 0;
}
