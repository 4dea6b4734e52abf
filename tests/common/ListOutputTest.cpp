#include "common/ListOutput.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

std::vector<std::pair<std::string, std::string>> read(const QByteArray& bytes) {
    std::vector<std::pair<std::string, std::string>> entries;
    for (const auto& entry : ReadListOutput(bytes))
        entries.emplace_back(entry.key.toStdString(), entry.value.toStdString());
    return entries;
}

TEST(ListOutput, WritesTextsNumbersAndDatesInTheirForms) {
    const QDateTime moment(QDate(2026, 11, 21), QTime(14, 5, 9));
    ListOutput output;
    output.pair(u"Shemot.maat"_s, u"מט"_s);
    output.text(QString()).number(-12).text(u"a \"b\", c"_s).endLine();
    output.date(moment).date(QDateTime(QDate(2026, 1, 2), QTime(0, 0))).date(std::nullopt).endLine();
    output.date(QDateTime(QDate(2026, 1, 3), QTime(0, 5, 9))).endLine();
    EXPECT_EQ(output.bytes(), QByteArray("\"Shemot.maat\",\"\xee\xe8\"\r\n"
                                         "\"\",-12,\"a \"b\", c\"\r\n"
                                         "#2026-11-21 14:05:09#,#2026-01-02#,#1899-12-30#\r\n"
                                         "#2026-01-03 00:05:09#\r\n"));
}

TEST(ReadListOutput, TakesAValueBackWhateverItHolds) {
    for (const char* value : {"", "plain", "a, b", "\"quoted\"", "say \"now\", please", "one\ntwo", "\n",
                              "ends with comma,", "C:\\pics\\x.jpg", "  blanks  "}) {
        ListOutput output;
        output.pair(u"before"_s, u"1"_s);
        output.pair(u"key"_s, QString::fromUtf8(value));
        output.pair(u"after"_s, u"2"_s);
        const std::vector<std::pair<std::string, std::string>> expected = {
            {"before", "1"}, {"key", value}, {"after", "2"}};
        EXPECT_EQ(read(output.bytes()), expected) << value;
    }
}

TEST(ReadListOutput, TakesBareNumbersAndEitherLineEndAndPassesOverLinesWithoutAKey) {
    const std::vector<std::pair<std::string, std::string>> expected = {
        {"Optint", "1"}, {"T", "#2026-11-21#"}, {"k", "v"}};
    EXPECT_EQ(read("\"Optint\",1\n\" \"\r\n\r\nrubbish\n\"T\",#2026-11-21#\r\n\"k\",\"v\""), expected);
}

TEST(ReadListOutput, LosesOneDamagedEntryAndNotTheLogBehindIt) {
    const auto entries = read("\"a\",\"never closed\r\n\"b\",\"2\"\r\n\"c\",\"3\"\r\n");
    ASSERT_EQ(entries.size(), 2U);
    EXPECT_EQ(entries[1].first, "c");
}

TEST(ListOutputLines, JoinsABreakInsideAQuotedItem) {
    EXPECT_EQ(ListOutputLines("\"Dana\r\nLevi\"\r\n\"x\ny\"\r\n"), QStringList({u"\"Dana\r\nLevi\""_s, u"\"x\ny\""_s}));
    EXPECT_EQ(ListOutputLines("1\r\n\r\n2"), QStringList({u"1"_s, QString(), u"2"_s}));
    EXPECT_EQ(ListOutputLines(""), QStringList());
}

TEST(WithoutEnds, StripsTheQuotesOfAStore) {
    EXPECT_EQ(WithoutEnds(u"\"Dana\""_s), u"Dana"_s);
    EXPECT_EQ(WithoutEnds(u"\""_s), QString());
}

} // namespace
} // namespace lumora
