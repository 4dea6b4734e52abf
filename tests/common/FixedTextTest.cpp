#include "common/FixedText.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace lumora {
namespace {

TEST(LeftField, FillsWithBlanksAndCutsByCharacters) {
    EXPECT_EQ(LeftField(QStringLiteral("אב"), 4), QStringLiteral("אב  "));
    EXPECT_EQ(LeftField(QStringLiteral("1234"), 3), QStringLiteral("123"));
    EXPECT_EQ(LeftField(QString(), 2), QStringLiteral("  "));
}

TEST(Val, ReadsTheLeadingNumberOnly) {
    const struct {
        const char* text;
        double number;
    } cases[] = {
        {"", 0},
        {"abc", 0},
        {"12abc", 12},
        {"  7x", 7},
        {"1 2 3", 123},
        {"-0.5", -0.5},
        {".5.5", 0.5},
        {"+3", 3},
        {"- 4", -4},
        {"--4", 0},
        {"1e3x", 1000},
        {"1d2", 100},
        {"1e", 1},
        {"1e-", 1},
        {"e5", 0},
        {"1,5", 1},
        {"007", 7},
        {"-", 0},
        {"2E-8", 2e-8},
        {"1.5e+2", 150},
        {"12\n3", 123},
        {"\xd7\x90"
         "5",
         0},
        {"0x10", 0},
    };
    for (const auto& each : cases)
        EXPECT_DOUBLE_EQ(Val(QString::fromUtf8(each.text)), each.number) << each.text;
    EXPECT_EQ(Val(QStringLiteral("1e999")), std::numeric_limits<double>::max());
    EXPECT_EQ(Val(QStringLiteral("-1e999")), std::numeric_limits<double>::lowest());
}

TEST(Val16, RoundsTiesToEvenAndNeverWraps) {
    EXPECT_EQ(Val16(QStringLiteral("2.5")), 2);
    EXPECT_EQ(Val16(QStringLiteral("3.5")), 4);
    EXPECT_EQ(Val16(QStringLiteral("-2.5")), -2);
    EXPECT_EQ(Val16(QStringLiteral("99999")), 32767);
    EXPECT_EQ(Val16(QStringLiteral("-99999")), -32768);
    EXPECT_EQ(HoldIn16Bits(std::nan("")), 0);
}

// Colour gains as the steps of a slider leave them in single precision.
TEST(PlainNumber, HasSevenDigitsAndNoExponent) {
    const struct {
        float number;
        const char* text;
    } cases[] = {
        {1.05999994F, "1.06"},           {1.29999971F, "1.3"},          {1.47999954F, "1.48"},
        {1.53999949F, "1.539999"},       {1.59999943F, "1.599999"},     {2.01999903F, "2.019999"},
        {0.399999976F, "0.4"},           {0.0999999642F, "0.09999996"}, {0.0399999656F, "0.03999997"},
        {-0.0200000349F, "-0.02000003"}, {-0.14000003F, "-0.14"},       {1.5199995F, "1.52"},
        {1.55999947F, "1.559999"},       {1.99999905F, "1.999999"},     {0.919999957F, "0.92"},
        {0.879999936F, "0.8799999"},     {0.0399997756F, "0.03999978"}, {-2.24411494e-07F, "-0.0000002244115"}};
    for (const auto& each : cases)
        EXPECT_EQ(PlainNumber(each.number).toStdString(), each.text);
    EXPECT_EQ(PlainNumber(0), QStringLiteral("0"));
    EXPECT_EQ(PlainNumber(-0.0F), QStringLiteral("0"));
    EXPECT_EQ(PlainNumber(100), QStringLiteral("100"));
    EXPECT_EQ(PlainNumber(16777216.0F), QStringLiteral("16777216"));
    EXPECT_EQ(PlainNumber(0.99999999F), QStringLiteral("1"));
    EXPECT_EQ(PlainNumber(std::numeric_limits<float>::infinity()), QStringLiteral("0"));
}

TEST(HexToDecimal, ReadsSignedNumbersAndAnswers00ForTheRest) {
    const struct {
        const char* hex;
        const char* decimal;
    } cases[] = {
        {"ff", "255"},      {" &hFF ", "255"},  {"7FFF", "32767"},
        {"8000", "-32768"}, {"FFFF", "-1"},     {"0FFFF", "65535"},
        {"10000", "65536"}, {"FFFFFFFF", "-1"}, {"80000000", "-2147483648"},
        {"", "00"},         {"&H", "00"},       {"123456789", "00"},
        {"G1", "00"},       {"0x1F", "00"},     {"-1", "00"},
        {"+1", "00"},       {"1 2", "00"},
    };
    for (const auto& each : cases)
        EXPECT_EQ(HexToDecimal(QString::fromLatin1(each.hex)).toStdString(), each.decimal) << each.hex;
}

TEST(TextToHex, CarriesANameThereAndBack) {
    const QString name = QStringLiteral("תמונה 01");
    EXPECT_EQ(TextToHex(name), QStringLiteral("FAEEE5F0E4203031"));
    EXPECT_EQ(HexToChars(TextToHex(name)), name);
    EXPECT_EQ(TextToHex(QStringLiteral("漢")), QStringLiteral("3F"));
    EXPECT_EQ(HexToChars(QStringLiteral("4142zz43")), QStringLiteral("AB") + QChar(0) + u'C');
}

TEST(FixedText, PadsNumbersAndFormsSizeCodes) {
    EXPECT_EQ(ZeroPadded(7, 4), QStringLiteral("0007"));
    EXPECT_EQ(ZeroPadded(12345, 4), QStringLiteral("2345"));
    EXPECT_EQ(SizeCode(QStringLiteral("10/15")), QStringLiteral("1015"));
    EXPECT_EQ(SizeCode(QStringLiteral("9/13")), QStringLiteral("9/13"));
    EXPECT_EQ(SizeCode(QString()), QString());
}

} // namespace
} // namespace lumora
