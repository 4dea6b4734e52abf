#include "editing/render/ColourLevels.h"

#include <algorithm>

namespace lumora {
namespace {

constexpr int brightestItems = 5;
constexpr float full = 255.0F;

template <typename Rule>
ChannelValues ofEach(const std::array<QStringList, 3>& lists, const Rule& rule) {
    return {rule(lists[0]), rule(lists[1]), rule(lists[2])};
}

float topLevel(const QStringList& items) {
    float sum = 1.0F;
    for (const QString& item : items.last(std::min<qsizetype>(brightestItems, items.size())))
        sum += item.toFloat();
    return std::max(sum, 1.0F) / brightestItems;
}

} // namespace

SampleColorLevels::SampleColorLevels(const Bitmap& picture, const QRect& area) {
    const QRect inside(0, 0, picture.width(), picture.height());
    for (int x = area.left(); x <= area.left() + area.width(); x += step) {
        for (int y = area.top(); y <= area.top() + area.height(); y += step) {
            const QRgb pixel = inside.contains(x, y) ? picture.image().pixel(x, y) : qRgb(0, 0, 0);
            m_lists[0] += itemText(qRed(pixel));
            m_lists[1] += itemText(qGreen(pixel));
            m_lists[2] += itemText(qBlue(pixel));
        }
    }
    for (QStringList& list : m_lists)
        list.sort();
}

ChannelValues SampleColorLevels::topLevels() const {
    return ofEach(m_lists, topLevel);
}

ChannelValues SampleColorLevels::gains() const {
    return ofEach(m_lists, [](const QStringList& items) { return full / topLevel(items); });
}

ChannelValues SampleColorLevels::floors(int above) const {
    return ofEach(m_lists, [above](const QStringList& items) {
        return (items.isEmpty() ? 0.0F : items.first().toFloat()) + static_cast<float>(above);
    });
}

QString SampleColorLevels::itemText(int value) {
    const QString digits = QString::number(value);
    return value < 100 ? u'0' + digits : digits;
}

} // namespace lumora
