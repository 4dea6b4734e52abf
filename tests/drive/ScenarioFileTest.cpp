#include "drive/ScenarioFile.h"

#include <gtest/gtest.h>

using namespace lumora;

using namespace Qt::StringLiterals;

namespace {

ScenarioCommand only(const char* line) {
    const auto file = ScenarioFile::parse(line, u"s"_s);
    EXPECT_TRUE(file.ok()) << line << ": " << (file ? "" : file.failure().message.toStdString());
    EXPECT_EQ(file ? file->commands().size() : 0U, 1U) << line;
    return file && !file->commands().empty() ? file->commands().front() : ScenarioCommand{};
}

} // namespace

// What the scenarios of the demo use shows by itself that it is read.
TEST(ScenarioFile, TakesArgumentsAndWhatFollowsThem) {
    EXPECT_EQ(only("page FtpFrm 2.5").seconds, 2.5);
    EXPECT_EQ(only("page nnn  # the details").seconds, 30);
    EXPECT_EQ(only("  press nnn.Image1(0)\t# the first tile").control, u"Image1(0)");
    EXPECT_FALSE(only("answer no").yes);
    EXPECT_EQ(only("drag tFrmNew.PicPic 50 50 60.5 0").to, QPointF(60.5, 0));
    EXPECT_FALSE(only("press-at RedI.Picture1 12.5 100").rightKey);
    EXPECT_TRUE(only("press-at RedI.Picture1 1 2 right # the other key").rightKey);
    EXPECT_EQ(only("expect-item kyoskNew.List1 3 121015GNBC:\\\\pics\\\\a b.jpg").text, u"121015GNBC:\\pics\\a b.jpg");
    EXPECT_EQ(only("until FtpFrm.Label4 20.0 all is there # really").text, u"all is there # really");
    EXPECT_FALSE(only("until-visible FtpFrm.Command28 20 no # hidden").yes);
}

TEST(ScenarioFile, TakesTextsAsTheyStandToTheEndOfTheLine) {
    struct Case {
        const char* line;
        const char16_t* text;
    };
    const Case cases[] = {
        {"type nnn.Text1 Dana Levi", u"Dana Levi"},
        {"type nnn.Text1", u""},
        {"type nnn.Text1  two blanks lead, one trails ", u" two blanks lead, one trails "},
        {"type nnn.Text1 one\\ntwo", u"one\ntwo"},
        {"type nnn.Text1 C:\\pics\\", u"C:\\pics\\"},
        {"type nnn.Text1 # 1\r", u"# 1"},
        {"expect-message  נא לבחור", u" נא לבחור"},
    };
    for (const Case& one : cases)
        EXPECT_EQ(only(one.line).text, QStringView(one.text)) << one.line;
}

TEST(ScenarioFile, TellsTheFirstBadLineWithItsNumber) {
    const char* const bad[] = {
        "dance nnn.Command1",
        "press Command1",
        "tick nnn.Check1 yes",
        "answer maybe",
        "expect-visible nnn.Label1",
        "expect-item a.b x text",
        "choose nnn.Combo1",
        "shot ../secret",
        "hold a.b soon",
        "press-at a.b 10 -1",
        "press-at a.b 10 10 right right",
    };
    for (const char* line : bad) {
        const auto file = ScenarioFile::parse(QByteArray("# a comment\n\npress nnn.Command1\n") + line + "\nnonsense\n",
                                              u"demo/a.scenario"_s);
        ASSERT_FALSE(file.ok()) << line;
        EXPECT_TRUE(file.failure().message.startsWith(u"demo/a.scenario:4: ")) << file.failure().message.toStdString();
    }
    EXPECT_FALSE(ScenarioFile::parse("type nnn.Text1 \xE9\xEA", u"s"_s).ok());
    EXPECT_FALSE(ScenarioFile::load(u"/nowhere/a.scenario"_s).ok());
}
