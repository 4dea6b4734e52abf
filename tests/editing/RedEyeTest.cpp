#include "editing/redeye/RedEye.h"

#include <gtest/gtest.h>

#include <map>
#include <utility>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

using Pixels = std::map<std::pair<int, int>, QRgb>;

// Skin with a red pupil, a catch-light and shades between.
Bitmap eye() {
    const Pixels marks = {{{4, 4}, qRgb(210, 42, 58)}, {{2, 6}, qRgb(210, 42, 58)}, {{0, 0}, qRgb(120, 44, 36)},
                          {{5, 4}, qRgb(110, 60, 60)}, {{3, 4}, qRgb(110, 62, 58)}, {{4, 5}, qRgb(110, 70, 58)},
                          {{4, 3}, qRgb(120, 76, 66)}, {{3, 3}, qRgb(60, 50, 50)},  {{5, 5}, qRgb(250, 250, 250)}};
    Bitmap picture(9, 9, QColor(180, 140, 120));
    for (const auto& [at, colour] : marks)
        picture.image().setPixel(at.first, at.second, colour);
    return picture;
}

TEST(RedEye, GreysMorePixelsTheDeeperTheLevel) {
    struct Case {
        int level;
        std::map<std::pair<int, int>, int> grey;
    };
    const std::map<std::pair<int, int>, int> basic = {{{4, 4}, 80}, {{2, 6}, 80}, {{0, 0}, 60}, {{5, 4}, 71}};
    auto further = basic;
    further.insert({{{3, 4}, 72}, {{4, 5}, 78}});
    auto deepest = further;
    deepest.insert({{{4, 3}, 85}, {{3, 3}, 52}});
    for (const Case& expected : {Case{0, basic}, Case{15, further}, Case{65, deepest}}) {
        Bitmap picture = eye();
        const Bitmap before = picture;
        const RedEye::Peak peak = RedEye::findPeak(picture, {4, 4});
        EXPECT_EQ(peak.redness, 320);
        EXPECT_EQ(QPoint(peak.x, peak.y), QPoint(4, 4));
        EXPECT_DOUBLE_EQ(peak.ratio(), 4.0);
        const QStringList changed = RedEye::correct(picture, {0, 0, 9, 9}, peak.ratio(), expected.level);
        EXPECT_EQ(changed.size(), static_cast<qsizetype>(expected.grey.size()));
        if (expected.level == 0) {
            EXPECT_EQ(changed.join(u' '), u"0^0 2^6 4^4 5^4"_s);
        }
        for (int y = 0; y < 9; ++y) {
            for (int x = 0; x < 9; ++x) {
                const auto grey = expected.grey.find({x, y});
                const QRgb wanted = grey == expected.grey.end() ? before.image().pixel(x, y)
                                                                : qRgb(grey->second, grey->second, grey->second);
                EXPECT_EQ(picture.image().pixel(x, y), wanted) << x << ',' << y << " level " << expected.level;
            }
        }
    }
}

TEST(RedEye, PassesOverWhatLiesOutsideAndFindsNoPeakWithoutRed) {
    Bitmap picture(3, 3, QColor(7, 5, 200));
    RedEye::darken(picture, {1, 1, 2, 2}, {u"0^0"_s, u"5^5"_s});
    EXPECT_EQ(picture.image().pixel(1, 1), qRgb(2, 5, 195)) << "down to five";
    EXPECT_EQ(picture.image().pixel(0, 0), qRgb(7, 5, 200));
    const RedEye::Peak peak = RedEye::findPeak(Bitmap(20, 20, QColor(90, 90, 90)), {30, 5});
    EXPECT_EQ(QPoint(peak.x, peak.y), QPoint(30, 5));
    EXPECT_DOUBLE_EQ(peak.ratio(), 0.0);
}

} // namespace
} // namespace lumora
