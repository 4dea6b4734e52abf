#include "common/AnsiCodePage.h"

#include <gtest/gtest.h>

#include <iterator>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

// Bytes 80 to FF in rows of 16, as the published table of Windows-1255 has them; U+FFFD: no character.
constexpr char16_t upperHalf[] = u"€\u0081‚ƒ„…†‡ˆ‰\u008A‹\u008C\u008D\u008E\u008F"
                                 u"\u0090‘’“”•–—˜™\u009A›\u009C\u009D\u009E\u009F"
                                 u"\u00A0¡¢£₪¥¦§¨©×«¬\u00AD®¯"
                                 u"°±²³´µ¶·¸¹÷»¼½¾¿"
                                 u"\u05B0\u05B1\u05B2\u05B3\u05B4\u05B5\u05B6\u05B7\u05B8\u05B9\uFFFD\u05BB\u05BC\u05BD"
                                 u"\u05BE\u05BF\u05C0\u05C1\u05C2\u05C3װױײ׳״\uFFFD\uFFFD\uFFFD\uFFFD\uFFFD\uFFFD\uFFFD"
                                 u"אבגדהוזחטיךכלםמן"
                                 u"נסעףפץצקרשת\uFFFD\uFFFD\u200E\u200F\uFFFD";

TEST(AnsiCodePage, IsThePublishedTable) {
    ASSERT_EQ(std::size(upperHalf), 128U + 1);
    for (int byte = 0; byte < 256; ++byte) {
        const QByteArray one(1, static_cast<char>(byte));
        const QChar character(byte < 128 ? static_cast<char16_t>(byte) : upperHalf[byte - 128]);
        EXPECT_EQ(AnsiCodePage::decode(one), QString(character)) << byte;
        EXPECT_EQ(AnsiCodePage::encode(QString(character)), character == QChar(0xFFFD) ? QByteArray("?") : one) << byte;
    }
}

TEST(AnsiCodePage, TurnsEachForeignCharacterIntoOneQuestionMark) {
    EXPECT_EQ(AnsiCodePage::encode(u"aé漢😀ב"_s), QByteArray("a???\xe1"));
    EXPECT_EQ(AnsiCodePage::squeeze(u"ש漢"_s), u"ש?"_s);
    const QString loneSurrogates = QString(QChar(0xD800)) + u'x' + QChar(0xDC80);
    EXPECT_EQ(AnsiCodePage::encode(loneSurrogates), QByteArray("?x?"));
}

} // namespace
} // namespace lumora
