#include "editing/redeye/RedEye.h"

#include <QSet>

#include <algorithm>
#include <cmath>

namespace lumora::RedEye {

using namespace Qt::StringLiterals;

namespace {

bool inside(const Bitmap& picture, int x, int y) {
    return x >= 0 && y >= 0 && x < picture.width() && y < picture.height();
}

QRgb greyOf(QRgb pixel) {
    const int level = brightness(pixel);
    return qRgb(level, level, level);
}

void search(const Bitmap& picture, QPoint centre, Peak& held) {
    constexpr int reach = 60;
    const int top = std::max(0, centre.y() - reach);
    const int bottom = std::min(picture.height() - 1, centre.y() + reach);
    const int left = std::max(0, centre.x() - reach);
    const int right = std::min(picture.width() - 1, centre.x() + reach);
    for (int y = top; y <= bottom; ++y) {
        const auto* row = reinterpret_cast<const QRgb*>(picture.image().constScanLine(y));
        for (int x = left; x <= right; ++x) {
            if (const int value = redness(row[x]); value > held.redness)
                held = {value, x, y, std::max(1, brightness(row[x]))};
        }
    }
}

QPoint parsed(const QString& item) {
    const qsizetype at = item.indexOf(u'^');
    return {item.left(at).toInt(), item.mid(at + 1).toInt()};
}

} // namespace

int redness(QRgb pixel) {
    return 2 * qRed(pixel) - qGreen(pixel) - qBlue(pixel);
}

int brightness(QRgb pixel) {
    return (222 * qRed(pixel) + 707 * qGreen(pixel) + 71 * qBlue(pixel)) / 1000;
}

Peak findPeak(const Bitmap& picture, QPoint centre) {
    Peak held{0, centre.x(), centre.y(), 1};
    search(picture, centre, held);
    search(picture, {held.x, held.y}, held);
    return held;
}

QStringList correct(Bitmap& picture, QRect square, double ratio, int level) {
    const double threshold = ratio * 7 - level;
    QStringList changed;
    for (int x = 0; x < square.width(); ++x) {
        for (int y = 0; y < square.height(); ++y) {
            const int atX = square.left() + x;
            const int atY = square.top() + y;
            if (!inside(picture, atX, atY))
                continue;
            const QRgb pixel = picture.image().pixel(atX, atY);
            if (threshold < redness(pixel) - brightness(pixel)) {
                picture.image().setPixel(atX, atY, greyOf(pixel));
                changed += u"%1^%2"_s.arg(x).arg(y);
            }
        }
    }
    return changed;
}

void darken(Bitmap& picture, QRect square, const QStringList& pixels) {
    constexpr int step = 5;
    const auto darker = [](int channel) { return channel > step ? channel - step : channel; };
    for (const QString& item : pixels) {
        const QPoint at = square.topLeft() + parsed(item);
        if (!inside(picture, at.x(), at.y()))
            continue;
        const QRgb pixel = picture.image().pixel(at);
        picture.image().setPixel(at, qRgb(darker(qRed(pixel)), darker(qGreen(pixel)), darker(qBlue(pixel))));
    }
}

QStringList withoutRepeats(const QStringList& pixels) {
    QSet<QString> seen;
    QStringList once;
    for (const QString& item : pixels) {
        if (!seen.contains(item)) {
            seen.insert(item);
            once += item;
        }
    }
    return once;
}

PatchStats patchStats(const Bitmap& patch) {
    constexpr int faintest = 20;
    PatchStats stats;
    double rednessSum = 0;
    double brightnessSum = 0;
    int count = 1;
    for (int y = 1; y < patch.height(); ++y) {
        for (int x = 1; x < patch.width(); ++x) {
            const QRgb pixel = patch.image().pixel(x, y);
            const int value = redness(pixel);
            if (value > faintest) {
                rednessSum += value;
                brightnessSum += brightness(pixel);
                ++count;
            }
            if (value > stats.peak.redness)
                stats.peak = {value, x, y, std::max(1, brightness(pixel))};
        }
    }
    stats.averageRedness = rednessSum / count;
    stats.averageBrightness = brightnessSum / count;
    return stats;
}

void fixAround(Bitmap& patch, QPoint centre, const Peak& peak) {
    // 460 steps of a sixtieth of a radian: a little more than a full turn, so that the circle closes.
    constexpr int steps = 460;
    for (int radius = 0; radius <= patch.height() / 2; ++radius) {
        for (int step = 1; step <= steps; ++step) {
            const double angle = step / 60.0;
            const double dx = std::cos(angle) * radius;
            const double dy = std::sin(angle) * radius;
            const auto point = [&](int x, int y) {
                return QPoint(static_cast<int>(std::nearbyint(dx + x)), static_cast<int>(std::nearbyint(dy + y)));
            };
            const QPoint looked = point(centre.x(), centre.y());
            const QPoint set = point(peak.x, peak.y);
            if (!inside(patch, looked.x(), looked.y()) || !inside(patch, set.x(), set.y()))
                continue;
            if (redness(patch.image().pixel(looked)) > peak.redness * 0.75)
                patch.image().setPixel(set, greyOf(patch.image().pixel(set)));
        }
    }
}

} // namespace lumora::RedEye
