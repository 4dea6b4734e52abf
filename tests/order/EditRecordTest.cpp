#include "order/EditRecord.h"
#include "common/FixedText.h"
#include "session/SessionState.h"
#include "support/DrivePathLiteral.h"

#include <gtest/gtest.h>

#include <array>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(EditRecord, KeepsTheFirstFourCharactersOfAGain) {
    struct Case {
        int hundredths, steps;
        const char* stored;
        float readBack;
    };
    const Case cases[] = {
        {6, 1, "1.06", 1.06F},   {6, 5, "1.3 ", 1.3F},   {6, 8, "1.48", 1.48F},   {6, 9, "1.53", 1.53F},
        {6, 10, "1.59", 1.59F},  {6, 17, "2.01", 2.01F}, {-6, 10, "0.4 ", 0.4F},  {-6, 15, "0.09", 0.09F},
        {-6, 16, "0.03", 0.03F}, {-6, 17, "-0.0", 0.0F}, {-6, 19, "-0.1", -0.1F}, {4, 13, "1.52", 1.52F},
        {4, 14, "1.55", 1.55F},  {4, 25, "1.99", 1.99F}, {-4, 2, "0.92", 0.92F},  {-4, 3, "0.87", 0.87F},
        {-4, 24, "0.03", 0.03F}, {-4, 25, "-0.0", 0.0F},
    };
    for (const Case& expected : cases) {
        EditFields edit;
        for (int step = 0; step < expected.steps; ++step)
            edit.GainR = EditStep::gain(edit.GainR, expected.hundredths);
        PackEditState(edit, u"NB"_s, {});
        EXPECT_EQ(edit.EditState.left(4).toStdString(), expected.stored);
        EditFields back;
        UnpackEditState(edit.EditState, back);
        EXPECT_FLOAT_EQ(back.GainR, expected.readBack) << expected.stored;
    }
}

TEST(EditRecord, CutsWhatIsTooLongForItsField) {
    EditFields edit;
    edit.PanX = -1000;
    edit.TextBody = QString(71, u'x');
    PackEditState(edit, u"NB"_s, {});
    EXPECT_EQ(edit.EditState.size(), EditRecord::width);
    EXPECT_EQ(edit.EditState.mid(18, 4), u"-100"_s);
    EXPECT_EQ(edit.EditState.mid(126), QString(70, u'x') + u"    "_s);
}

TEST(EditRecord, UnpacksByPositionAndReadsBlanksAsTheirDefaults) {
    EditFields fields;
    fields.PicturePath = u"C:\\pics\\תמונה.jpg"_path;
    UnpackEditState(EditRecord::newPicture(), fields);
    EXPECT_EQ(fields.GainB, 1.0F);
    EXPECT_EQ(fields.RotationCode, 180);
    EXPECT_EQ(fields.PanY, 999);
    EXPECT_EQ(fields.AutoMarker, u"000");
    EXPECT_EQ(fields.TextFontSize, 8);
    EXPECT_EQ(fields.EditState.size(), 200);
    EXPECT_EQ(fields.PicturePath, u"C:\\pics\\תמונה.jpg"_path);

    // One character of its own at the start of each field shows that no column is shifted.
    const QString record = u"1.290.5 0.02170210-99 12  1  2  034R11RED111kids      242 7 8 1 ddd       "_s +
                           u"2551281  45 60 9  3 2 "_s + LeftField(u"David"_s, 30) + LeftField(u"שלום  עולם"_s, 74);
    UnpackEditState(record, fields);
    EXPECT_FLOAT_EQ(fields.GainB, 0.02F);
    EXPECT_EQ(fields.ZoomPercent, 210);
    EXPECT_EQ(fields.FrameFolder, u"kids");
    EXPECT_EQ((std::array{fields.TextRed, fields.TextGreen, fields.TextBlue}),
              (std::array<std::int16_t, 3>{1, 128, 255}));
    EXPECT_EQ(fields.TextX, 45);
    EXPECT_EQ(fields.TextFont, u"David");
    EXPECT_EQ(fields.TextBody, u"שלום  עולם");
    PackEditState(fields, u"NB"_s, {});
    EXPECT_EQ(fields.EditState.toStdString(), record.toStdString());

    UnpackEditState(u"x.290.5 -   xy 180x%"_s, fields);
    EXPECT_EQ((std::array{fields.GainR, fields.GainG, fields.GainB}), (std::array{1.0F, 0.5F, 1.0F}))
        << "what is no number would print black";
}

TEST(EditRecord, CarriesTheOrdersBorderAsAFrame) {
    struct Case {
        const char *border, *frame, *folder, *frameAfter, *folderAfter;
    };
    for (const Case& expected :
         {Case{"WB", "000", "", "001", "blue"}, Case{"BK", "000", "red", "002", "red"},
          Case{"WB", "999", "", "999", ""}, Case{"NB", "000", "", "000", ""}, Case{"BK", "017", "", "017", ""}}) {
        EditFields edit;
        edit.FrameName = QString::fromLatin1(expected.frame);
        edit.FrameFolder = QString::fromLatin1(expected.folder);
        PackEditState(edit, QString::fromLatin1(expected.border), u"blue"_s);
        EXPECT_EQ(edit.FrameName.toStdString(), expected.frameAfter);
        EXPECT_EQ(edit.FrameFolder.toStdString(), expected.folderAfter);
    }
}

} // namespace
} // namespace lumora
