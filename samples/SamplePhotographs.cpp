#include "samples/SamplePhotographs.h"

#include "common/HostFile.h"

#include <QLinearGradient>
#include <QPainter>
#include <QPolygonF>

#include <algorithm>
#include <atomic>
#include <cmath>
#include <cstdint>
#include <optional>
#include <thread>

namespace lumora {

namespace {

std::uint32_t scrambled(std::uint32_t x) {
    x ^= x >> 16;
    x *= 0x7feb352dU;
    x ^= x >> 15;
    x *= 0x846ca68bU;
    x ^= x >> 16;
    return x;
}

class Random {
public:
    explicit Random(std::uint32_t seed)
        : m_state(scrambled(seed + 1) | 1U) {}

    std::uint32_t bits() {
        m_state ^= m_state << 13;
        m_state ^= m_state >> 17;
        m_state ^= m_state << 5;
        return m_state;
    }
    double within(double low, double high) { return low + (high - low) * (bits() / 4294967296.0); }

private:
    std::uint32_t m_state;
};

// Smooth random hills with one random height, -1 to 1, every cell pixels.
class Hills {
public:
    Hills(double cell, std::uint32_t seed, int width)
        : m_cell(cell)
        , m_seed(seed)
        , m_column(static_cast<std::size_t>(width / cell) + 3) {}

    void addRow(int y, float amplitude, std::vector<float>& row) {
        const double position = y / m_cell;
        const auto top = static_cast<std::uint32_t>(position);
        const float f = eased(static_cast<float>(position - top));
        for (std::size_t i = 0; i < m_column.size(); ++i) {
            const auto column = static_cast<std::uint32_t>(i);
            m_column[i] = amplitude * (height(column, top) * (1 - f) + height(column, top + 1) * f);
        }
        const auto step = static_cast<float>(1 / m_cell);
        float at = 0;
        for (float& value : row) {
            const auto i = static_cast<std::size_t>(at);
            const float g = eased(at - static_cast<float>(i));
            value += m_column[i] + (m_column[i + 1] - m_column[i]) * g;
            at += step;
        }
    }

private:
    static float eased(float f) { return f * f * (3 - 2 * f); }
    float height(std::uint32_t x, std::uint32_t y) const {
        return static_cast<float>(static_cast<std::int32_t>(scrambled(x * 0x9e3779b1U ^ scrambled(y + m_seed)))) /
               2147483648.0F;
    }

    double m_cell;
    std::uint32_t m_seed;
    std::vector<float> m_column;
};

void paintScene(QImage& image, Random& random) {
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    const double w = image.width();
    const double h = image.height();
    const auto colour = [&](double low, double high) {
        return QColor::fromHsvF(static_cast<float>(random.within(0, 1)), static_cast<float>(random.within(0.1, 0.7)),
                                static_cast<float>(random.within(low, high)));
    };
    QLinearGradient sky(0, 0, w * random.within(-0.3, 0.3), h * 0.7);
    sky.setColorAt(0, QColor(70, 120, 190));
    sky.setColorAt(1, QColor(225, 215, 200));
    painter.fillRect(image.rect(), sky);
    for (int ridge = 0; ridge < 4; ++ridge) {
        QPolygonF outline;
        const double base = h * (0.4 + 0.15 * ridge);
        double lift = 0;
        for (double x = -20; x <= w + 40; x += w / 60) {
            lift = lift * 0.9 + random.within(-1, 1) * h * 0.02;
            outline << QPointF(x, base + lift);
        }
        outline << QPointF(w, h) << QPointF(0, h);
        painter.setBrush(colour(0.2, 0.65));
        painter.drawPolygon(outline);
    }
    for (int thing = 0; thing < 60; ++thing) {
        const double size = std::min(w, h) * random.within(0.01, 0.12);
        painter.setBrush(colour(0.1, 0.95));
        painter.save();
        painter.translate(random.within(0, w), random.within(h * 0.35, h));
        painter.rotate(random.within(0, 90));
        if (thing % 3 == 0)
            painter.drawRect(QRectF(-size, -size / 2, size * 2, size));
        else
            painter.drawEllipse(QPointF(0, 0), size, size * random.within(0.3, 1));
        painter.restore();
    }
    for (int twig = 0; twig < 120; ++twig) {
        painter.setPen(QPen(colour(0.05, 0.9), std::max(1.0, std::min(w, h) * random.within(0.0004, 0.003))));
        const QPointF from(random.within(0, w), random.within(0, h));
        painter.drawLine(from, from + QPointF(random.within(-0.1, 0.1) * w, random.within(-0.1, 0.1) * h));
    }
}

} // namespace

Bitmap samplePhotograph(PictureSize size, unsigned seed) {
    Bitmap picture(size.width, size.height, Qt::gray);
    Random random(seed);
    paintScene(picture.image(), random);

    const double unit = std::max(1.0, std::min(size.width, size.height) / 3000.0);
    const auto hills = [&](double cell, unsigned salt) {
        return Hills(cell * unit, scrambled(seed * 31 + salt), size.width);
    };
    Hills calm = hills(400, 1);
    Hills shade = hills(700, 2);
    Hills texture[] = {hills(90, 3), hills(29, 4), hills(9, 5), hills(3.3, 6)};
    const float strength[] = {14, 11, 9, 8};
    std::vector<float> mask(static_cast<std::size_t>(size.width));
    std::vector<float> light(mask.size());
    std::vector<float> detail(mask.size());
    int before = 0;
    for (int y = 0; y < size.height; ++y) {
        std::fill(mask.begin(), mask.end(), 0.35F);
        std::fill(light.begin(), light.end(), 0.0F);
        std::fill(detail.begin(), detail.end(), 0.0F);
        calm.addRow(y, 0.9F, mask);
        shade.addRow(y, 30, light);
        for (int i = 0; i < 4; ++i)
            texture[i].addRow(y, strength[i], detail);
        auto* line = reinterpret_cast<QRgb*>(picture.image().scanLine(y));
        for (int x = 0; x < size.width; ++x) {
            const auto i = static_cast<std::size_t>(x);
            const float value = light[i] + detail[i] * std::clamp(mask[i], 0.0F, 1.0F);
            // Noise of one cell of the sensor reaches its neighbour when the colours are made up.
            const std::uint32_t bits = random.bits();
            const int grain = static_cast<int>(bits & 63) + static_cast<int>((bits >> 6) & 63) - 63;
            const int noise = (grain * 3 + before * 2) / 24;
            before = grain;
            const int redNoise = static_cast<int>((bits >> 12) & 15) - 8;
            const int blueNoise = static_cast<int>((bits >> 16) & 15) - 8;
            const int shared = static_cast<int>(value) + noise;
            const QRgb c = line[x];
            line[x] = qRgb(std::clamp(qRed(c) + shared + redNoise / 2, 0, 255), std::clamp(qGreen(c) + shared, 0, 255),
                           std::clamp(qBlue(c) + shared + blueNoise / 2, 0, 255));
        }
    }
    return picture;
}

QByteArray samplePhotographFile(PictureSize size, unsigned seed) {
    auto bytes = encodeJpeg(samplePhotograph(size, seed), 92);
    return bytes ? *bytes : QByteArray();
}

Result<std::vector<std::filesystem::path>> writeSamplePhotographs(const std::filesystem::path& folder, int count,
                                                                  double megapixels) {
    const double side = std::sqrt(megapixels * 1e6);
    const auto even = [](double length) { return std::max(2, static_cast<int>(std::lround(length / 2)) * 2); };
    const PictureSize landscape{even(side * std::sqrt(4 / 3.0)), even(side * std::sqrt(3 / 4.0))};
    const PictureSize shapes[] = {
        landscape, landscape, {landscape.height, landscape.width}, landscape, {even(side), even(side)}};

    std::vector<std::filesystem::path> paths;
    for (int i = 0; i < count; ++i)
        paths.push_back(folder / ("IMG_" + std::to_string(10000 + i + 1).substr(1) + ".jpg"));
    std::vector<std::optional<Failure>> failures(paths.size());
    std::atomic<std::size_t> next{0};
    const auto work = [&] {
        for (std::size_t i = next++; i < paths.size(); i = next++) {
            const auto bytes = encodeJpeg(samplePhotograph(shapes[i % 5], static_cast<unsigned>(i) + 1), 92);
            auto written = bytes ? writeWholeFile(paths[i], *bytes) : Result<void>(bytes.failure());
            if (!written)
                failures[i] = written.failure();
        }
    };
    {
        std::jthread second(work);
        work();
    }
    for (const auto& failure : failures) {
        if (failure)
            return *failure;
    }
    return paths;
}

} // namespace lumora
