#include "common/FixedText.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <utility>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(LeftField, FillsWithBlanksAndCutsByCharacters) {
    EXPECT_EQ(LeftField(u"אב"_s, 4), u"אב  "_s);
    EXPECT_EQ(LeftField(u"1234"_s, 3), u"123"_s);
    EXPECT_EQ(LeftField(QString(), 2), u"  "_s);
}

TEST(Val, ReadsTheLeadingNumberOnly) {
    const std::pair<const char*, double> cases[] = {
        {"", 0},        {"abc", 0},      {"12abc", 12},  {"  7x", 7}, {"1 2 3", 123}, {"-0.5", -0.5},
        {".5.5", 0.5},  {"+3", 3},       {"- 4", -4},    {"--4", 0},  {"1e3x", 1000}, {"1d2", 100},
        {"1e", 1},      {"1e-", 1},      {"e5", 0},      {"1,5", 1},  {"007", 7},     {"-", 0},
        {"2E-8", 2e-8}, {"1.5e+2", 150}, {"12\n3", 123}, {"א5", 0},   {"0x10", 0}};
    for (const auto& [text, number] : cases)
        EXPECT_DOUBLE_EQ(Val(QString::fromUtf8(text)), number) << text;
    EXPECT_EQ(Val(u"1e999"_s), std::numeric_limits<double>::max());
    EXPECT_EQ(Val(u"-1e999"_s), std::numeric_limits<double>::lowest());
}

TEST(Val16, RoundsTiesToEvenAndNeverWraps) {
    EXPECT_EQ(Val16(u"2.5"_s), 2);
    EXPECT_EQ(Val16(u"3.5"_s), 4);
    EXPECT_EQ(Val16(u"-2.5"_s), -2);
    EXPECT_EQ(Val16(u"99999"_s), 32767);
    EXPECT_EQ(Val16(u"-99999"_s), -32768);
    EXPECT_EQ(HoldIn16Bits(std::nan("")), 0);
}

// Colour gains as the steps of a slider leave them in single precision.
TEST(PlainNumber, HasSevenDigitsAndNoExponent) {
    const std::pair<float, const char*> cases[] = {{1.05999994F, "1.06"},
                                                   {1.53999949F, "1.539999"},
                                                   {0.0999999642F, "0.09999996"},
                                                   {-0.0200000349F, "-0.02000003"},
                                                   {-2.24411494e-07F, "-0.0000002244115"},
                                                   {0, "0"},
                                                   {-0.0F, "0"},
                                                   {100, "100"},
                                                   {16777216.0F, "16777216"},
                                                   {0.99999999F, "1"},
                                                   {std::numeric_limits<float>::infinity(), "0"}};
    for (const auto& [number, text] : cases)
        EXPECT_EQ(PlainNumber(number).toStdString(), text);
}

TEST(HexToDecimal, ReadsSignedNumbersAndAnswers00ForTheRest) {
    const std::pair<const char*, const char*> cases[] = {
        {"ff", "255"},      {" &hFF ", "255"},  {"7FFF", "32767"},
        {"8000", "-32768"}, {"FFFF", "-1"},     {"0FFFF", "65535"},
        {"10000", "65536"}, {"FFFFFFFF", "-1"}, {"80000000", "-2147483648"},
        {"", "00"},         {"&H", "00"},       {"123456789", "00"},
        {"G1", "00"},       {"0x1F", "00"},     {"-1", "00"},
        {"+1", "00"},       {"1 2", "00"},
    };
    for (const auto& [hex, decimal] : cases)
        EXPECT_EQ(HexToDecimal(QString::fromLatin1(hex)).toStdString(), decimal) << hex;
}

TEST(TextToHex, CarriesANameThereAndBack) {
    const QString name = u"תמונה 01"_s;
    EXPECT_EQ(TextToHex(name), u"FAEEE5F0E4203031"_s);
    EXPECT_EQ(HexToChars(TextToHex(name)), name);
    EXPECT_EQ(TextToHex(u"漢"_s), u"3F"_s);
    EXPECT_EQ(HexToChars(u"4142zz43"_s), u"AB"_s + QChar(0) + u'C');
}

} // namespace
} // namespace lumora
