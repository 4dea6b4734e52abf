#include "common/AnsiCodePage.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(AnsiCodePage, GivesEachAssignedByteBackAsItWas) {
    int withoutCharacter = 0;
    for (int byte = 0; byte < 256; ++byte) {
        const QByteArray one(1, static_cast<char>(byte));
        const QString text = AnsiCodePage::decode(one);
        ASSERT_EQ(text.size(), 1) << byte;
        if (text[0] == QChar(0xFFFD))
            ++withoutCharacter;
        else
            EXPECT_EQ(AnsiCodePage::encode(text), one) << byte;
    }
    EXPECT_EQ(withoutCharacter, 11); // CA, D9 to DF, FB, FC, FF
}

TEST(AnsiCodePage, HasTheHebrewLettersAndTheSignsWhereWindowsHasThem) {
    const QByteArray expected = QByteArray::fromHex("fae5e3e4203a20a4808094a9d4");
    EXPECT_EQ(AnsiCodePage::encode(u"תודה : ₪€€”©װ"_s).toHex(), expected.toHex());
}

TEST(AnsiCodePage, TurnsEachForeignCharacterIntoOneQuestionMark) {
    EXPECT_EQ(AnsiCodePage::encode(u"aé漢😀ב"_s), QByteArray("a???\xe1"));
    EXPECT_EQ(AnsiCodePage::squeeze(u"ש漢"_s), u"ש?"_s);
    const QString loneSurrogates = QString(QChar(0xD800)) + u'x' + QChar(0xDC80);
    EXPECT_EQ(AnsiCodePage::encode(loneSurrogates), QByteArray("?x?"));
}

} // namespace
} // namespace lumora
