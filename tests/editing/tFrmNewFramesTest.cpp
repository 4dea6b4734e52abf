#include "TheEditor.h"

namespace lumora {
namespace {

TEST_F(TheEditor, putsTheBordersFrameOnAPictureThatHasNone) {
    makeFrame(u"borders"_s, u"001"_s, Qt::green);
    state.shemot.Bord = u"WBX"_s;
    tFrmNew& editor = open(lying);
    EXPECT_EQ(shown().Combo2.text, u"001"_s);
    EXPECT_EQ(field(EditRecord::FrameName), u"001"_s);
    EXPECT_EQ(field(EditRecord::FrameFolder).trimmed(), u"borders"_s);
    EXPECT_GT(corner().green(), 240);
    editor.Image28_Click();
    EXPECT_GT(corner().red(), 240);
    EXPECT_EQ(storedField(EditRecord::FrameName) + storedField(EditRecord::LineFrameCode), u"999W00"_s);
}

TEST_F(TheEditor, walksTheFramesOfACategoryWithoutTurningRound) {
    makeFrame(u"aa"_s, u"001"_s, Qt::green);
    makeFrame(u"aa"_s, u"002"_s, Qt::blue);
    makeFrame(u"bb"_s, u"007"_s, Qt::yellow);
    makeFrame(u"much too long"_s, u"001"_s, Qt::green);
    makeFrame(u"aa"_s, u"long"_s, Qt::green);
    makeFrame(u"aa"_s, u"K9"_s, Qt::green);
    const HostPath listFile = host(WorkspacePaths::misgarot(state) / u"aa\\002.png");
    std::filesystem::rename(listFile, HostPath(listFile).replace_extension("PNG")); // letter case does not count
    tFrmNew& editor = open(lying);
    EXPECT_EQ(shown().Combo4List.items(), QStringList({u"aa"_s, u"bb"_s}));
    EXPECT_EQ(shown().Combo2List.items(), QStringList({u"001"_s, u"002"_s}));
    EXPECT_EQ(shown().Label5.text, u"2"_s);
    EXPECT_FALSE(editor.framePicture(1).isNull());

    editor.Image20_Click();
    EXPECT_EQ(storedField(EditRecord::FrameName), u"001"_s);
    editor.Image20_Click();
    editor.Image20_Click();
    EXPECT_EQ(shown().Label6.text, u"2  / "_s);
    EXPECT_EQ(editor.frameOnPicture(), 1);
    EXPECT_EQ(storedField(EditRecord::FrameName), u"002"_s);
    EXPECT_GT(corner().blue(), 240);
    editor.Image21_Click();
    editor.Image21_Click();
    EXPECT_EQ(storedField(EditRecord::FrameName), u"001"_s);

    // Another category is looked at; the picture's frame stays until one is taken.
    const QString before = state.edit.EditState;
    editor.Combo4_Click(1);
    EXPECT_EQ(editor.frameOnPicture(), -1);
    editor.Command5_Click();
    EXPECT_EQ(state.edit.EditState, before);
    editor.Misgerett_Click(false);
    editor.Image22_Click();
    EXPECT_TRUE(shown().Misgerett.checked);
    EXPECT_EQ(storedField(EditRecord::FrameName), u"007"_s);
    EXPECT_EQ(storedField(EditRecord::FrameFolder), u"bb        "_s);
    EXPECT_GT(corner().green(), 240);
}

TEST_F(TheEditor, leavesTheBordersFrameAloneWhereTheLabHasNoFrames) {
    state.shemot.Bord = u"WB"_s;
    tFrmNew& editor = open(lying);
    EXPECT_EQ(shown().Label5.text, u"0"_s);
    editor.Image20_Click();
    editor.Image21_Click();
    editor.Image22_Click();
    EXPECT_EQ(field(EditRecord::FrameName), u"001"_s);
}

TEST_F(TheEditor, recordsLineFramesAndPaintsThemNowhere) {
    tFrmNew& editor = open(lying);
    const QImage before = paper();
    editor.Command9_Click();
    EXPECT_EQ(storedField(EditRecord::LineFrameCode), u"W01"_s);
    editor.pic4Msgrt_MouseMove({40, 70});
    editor.pic4Msgrt_MouseMove({40, 130}); // below the cells
    EXPECT_EQ(shown().Label4.text, u"6"_s);
    EXPECT_EQ(shown().palette.marker(), QRect(33, 66, 33, 33));
    editor.PicInMsgrt_Click();
    editor.Image28_Click();
    EXPECT_EQ(storedField(EditRecord::LineFrameCode), u"Y00"_s);
    editor.Command18_Click(); // the first stays and is taken again
    EXPECT_EQ(storedField(EditRecord::LineFrameCode), u"Y01"_s);
    EXPECT_EQ(shown().Combo5.text, u"1"_s);
    editor.Combo5_Click(3);
    EXPECT_EQ(storedField(EditRecord::LineFrameCode), u"Y06"_s);
    EXPECT_EQ(paper(), before);
}

} // namespace
} // namespace lumora
