// The steps of the editor's and its keyboard's buttons, in the fields of a record.
#include "editing/caption/CaptionStep.h"
#include "editing/editor/LineFrameChoice.h"
#include "editing/render/TextLabelPlace.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <gtest/gtest.h>

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

TEST(CaptionStep, MovesGrowsAndGoesItsRounds) {
    EditFields edit;
    CaptionStep::begin(edit);
    EXPECT_EQ(qRgb(edit.TextRed, edit.TextGreen, edit.TextBlue), qRgb(255, 255, 30));
    CaptionStep::move(edit, -2, 4);
    EXPECT_EQ(QPoint(edit.TextX, edit.TextY), QPoint(98, 104));
    CaptionStep::move(edit, 32767, -32767 - 200);
    EXPECT_EQ(QPoint(edit.TextX, edit.TextY), QPoint(32767, -32768));
    CaptionStep::resize(edit, 2);
    EXPECT_EQ(edit.TextFontSize, 26);
    for (const auto& [style, vertical] : {std::pair(1, 3), std::pair(2, 0), std::pair(3, 3), std::pair(0, 0)}) {
        CaptionStep::nextStyle(edit);
        CaptionStep::turn(edit);
        EXPECT_EQ(edit.TextStyle, style);
        EXPECT_EQ(edit.TextVertical, vertical);
    }
}

TEST(LineFrameChoice, StepsThroughTheStylesWithoutTurningRound) {
    LineFrameChoice choice;
    EXPECT_FALSE(choice.step(-1)) << "nothing was chosen yet";
    for (const auto& [steps, code] : {std::pair(3, "W05"), std::pair(30, "W29"), std::pair(-30, "W01")}) {
        for (int i = 0; i < std::abs(steps); ++i)
            EXPECT_TRUE(choice.step(steps > 0 ? 1 : -1));
        EXPECT_EQ(choice.code(), QString::fromLatin1(code));
    }
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

} // namespace
} // namespace lumora
