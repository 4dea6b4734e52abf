#include "assembly/PaperResize.h"

#include <gtest/gtest.h>

#include <tuple>

namespace lumora {
namespace {

TEST(PaperResize, scalesToThePaperWithTiesToEvenAndNeverEnlarges) {
    constexpr PaperSize small{10, 15};
    for (const auto& [source, paper, wanted] : std::initializer_list<std::tuple<PictureSize, PaperSize, PictureSize>>{
             {{4000, 3000}, small, {1800, 1350}},
             {{3000, 4000}, small, {1200, 1600}},
             {{3000, 3000}, small, {1200, 1200}}, // square goes as portrait
             {{1000, 750}, small, {1000, 750}},
             {{1900, 1}, small, {1800, 1}},
             {{3600, 2401}, small, {1800, 1200}}, // 1200.5
             {{3600, 2403}, small, {1800, 1202}}, // 1201.5
             {{2400, 3605}, small, {1200, 1802}}, // 1802.5, which single precision would take for more
             {{7200, 5001}, {20, 30}, {3600, 2500}},
             {{1200, 1201}, small, {1200, 1201}},
             {{10000, 1}, small, {1800, 0}}, // nothing is left of it
             {{1, 65500}, small, {1, 65500}},
         }) {
        const PictureSize target = paperPictureSize(source, paper);
        EXPECT_EQ(target, wanted) << source.width << "x" << source.height << " gave " << target.width << "x"
                                  << target.height;
    }
}

} // namespace
} // namespace lumora
