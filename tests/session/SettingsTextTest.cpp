#include "session/lab/SettingsText.h"

#include "session/lab/Deployment.h"

#include <gtest/gtest.h>

#include <utility>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

const QString defaultText =
    u"TK1=0^TK1=0^TK2=zalamim234^ASP=tarvelmond^SRT=192.0.2.10^PAS=morvex482^USR=lumora^SRK=0^STY=30^MNA=56^ZPN=201100^"
    "D1=0913^D1=1015^D1=1318^D1=1521^D1=2030^D1=3040^D1=3045^D1=4060^D1=5070^D2=1015^D2=1318^"_s;

TEST(SettingsTextTest, WritesTheDefaultProfileInItsFixedOrder) {
    EXPECT_EQ(SettingsText(Deployment().profile), defaultText);
}

TEST(SettingsTextTest, WritesElevenSizesAtMostAndEmptyFieldsAsZero) {
    ClientProfile profile;
    profile.SizeList.fill(u"10/15"_s);
    const QString text = SettingsText(profile);
    EXPECT_EQ(text.count(u"D1=1015^"_s), 11);
    EXPECT_TRUE(text.startsWith(u"TK1=0^TK1=0^TK2=0^ASP=0^SRT=0^PAS=0^USR=0^SRK=0^STY=0^"_s));
    EXPECT_FALSE(text.contains(u"D2="_s));
}

TEST(SettingsTextTest, SplitsOddTextsWithoutLosingTheirPieces) {
    const std::pair<QString, QStringList> cases[] = {
        {"", {}},
        {"^", {}},
        {"alone", {}},
        {"a^", {}},
        {"a^b", {"b"}},
        {"a^b^", {"b"}},
        {"a^^b^", {"", "b"}},
        {"^b", {"b"}},
        {u"p^"_s.repeated(60), QStringList(34, u"p"_s)},
    };
    for (const auto& [text, pieces] : cases)
        EXPECT_EQ(SplitSettings(text).pieces, pieces) << text.toStdString();
    const SettingsPieces split = SplitSettings(defaultText);
    EXPECT_EQ(split.pieces.size(), 21);
    EXPECT_EQ(split.table[0] + split.table[1] + split.table[2], u"TK1=0^TK1=0");
}

TEST(SettingsTextTest, ScrambleGivesBackWhatIsInTheAlphabetAndDropsTheRest) {
    const QString alphabet = u"abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ1234567890@*-_\\/+!. ^="_s;
    ASSERT_EQ(alphabet.size(), 74);
    const QString scrambled = Scramble(alphabet);
    EXPECT_NE(scrambled, alphabet);
    EXPECT_EQ(QSet<QChar>(scrambled.begin(), scrambled.end()).size(), 74) << "two letters share one";
    EXPECT_EQ(Unscramble(scrambled), alphabet);
    EXPECT_EQ(Scramble(u"abc"_s), u"oC+");
    EXPECT_EQ(Unscramble(Scramble(u"a\u05D0,b"_s)), u"ab");
    EXPECT_EQ(Unscramble(Unscramble(Scramble(Scramble(defaultText)))), defaultText);
}

TEST(SettingsTextTest, KnowsTheFieldsOfAnOrderCard) {
    const auto size = orderCardEntry(SplitSettings(u"GodeDaf^10/15 cm^"_s));
    ASSERT_TRUE(size);
    EXPECT_EQ(size->line, u"   גודל דף   10/15 cm");
    EXPECT_EQ(size->number, 10);
    EXPECT_TRUE(orderCardEntry(SplitSettings(u"Mor^7"_s))->line.isEmpty());
    EXPECT_FALSE(orderCardEntry(SplitSettings(defaultText)));
}

} // namespace
} // namespace lumora
