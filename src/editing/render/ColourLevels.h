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

    // (1 + the sum of the last five items) / 5, so that a black picture has 0.2.
    ChannelValues topLevels() const;
    // The factor that brings the top level to 255.
    ChannelValues gains() const;
    // The first item plus above.
    ChannelValues floors(int above) const;

    static QString itemText(int value);

private:
    std::array<QStringList, 3> m_lists;
};

} // namespace lumora
