#pragma once

#include "imaging/Bitmap.h"

#include <QRect>
#include <QString>
#include <QStringList>

#include <array>

namespace lumora {

// Red, green, blue.
using ChannelValues = std::array<float, 3>;

// The values of a picture's channels, taken at every fifth pixel and kept as texts in text order. A value under 100 has
// one "0" in front, so that the last items are the brightest of every picture that has a value of 100 or more.
class SampleColorLevels {
public:
    static constexpr int step = 5;

    // Both edges of the area belong to it; a point outside the picture counts as black.
    SampleColorLevels(const Bitmap& picture, const QRect& area);

    const std::array<QStringList, 3>& lists() const { return m_lists; }

    // A fifth of 1 and the last five items, and of 1 at least: a black picture has 0.2.
    ChannelValues topLevels() const;
    // What would bring the top level to full.
    ChannelValues gains() const;
    // So much above the first item.
    ChannelValues floors(int above) const;

    static QString itemText(int value);

private:
    std::array<QStringList, 3> m_lists;
};

} // namespace lumora
