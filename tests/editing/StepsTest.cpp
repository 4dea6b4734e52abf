// The rules of the editor and of its keyboard, without their pages.
#include "common/AnsiCodePage.h"
#include "editing/caption/KeyLayout.h"
#include "editing/render/PicturePlacement.h"
#include "editing/render/TextLabelPlace.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <gtest/gtest.h>

#include <tuple>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(EditStep, StaysWithinTheRangeOfItsButton) {
    using namespace EditStep;
    const std::pair<std::int16_t, std::int16_t> cases[] = {
        {zoom(209, 2), 210},      {zoom(41, -2), 40},         {turn(540, 1), 180},
        {turn(180, -3), 177},     {turn(-32768, -1), -32768}, {quarterRight(450), 540},
        {quarterRight(500), 230}, {quarterLeft(230), 500},    {quarterLeft(270), 180}};
    for (const auto& [stepped, expected] : cases)
        EXPECT_EQ(stepped, expected);
}

TEST(TextLabelPlace, PlacesTheCaptionsBoxAndFindsTheAnchorBack) {
    EditFields fields;
    fields.TextX = 200;
    fields.TextY = 150;
    fields.TextFontSize = 24;
    fields.TextBody = u"twelve signs"_s;
    const double width = TextLabelPlace::boxOf(fields).width;
    EXPECT_NEAR(width, 12 * 12, 24);
    EXPECT_EQ(TextLabelPlace::blanks(fields).size(), 24);
    const double tall = 3 + 25 * 12;
    struct Case {
        std::int16_t vertical, align;
        double left, top;
        QPoint back;
    };
    for (const Case& c : {Case{0, 0, 200, 150, {200, 150}}, Case{0, 1, 200 - width / 2, 150, {200, 150}},
                          Case{0, 2, 200 - width, 150, {203, 150}}, Case{3, 0, 165, 150, {203, 150}},
                          Case{3, 1, 165, 150 - tall / 2, {200, 150}}, Case{3, 2, 165, 150 - tall, {200, 150}}}) {
        fields.TextVertical = c.vertical;
        fields.TextAlign = c.align;
        const TextLabelBox box = TextLabelPlace::boxOf(fields);
        EXPECT_NEAR(box.left, c.left, 1e-9);
        EXPECT_NEAR(box.top, c.top, 1e-9);
        EXPECT_EQ(TextLabelPlace::anchorOf(box, fields), c.back) << c.vertical << ' ' << c.align;
    }
}

TEST(KeyLayout, OffersWhatTheOrderLogCanCarry) {
    for (const auto letters : {KeyLayout::Letters::Hebrew, KeyLayout::Letters::Small, KeyLayout::Letters::Capital}) {
        for (int key = 0; key < KeyLayout::keys; ++key) {
            const QString text = KeyLayout::caption(key, letters);
            ASSERT_EQ(text.size(), 1) << key;
            EXPECT_EQ(AnsiCodePage::squeeze(text), text) << key;
            EXPECT_NE(text, u"\""_s) << key;
        }
    }
    EXPECT_TRUE(KeyLayout::caption(KeyLayout::keys, KeyLayout::Letters::Hebrew).isEmpty());
    EXPECT_TRUE(KeyLayout::caption(-1, KeyLayout::Letters::Hebrew).isEmpty());
}

TEST(KeyLayout, LiesAsOnARealKeyboardInBothLanguages) {
    QString latin;
    QString capital;
    QString hebrew;
    for (const int key : KeyLayout::places()) {
        latin += KeyLayout::caption(key, KeyLayout::Letters::Small);
        capital += KeyLayout::caption(key, KeyLayout::Letters::Capital);
        hebrew += KeyLayout::caption(key, KeyLayout::Letters::Hebrew);
    }
    EXPECT_EQ(latin, u"qwertyuiopasdfghjkl zxcvbnm,  "_s);
    EXPECT_EQ(capital, latin.toUpper());
    EXPECT_EQ(hebrew, u"  קראטוןםפשדגכעיחלךףזסבהנמצתץ,"_s);
}

TEST(PicturePlacement, SizesThePreviewByThePaperCode) {
    const std::tuple<const char*, PictureSize, PictureSize> cases[] = {{"1015", {450, 300}, {300, 450}},
                                                                       {"1318", {450, 325}, {300, 415}},
                                                                       {"0913", {450, 311}, {300, 433}},
                                                                       {"3040", {450, 337}, {300, 400}},
                                                                       {"1521", {450, 321}, {300, 420}}};
    for (const auto& [code, landscape, portrait] : cases) {
        const auto paper = PaperSize::ofDigits(QString::fromLatin1(code));
        ASSERT_TRUE(paper) << code;
        EXPECT_EQ(previewBox(*paper, PaperOrientation::Landscape), landscape) << code;
        EXPECT_EQ(previewBox(*paper, PaperOrientation::Portrait), portrait) << code;
    }
}

TEST(PicturePlacement, ReducesThePictureToItsWorkPicture) {
    struct Case {
        PictureSize picture;
        int percent;
        PictureSize work;
    };
    for (const Case& c :
         {Case{{4000, 3000}, 100, {500, 375}}, Case{{4000, 3000}, 40, {200, 150}}, Case{{4000, 3000}, 210, {700, 525}},
          Case{{3000, 4000}, 100, {375, 500}}, Case{{10000, 1}, 100, {500, 1}}})
        EXPECT_EQ(workPictureSize(c.picture, c.percent), c.work) << c.percent;
    EXPECT_FALSE(workPictureSize({1, 10000}, 100)) << "its work copy would fill the memory";

    EditFields edit;
    edit.ZoomPercent = 100;
    edit.RotationCode = 180;
    EXPECT_EQ(previewPlacement({500, 375}, {450, 300}, edit).zoomed(), (PictureSize{450, 337}));
}

} // namespace
} // namespace lumora
