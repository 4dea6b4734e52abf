#include "TheEditor.h"

namespace lumora {
namespace {

TEST_F(TheEditor, putsTheBordersFrameOnAPictureThatHasNone) {
    makeFrame(QStringLiteral("borders"), QStringLiteral("001"), Qt::green);
    state.shemot.Bord = QStringLiteral("WBX");
    tFrmNew& editor = open(lying);
    EXPECT_EQ(editor.Combo2.text, QStringLiteral("001"));
    EXPECT_EQ(field(EditRecord::FrameName), QStringLiteral("001"));
    EXPECT_EQ(field(EditRecord::FrameFolder).trimmed(), QStringLiteral("borders"));
    EXPECT_GT(corner().green(), 240);
    editor.Misgerett_Click(false);
    EXPECT_GT(corner().red(), 240);
    editor.Misgerett_Click(true);
    EXPECT_GT(corner().green(), 240);
    editor.Image28_Click();
    EXPECT_GT(corner().red(), 240);
    EXPECT_EQ(stored.last().mid(32, 6), QStringLiteral("999W00"));
}

TEST_F(TheEditor, walksTheFramesOfACategoryWithoutTurningRound) {
    makeFrame(QStringLiteral("aa"), QStringLiteral("001"), Qt::green);
    makeFrame(QStringLiteral("aa"), QStringLiteral("002"), Qt::blue);
    makeFrame(QStringLiteral("bb"), QStringLiteral("007"), Qt::yellow);
    makeFrame(QStringLiteral("much too long"), QStringLiteral("001"), Qt::green);
    makeFrame(QStringLiteral("aa"), QStringLiteral("long"), Qt::green);
    makeFrame(QStringLiteral("aa"), QStringLiteral("K9"), Qt::green);
    const HostPath listFile = host(JoinDrivePath(WorkspacePaths::misgarot(state), QStringLiteral("aa\\002.png")));
    std::filesystem::rename(listFile, HostPath(listFile).replace_extension("PNG")); // letter case does not count
    tFrmNew& editor = open(lying);
    EXPECT_EQ(editor.Combo4List.items(), QStringList({QStringLiteral("aa"), QStringLiteral("bb")}));
    EXPECT_EQ(editor.Combo2List.items(), QStringList({QStringLiteral("001"), QStringLiteral("002")}));
    EXPECT_EQ(editor.Label5.text, QStringLiteral("2"));
    EXPECT_FALSE(editor.framePicture(1).isNull());

    editor.Image20_Click();
    EXPECT_EQ(stored.last().mid(32, 3), QStringLiteral("001"));
    editor.Image20_Click();
    editor.Image20_Click();
    EXPECT_EQ(editor.Label6.text, QStringLiteral("2  / "));
    EXPECT_EQ(stored.last().mid(32, 3), QStringLiteral("002"));
    EXPECT_GT(corner().blue(), 240);
    editor.Image21_Click();
    editor.Image21_Click();
    EXPECT_EQ(stored.last().mid(32, 3), QStringLiteral("001"));

    // Another category is looked at; the picture's frame stays until one is taken.
    const QString before = state.edit.EditState;
    editor.Combo4_Click(1);
    editor.Command5_Click();
    EXPECT_EQ(state.edit.EditState, before);
    editor.Misgerett_Click(false);
    editor.Image22_Click();
    EXPECT_TRUE(editor.Misgerett.checked);
    EXPECT_EQ(stored.last().mid(32, 3), QStringLiteral("007"));
    EXPECT_EQ(stored.last().mid(44, 10), QStringLiteral("bb        "));
    EXPECT_GT(corner().green(), 240);
}

TEST_F(TheEditor, leavesTheBordersFrameAloneWhereTheLabHasNoFrames) {
    state.shemot.Bord = QStringLiteral("WB");
    tFrmNew& editor = open(lying);
    EXPECT_EQ(editor.Label5.text, QStringLiteral("0"));
    editor.Image20_Click();
    editor.Image21_Click();
    editor.Image22_Click();
    EXPECT_EQ(field(EditRecord::FrameName), QStringLiteral("001"));
}

TEST_F(TheEditor, recordsLineFramesAndPaintsThemNowhere) {
    tFrmNew& editor = open(lying);
    const QImage before = editor.PicPic.image();
    for (int i = 0; i < 3; ++i)
        editor.Command9_Click();
    EXPECT_EQ(stored.last().mid(35, 3), QStringLiteral("W05"));
    editor.pic4Msgrt_MouseMove({40, 70});
    editor.pic4Msgrt_MouseMove({40, 130}); // below the cells
    EXPECT_EQ(editor.Label4.text, QStringLiteral("6"));
    EXPECT_EQ(editor.palette.marker(), QRect(33, 66, 33, 33));
    editor.PicInMsgrt_Click();
    for (int i = 0; i < 30; ++i)
        editor.Command9_Click();
    EXPECT_EQ(stored.last().mid(35, 3), QStringLiteral("Y29"));
    editor.Command18_Click();
    EXPECT_EQ(stored.last().mid(35, 3), QStringLiteral("Y28"));
    for (int i = 0; i < 30; ++i)
        editor.Command18_Click();
    editor.Image28_Click();
    editor.Command18_Click(); // the first stays and is taken again
    EXPECT_EQ(stored.last().mid(35, 3), QStringLiteral("Y01"));
    EXPECT_EQ(editor.PicPic.image(), before);
}

} // namespace
} // namespace lumora
