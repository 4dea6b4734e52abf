#include "Sheet.h"

#include <QLinearGradient>
#include <QRadialGradient>

#include <array>
#include <vector>

namespace lumora::demo {

std::uint32_t Dice::bits() {
    m_state ^= m_state << 13;
    m_state ^= m_state >> 17;
    m_state ^= m_state << 5;
    return m_state;
}

float smoothNoise(float x, float y, std::uint32_t seed) {
    const auto left = static_cast<std::int32_t>(std::floor(x));
    const auto top = static_cast<std::int32_t>(std::floor(y));
    const auto height = [&](std::int32_t i, std::int32_t j) {
        std::uint32_t h =
            static_cast<std::uint32_t>(i) * 0x9e3779b1U ^ (static_cast<std::uint32_t>(j) + seed) * 0x85ebca6bU;
        h ^= h >> 15;
        h *= 0x2c1b3c6dU;
        h ^= h >> 13;
        h *= 0x297a2d39U;
        return static_cast<float>(h >> 8) / 16777216.0F;
    };
    float fx = x - static_cast<float>(left), fy = y - static_cast<float>(top);
    fx = fx * fx * (3 - 2 * fx);
    fy = fy * fy * (3 - 2 * fy);
    const float upper = height(left, top) * (1 - fx) + height(left + 1, top) * fx;
    const float lower = height(left, top + 1) * (1 - fx) + height(left + 1, top + 1) * fx;
    return upper * (1 - fy) + lower * fy;
}

float layeredNoise(float x, float y, int octaves, std::uint32_t seed) {
    float sum = 0, part = 0.5F, whole = 0;
    for (int i = 0; i < octaves; ++i) {
        sum += part * smoothNoise(x, y, seed + static_cast<std::uint32_t>(i) * 101);
        whole += part;
        part /= 2;
        // Turned a little, so that the cells of the octaves don't lie on one grid.
        const float turned = 1.6F * x - 1.2F * y;
        y = 1.2F * x + 1.6F * y;
        x = turned;
    }
    return sum / whole;
}

Tint mixed(Tint from, Tint to, float share) {
    const float rest = 1 - share;
    return {from.r * rest + to.r * share, from.g * rest + to.g * share, from.b * rest + to.b * share,
            from.a * rest + to.a * share};
}

QColor mixed(const QColor& from, const QColor& to, double share) {
    const auto part = [share](int a, int b) {
        return std::clamp(static_cast<int>(std::lround(a + (b - a) * share)), 0, 255);
    };
    return {part(from.red(), to.red()), part(from.green(), to.green()), part(from.blue(), to.blue()),
            part(from.alpha(), to.alpha())};
}

QColor withAlpha(QColor colour, double alpha) {
    colour.setAlphaF(static_cast<float>(std::clamp(alpha, 0.0, 1.0)));
    return colour;
}

QPainterPath outline(std::initializer_list<QPointF> curve) {
    const auto* at = curve.begin();
    QPainterPath path(*at++);
    for (; curve.end() - at >= 3; at += 3)
        path.cubicTo(at[0], at[1], at[2]);
    path.closeSubpath();
    return path;
}

QPainterPath polygon(std::initializer_list<QPointF> corners) {
    QPainterPath path;
    path.addPolygon(QPolygonF(QList<QPointF>(corners)));
    path.closeSubpath();
    return path;
}

void airbrush(QPainter& painter, QPointF at, double radiusX, double radiusY, const QColor& colour, double strength,
              double angle) {
    painter.save();
    painter.translate(at);
    painter.rotate(angle);
    painter.scale(radiusX, radiusY);
    QRadialGradient spot(QPointF(0, 0), 1);
    constexpr std::array<std::pair<double, double>, 5> fall = {{{0, 1}, {0.25, 0.8}, {0.5, 0.4}, {0.75, 0.12}, {1, 0}}};
    for (const auto& [radius, share] : fall)
        spot.setColorAt(radius, withAlpha(colour, strength * share));
    painter.setPen(Qt::NoPen);
    painter.setBrush(spot);
    painter.drawEllipse(QPointF(0, 0), 1, 1);
    painter.restore();
}

void stroke(QPainter& painter, const QPainterPath& path, const QColor& colour, double width) {
    painter.strokePath(path, QPen(colour, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
}

QPainterPath curve(QPointF from, QPointF by, QPointF to) {
    QPainterPath path(from);
    path.quadTo(by, to);
    return path;
}

Sheet::Sheet(int width, int height, double unitsAcross, std::uint32_t seed)
    : m_picture(width, height, Qt::black)
    , m_unitsAcross(unitsAcross)
    , m_dice(seed)
    , m_painter(&m_picture.image()) {
    m_painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    m_painter.scale(width / unitsAcross, width / unitsAcross);
    m_painter.setPen(Qt::NoPen);
}

void Sheet::gradient(const QRectF& area, std::initializer_list<std::pair<double, QColor>> fromTopToBottom) {
    QLinearGradient fill(area.topLeft(), area.bottomLeft());
    for (const auto& [at, colour] : fromTopToBottom)
        fill.setColorAt(at, colour);
    m_painter.fillRect(area, fill);
}

namespace {

// The mean of 2 * radius + 1 neighbours, along one line of count dots that lie stride apart.
void spread(QRgb* line, int count, int stride, int radius, std::vector<QRgb>& copy) {
    copy.resize(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i)
        copy[static_cast<std::size_t>(i)] = line[static_cast<std::ptrdiff_t>(i) * stride];
    const auto dot = [&](int i) { return copy[static_cast<std::size_t>(std::clamp(i, 0, count - 1))]; };
    std::array<unsigned, 4> sum{};
    const auto add = [&sum](QRgb c, unsigned sign) {
        for (unsigned i = 0; i < 4; ++i)
            sum[i] += sign * (c >> 8 * i & 255);
    };
    for (int i = -radius; i <= radius; ++i)
        add(dot(i), 1);
    const auto size = static_cast<unsigned>(2 * radius + 1);
    for (int i = 0; i < count; ++i) {
        line[static_cast<std::ptrdiff_t>(i) * stride] = (sum[3] + size / 2) / size << 24 |
                                                        (sum[2] + size / 2) / size << 16 |
                                                        (sum[1] + size / 2) / size << 8 | (sum[0] + size / 2) / size;
        add(dot(i + radius + 1), 1);
        add(dot(i - radius), ~0U);
    }
}

void blur(QImage& image, int radius) {
    std::vector<QRgb> copy;
    auto* first = reinterpret_cast<QRgb*>(image.bits());
    const int stride = static_cast<int>(image.bytesPerLine() / 4);
    for (int pass = 0; pass < 2; ++pass) {
        for (int y = 0; y < image.height(); ++y)
            spread(first + static_cast<std::ptrdiff_t>(y) * stride, image.width(), 1, radius, copy);
        for (int x = 0; x < image.width(); ++x)
            spread(first + x, image.height(), stride, radius, copy);
    }
}

} // namespace

void Sheet::soft(const QRectF& area, double radius, const std::function<void(QPainter&)>& draw, double opacity,
                 QPainter::CompositionMode mode) {
    const QTransform units = m_painter.worldTransform();
    const double pixels = radius * std::hypot(units.m11(), units.m12());
    const double shrink = std::max(1.0, pixels / 3);
    const QRectF wanted = units.mapRect(area).adjusted(-3 * pixels, -3 * pixels, 3 * pixels, 3 * pixels);
    const QRect covered =
        wanted.intersected(QRectF(m_picture.image().rect()).adjusted(-2 * pixels, -2 * pixels, 2 * pixels, 2 * pixels))
            .toAlignedRect();
    if (covered.isEmpty())
        return;
    QImage layer(static_cast<int>(covered.width() / shrink) + 2, static_cast<int>(covered.height() / shrink) + 2,
                 QImage::Format_ARGB32_Premultiplied);
    layer.fill(Qt::transparent);
    {
        QPainter painter(&layer);
        painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
        painter.setPen(Qt::NoPen);
        painter.scale(1 / shrink, 1 / shrink);
        painter.translate(-covered.topLeft());
        painter.setWorldTransform(units, true);
        draw(painter);
    }
    blur(layer, std::max(1, static_cast<int>(std::lround(pixels / shrink / 1.4))));
    m_painter.save();
    m_painter.resetTransform();
    m_painter.setOpacity(opacity);
    m_painter.setCompositionMode(mode);
    m_painter.drawImage(QRectF(covered.topLeft(), QSizeF(layer.size()) * shrink), layer);
    m_painter.restore();
}

void Sheet::glow(QPointF at, double radius, const QColor& colour, double strength) {
    m_painter.save();
    m_painter.setCompositionMode(QPainter::CompositionMode_Screen);
    airbrush(m_painter, at, radius, radius, colour, strength);
    m_painter.restore();
}

void Sheet::strand(QPointF from, QPointF by, QPointF to, double width, const QColor& colour) {
    const QTransform units = m_painter.worldTransform();
    QImage& image = m_picture.image();
    const QPointF a = units.map(from), b = units.map(by), c = units.map(to);
    const double thick = width * std::hypot(units.m11(), units.m12()) / 2;
    const auto alpha = static_cast<float>(colour.alphaF());
    const auto dab = [&](int x, int y, float cover) {
        if (x < 0 || y < 0 || x >= image.width() || y >= image.height() || cover <= 0)
            return;
        QRgb& pixel = reinterpret_cast<QRgb*>(image.scanLine(y))[x];
        const auto part = [share = cover * alpha](int under, int over) {
            return static_cast<int>(static_cast<float>(under) + static_cast<float>(over - under) * share + 0.5F);
        };
        pixel = qRgb(part(qRed(pixel), colour.red()), part(qGreen(pixel), colour.green()),
                     part(qBlue(pixel), colour.blue()));
    };
    constexpr int pieces = 14;
    QPointF last = a;
    for (int i = 1; i <= pieces; ++i) {
        const double t = static_cast<double>(i) / pieces;
        const QPointF next = a * (1 - t) * (1 - t) + b * 2 * t * (1 - t) + c * t * t;
        const QPointF along = next - last;
        // Row by row where it is steep, column by column where it is flat.
        const bool steep = std::abs(along.y()) >= std::abs(along.x());
        double low = steep ? last.y() : last.x(), high = steep ? next.y() : next.x();
        QPointF first = last, second = next;
        double early = t - 1.0 / pieces, late = t;
        if (low > high) {
            std::swap(low, high);
            std::swap(first, second);
            std::swap(early, late);
        }
        const double lean = std::hypot(along.x(), along.y()) / std::max(1e-6, high - low);
        for (int row = static_cast<int>(std::ceil(low)); row < high; ++row) {
            const double share = (row - low) / std::max(1e-6, high - low);
            const double middle =
                steep ? first.x() + (second.x() - first.x()) * share : first.y() + (second.y() - first.y()) * share;
            const double half = thick * (1 - (early + (late - early) * share)) * lean;
            const double begin = middle - half, end = middle + half;
            for (int at = static_cast<int>(std::floor(begin)); at < end; ++at) {
                const auto cover =
                    static_cast<float>(std::min(end, at + 1.0) - std::max(begin, static_cast<double>(at)));
                steep ? dab(at, row, cover) : dab(row, at, cover);
            }
        }
        last = next;
    }
}

void Sheet::texture(const QPainterPath& where, double cellX, double cellY, double strength) {
    constexpr int side = 256;
    QImage tile(side, side, QImage::Format_ARGB32_Premultiplied);
    for (int y = 0; y < side; ++y) {
        auto* row = reinterpret_cast<QRgb*>(tile.scanLine(y));
        for (int x = 0; x < side; ++x) {
            const double height = m_dice.around(0, strength);
            const auto alpha = static_cast<unsigned>(std::min(255.0, std::abs(height) * 255));
            row[x] = height > 0 ? alpha << 24 | alpha << 16 | alpha << 8 | alpha : alpha << 24;
        }
    }
    QBrush brush(tile);
    brush.setTransform(QTransform::fromScale(cellX, cellY));
    m_painter.fillPath(where, brush);
}

void Sheet::mirror(double line, double bottom, double ripple, const QColor& water, double depth) {
    QImage& image = m_picture.image();
    const double scale = image.width() / m_unitsAcross;
    const int top = static_cast<int>(line * scale);
    const int end = std::min(image.height(), static_cast<int>(bottom * scale));
    for (int y = top; y < end; ++y) {
        const float below = static_cast<float>(y - top) / static_cast<float>(scale);
        auto* row = reinterpret_cast<QRgb*>(image.scanLine(y));
        const float share = static_cast<float>(depth) * (0.5F + 0.5F * below / static_cast<float>(bottom - line));
        for (int x = 0; x < image.width(); ++x) {
            const float across = static_cast<float>(x) / static_cast<float>(scale);
            const float wave = smoothNoise(across / (12 + below / 2), 9 * std::log(below + 4), 5) - 0.5F;
            const int from = top - 1 -
                             static_cast<int>((below + wave * static_cast<float>(ripple) * (0.3F + below / 250)) *
                                              static_cast<float>(scale));
            const QRgb c = reinterpret_cast<const QRgb*>(image.constScanLine(std::clamp(from, 0, top - 1)))[x];
            const auto part = [share](int a, int b) {
                return static_cast<int>(static_cast<float>(a) + static_cast<float>(b - a) * share);
            };
            row[x] = qRgb(part(qRed(c), water.red()), part(qGreen(c), water.green()), part(qBlue(c), water.blue()));
        }
    }
}

Bitmap Sheet::developed(const Film& film) {
    m_painter.end();
    QImage& image = m_picture.image();
    std::array<std::array<int, 256>, 3> curves{};
    for (std::size_t i = 0; i < 256; ++i) {
        const float value = static_cast<float>(i) / 255;
        const float steep = value + film.contrast * (smoothStep(0, 1, value) - value) * 2;
        const std::array<float, 3> warm = {1 + 0.07F * film.warmth, 1, 1 - 0.10F * film.warmth};
        // Blacks of a lens are never quite black.
        for (std::size_t c = 0; c < 3; ++c)
            curves[c][i] = static_cast<int>((6 + 249 * std::clamp(steep, 0.0F, 1.0F) * std::min(1.0F, warm[c])) * 256);
    }
    const float halfWidth = static_cast<float>(image.width()) / 2, halfHeight = static_cast<float>(image.height()) / 2;
    const float corner = halfWidth * halfWidth + halfHeight * halfHeight;
    int before = 0;
    std::vector<int> above(static_cast<std::size_t>(image.width()));
    for (int y = 0; y < image.height(); ++y) {
        auto* row = reinterpret_cast<QRgb*>(image.scanLine(y));
        const float v = static_cast<float>(y) - halfHeight;
        for (int x = 0; x < image.width(); ++x) {
            const float u = static_cast<float>(x) - halfWidth;
            const auto light = static_cast<int>(256 * (1 - film.vignette * (u * u + v * v) / corner));
            const std::uint32_t bits = m_dice.bits();
            const int fresh = static_cast<int>(bits & 63) + static_cast<int>(bits >> 6 & 63) - 63;
            // A grain is wider than a pixel.
            int& over = above[static_cast<std::size_t>(x)];
            const int grain = 2 * fresh + before + over;
            before = over = fresh;
            const QRgb c = row[x];
            const int green = curves[1][static_cast<std::size_t>(qGreen(c))];
            // Shadows and middle tones show more of it than white does.
            const int strength = static_cast<int>(film.grain * 2.3F) * (330 - (green >> 8)) >> 8;
            const auto channel = [&](std::size_t i, int value, int colour) {
                return std::clamp(((curves[i][static_cast<std::size_t>(value)] >> 8) * light >> 8) +
                                      ((grain * strength + colour * strength * 3) >> 8),
                                  0, 255);
            };
            row[x] = qRgb(channel(0, qRed(c), static_cast<int>(bits >> 12 & 31) - 15), channel(1, qGreen(c), 0),
                          channel(2, qBlue(c), static_cast<int>(bits >> 17 & 31) - 15));
        }
    }
    return std::move(m_picture);
}

QRgb Sheet::premultiplied(const Tint& tint) {
    const float alpha = std::clamp(tint.a, 0.0F, 1.0F);
    const auto part = [alpha](float value) {
        return static_cast<unsigned>(std::clamp(value, 0.0F, 255.0F) * alpha + 0.5F);
    };
    return static_cast<unsigned>(alpha * 255 + 0.5F) << 24 | part(tint.r) << 16 | part(tint.g) << 8 | part(tint.b);
}

} // namespace lumora::demo
