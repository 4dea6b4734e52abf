#include "finished/pieces/SpltForm.h"

#include "support/PageRig.h"

#include <gtest/gtest.h>

#include <utility>

namespace lumora {
namespace {

struct SpltFormTest : ::testing::Test, PageRig {
    SpltFormTest() {
        state.EnglishTips = 1;
        makeFolder(u"C:\\order\\sub"_s);
        registerBare({PageId::MoogMeret});
        registerPage<SpltForm>(PageId::SpltForm);
        chain.show(PageId::MoogMeret);
        chain.show(PageId::SpltForm);
    }
    SpltForm& page() { return static_cast<SpltForm&>(*chain.find(PageId::SpltForm)); }
    static DrivePath at(const char* leaf) { return u"C:\\order"_path / QString::fromLatin1(leaf); }
    // The boxes since the last call.
    QStringList told() { return std::exchange(machine.dialogs.messages, {}); }
    void choose(const char* leaf, void (SpltForm::*click)()) {
        machine.dialogs.picks = {at(leaf)};
        (page().*click)();
    }
};

TEST_F(SpltFormTest, AFolderIsCutAndItsFamiliesAreJoinedAgain) {
    write(at("1.jpp"), "0123456789");
    write(at("2.jpp"), "abcde");
    write(at("3.jpp"), "wxyz");
    write(at("order.txt"), "not cut");
    EXPECT_EQ(page().controls().Text2.text, u"400000"_s);
    choose("order.txt", &SpltForm::Command2_Click);
    EXPECT_EQ(page().controls().List4files.items(),
              QStringList({at("1.jpp").text(), at("2.jpp").text(), at("3.jpp").text(), at("order.txt").text()}));
    page().Text2_Change(u"4"_s);
    page().Command3_Click();
    EXPECT_EQ(page().phase(), SpltForm::Phase::Good);
    EXPECT_TRUE(page().controls().Label4Total.text.startsWith(u"Files cut: 3, pieces: 6."_s))
        << page().controls().Label4Total.text.toStdString();
    EXPECT_EQ(page().controls().Label4Where.text, at("meforakim").text());

    choose("meforakim\\1_jpp_001_003.prk", &SpltForm::Command8_Click);
    EXPECT_TRUE(page().controls().List4files.isEmpty());
    EXPECT_EQ(page().controls().Label1.text, u"6"_s);
    EXPECT_EQ(page().controls().Label5.text, u"3"_s);
    EXPECT_EQ(page().familyRow(0).words, u"Complete: 3 of 3"_s);
    EXPECT_EQ(page().familyRow(2).words, u"Short: 1 of 2"_s) << "an exact multiple";
    page().Command1_Click();
    EXPECT_EQ(read(at("meforakim\\moorkavim\\1.jpp")), "0123456789");
    EXPECT_EQ(read(at("meforakim\\moorkavim\\2.jpp")), "abcde");
    EXPECT_FALSE(machine.files.fileExists(at("meforakim\\moorkavim\\3.jpp")));
    EXPECT_EQ(page().phase(), SpltForm::Phase::Partly);
    EXPECT_EQ(page().controls().List4Bodedim.currentIndex(), 2) << "each family is selected before it is asked";
    page().Command4_Click();
    EXPECT_EQ(read(at("meforakim\\moorkavim\\3.jpp")), "wxyz");
    EXPECT_TRUE(page().controls().Label4Total.text.contains(u"declares 2"_s));
    choose("meforakim\\1_jpp_001_003.prk", &SpltForm::Command8_Click);
    EXPECT_EQ(page().familyRow(0).words, u"Surplus: the folder was read more than once"_s);
    page().List4Bodedim_Click(0);
    EXPECT_EQ(page().controls().List4Famely.count(), 6);
    EXPECT_EQ(machine.dialogs.messages, QStringList());
}

TEST_F(SpltFormTest, SplitOneCutsAPieceAndNothingElseAndACancelledPickChangesNothing) {
    write(at("a_jpp_001_001.prk"), "abcdef");
    write(at("a.jpp"), "abcdef");
    page().Text2_Change(u"4"_s);
    choose("a.jpp", &SpltForm::Command9_Click);
    EXPECT_EQ(page().phase(), SpltForm::Phase::Partly);
    EXPECT_FALSE(machine.files.folderExists(at("meforakim")));
    choose("a.jpp", &SpltForm::Command2_Click);
    for (auto click : {&SpltForm::Command2_Click, &SpltForm::Command8_Click, &SpltForm::Command9_Click})
        (page().*click)();
    EXPECT_EQ(page().phase(), SpltForm::Phase::Idle);
    EXPECT_EQ(page().controls().List4files.count(), 2);
    EXPECT_EQ(page().controls().ListChalakim.count(), 0);
    choose("a_jpp_001_001.prk", &SpltForm::Command9_Click);
    EXPECT_EQ(read(at("meforakim\\a_jpp_001_001_prk_002_002.prk")), "ef");
    EXPECT_EQ(machine.dialogs.messages, QStringList());
}

TEST_F(SpltFormTest, EachTroubleIsToldOnceAndTheRestGoesOn) {
    write(at("1.jpp"), "0123456789");
    write(at("2.jpp"), "abcde");
    choose("1.jpp", &SpltForm::Command2_Click);
    page().Text2_Change(u"0"_s);
    page().Command3_Click();
    choose("1.jpp", &SpltForm::Command9_Click);
    EXPECT_EQ(told().filter(u"2147483647"_s).size(), 2) << "the largest size stands in the box";
    EXPECT_FALSE(machine.files.folderExists(at("meforakim")));

    page().Text2_Change(u"4"_s);
    ASSERT_TRUE(machine.files.removeFile(at("1.jpp")).ok());
    page().Command3_Click();
    EXPECT_EQ(told().filter(at("1.jpp").text()).size(), 1);
    EXPECT_EQ(page().phase(), SpltForm::Phase::Failed);
    EXPECT_EQ(read(at("meforakim\\2_jpp_002_002.prk")), "e");

    write(at("meforakim\\a.prk"), "short name");
    choose("meforakim\\2_jpp_001_002.prk", &SpltForm::Command8_Click);
    ASSERT_EQ(page().controls().List4Bodedim.count(), 2);
    ASSERT_TRUE(machine.files.removeFile(at("meforakim\\2_jpp_001_002.prk")).ok());
    for (int i = 0; i < 2; ++i) {
        page().List4Bodedim_Click(i);
        page().Command4_Click();
        EXPECT_EQ(page().phase(), SpltForm::Phase::Failed);
        EXPECT_EQ(page().familyRow(i).words, u"Not joined"_s);
        EXPECT_EQ(told().size(), 1);
    }
    EXPECT_FALSE(machine.files.folderExists(at("meforakim\\moorkavim")));
    choose("gone\\1_jpp_001_001.prk", &SpltForm::Command8_Click);
    EXPECT_EQ(told().filter(at("gone").text()).size(), 1);

    for (const char* leaf : {"7.jpp", "8.jpp", "9.jpp"})
        write(at(leaf), "gone before it is cut");
    choose("7.jpp", &SpltForm::Command2_Click);
    for (const QString& path : page().controls().List4files.items())
        (void)machine.files.removeFile(DrivePath(path));
    page().Command3_Click();
    EXPECT_EQ(told().size(), 1) << "one box for all of them";
    choose("7_jpp_001_001.prk", &SpltForm::Command9_Click);
    EXPECT_EQ(page().controls().Label4Total.text, u"7_jpp_001_001.prk was not cut to its end. Pieces: 0."_s);
}

TEST_F(SpltFormTest, APieceThatCanNotBeWrittenEndsTheWorkWithOneMessage) {
    makeFolder(at("meforakim\\1_jpp_003_005.prk"));
    write(at("1.jpp"), QByteArray(36, '1'));
    write(at("2.jpp"), QByteArray(1, '2'));
    choose("1.jpp", &SpltForm::Command2_Click);
    page().Text2_Change(u"9"_s);
    page().Command3_Click();
    const QStringList boxes = told();
    EXPECT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes.value(0).contains(u"Pieces written: 2 of 5"_s)) << boxes.value(0).toStdString();
}

TEST_F(SpltFormTest, TheOperatorMayStopOrLeaveBetweenTwoPieces) {
    write(at("1.jpp"), "0123456789");
    write(at("2.jpp"), "0123456789");
    choose("1.jpp", &SpltForm::Command2_Click);
    page().Text2_Change(u"2"_s);
    machine.pump.onPump = [&] {
        EXPECT_TRUE(page().controls().Command15.visible);
        EXPECT_FALSE(page().controls().Command3.enabled);
        page().Command3_Click(); // nothing begins below
        if (machine.pump.count == 4)
            page().Command15_Click();
    };
    page().Command3_Click();
    EXPECT_EQ(machine.files.names(at("meforakim"), {u'*'}).size(), 3);
    EXPECT_NE(page().phase(), SpltForm::Phase::Working);
    EXPECT_TRUE(page().controls().Label4Total.text.contains(u"stopped"_s));

    machine.pump.onPump = [&] { page().Image3_Click(); };
    page().Command3_Click();
    EXPECT_EQ(chain.front()->id(), PageId::MoogMeret);
    EXPECT_FALSE(chain.find(PageId::SpltForm));
}

} // namespace
} // namespace lumora
