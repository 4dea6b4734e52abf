#include "editing/render/PrintResolution.h"
#include "session/SessionState.h"

#include <gtest/gtest.h>

#include <tuple>

namespace lumora {
namespace {

TEST(APlainPrint, scalesToThePaperWithTiesToEvenAndNeverEnlarges) {
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

// dots: of the scaled print and of the whole file, each filled and fitted. share: of the picture's sides that a filled
// paper takes, and that a fitted one has.
TEST(APlainPrint, hasTheResolutionAndTheCutOfItsPaper) {
    constexpr PaperSize small{10, 15};
    const struct {
        PictureSize picture;
        PaperSize paper;
        int filled, fitted, wholeFilled;
        QSizeF takes, has;
    } cases[] = {{{4000, 3000}, small, 304, 342, 677, {1, 8 / 9.0}, {1.125, 1}},
                 {{3000, 4000}, small, 270, 304, 677, {8 / 9.0, 1}, {1, 1.125}},
                 {{1000, 750}, small, 169, 190, 169, {1, 8 / 9.0}, {1.125, 1}},
                 {{1000, 1000}, small, 169, 254, 169, {2 / 3.0, 1}, {1, 1.5}},
                 {{6000, 1500}, small, 114, 304, 381, {0.375, 1}, {1, 8 / 3.0}}, // the print has 1800 x 450
                 {{600, 400}, small, 101, 101, 101, {1, 1}, {1, 1}},
                 {{1182, 788}, small, 200, 200, 200, {1, 1}, {1, 1}},
                 {{3500, 2362}, {50, 70}, 119, 127, 119, {0.9448, 1}, {1, 1.0584}}};
    for (const auto& c : cases) {
        using enum PrintResolution::Sent;
        for (const auto& [fit, sent, dots] : {std::tuple(PaperFit::Fill, Scaled, c.filled),
                                              {PaperFit::Fit, Scaled, c.fitted},
                                              {PaperFit::Fill, Whole, c.wholeFilled}})
            EXPECT_EQ(PrintResolution::ofPlain(c.picture, c.paper, fit, sent).dotsPerInch(), dots) << c.picture.width;
        for (const auto& [fit, size] : {std::pair(PaperFit::Fill, c.takes), {PaperFit::Fit, c.has}}) {
            const QRectF paper = paperOnPicture(c.picture, c.paper, fit);
            EXPECT_NEAR(paper.width(), size.width(), 1e-4) << c.picture.width;
            EXPECT_NEAR(paper.height(), size.height(), 1e-4) << c.picture.width;
            EXPECT_NEAR(paper.center().x() + paper.center().y(), 1, 1e-9) << "in the middle";
        }
    }
}

TEST(AnEditedPrint, hasTheResolutionOfItsZoom) {
    using enum PrintResolution::Grade;
    const struct {
        PictureSize picture;
        std::int16_t zoom, turn;
        int dots;
        PrintResolution::Grade grade;
    } cases[] = {{{4000, 3000}, 210, 180, 254, Sharp}, {{1500, 1000}, 100, 180, 254, Sharp},
                 {{1500, 1000}, 127, 180, 200, Sharp}, {{1500, 1000}, 128, 195, 198, Fair},
                 {{1500, 1000}, 210, 270, 120, Fair},  {{600, 800}, 100, 180, 135, Fair},
                 {{600, 800}, 113, 180, 119, Coarse},  {{400, 300}, 150, 180, 45, Coarse}};
    for (const auto& c : cases) {
        EditFields edit;
        edit.ZoomPercent = c.zoom;
        edit.RotationCode = c.turn;
        const PrintResolution resolution = PrintResolution::ofEdited(c.picture, {10, 15}, edit);
        EXPECT_EQ(resolution.dotsPerInch(), c.dots) << c.picture.width << " " << c.zoom;
        EXPECT_EQ(resolution.grade(), c.grade) << c.picture.width << " " << c.zoom;
    }
}

} // namespace
} // namespace lumora
