#include "assembly/PaperResize.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

TEST(PaperResize, scalesToThePaperWithTiesToEvenAndNeverEnlarges) {
    struct Case {
        PictureSize source;
        PaperSize paper;
        PictureSize target;
    };
    constexpr PaperSize small{10, 15};
    for (const Case& c : {
             Case{{4000, 3000}, small, {1800, 1350}},
             Case{{3000, 4000}, small, {1200, 1600}},
             Case{{3000, 3000}, small, {1200, 1200}}, // square goes as portrait
             Case{{1000, 750}, small, {1000, 750}},
             Case{{1900, 1}, small, {1800, 1}},
             Case{{3600, 2401}, small, {1800, 1200}}, // 1200.5
             Case{{3600, 2403}, small, {1800, 1202}}, // 1201.5
             Case{{2400, 3605}, small, {1200, 1802}}, // 1802.5, which single precision would take for more
             Case{{7200, 5001}, {20, 30}, {3600, 2500}},
             Case{{1200, 1201}, small, {1200, 1201}},
             Case{{10000, 1}, small, {1800, 0}}, // nothing is left of it
             Case{{1, 65500}, small, {1, 65500}},
         }) {
        const PictureSize target = paperPictureSize(c.source, c.paper);
        EXPECT_EQ(target, c.target) << c.source.width << "x" << c.source.height << " gave " << target.width << "x"
                                    << target.height;
    }
}

} // namespace
} // namespace lumora
