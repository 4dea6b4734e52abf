#include "editing/KeyLayout.h"

#include "common/AnsiCodePage.h"

#include <gtest/gtest.h>

#include <set>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;
using KeyLayout::Letters;

TEST(KeyLayout, OffersWhatTheOrderLogCanCarry) {
    for (const Letters letters : {Letters::Hebrew, Letters::Small, Letters::Capital}) {
        for (int key = 0; key < KeyLayout::keys; ++key) {
            const QString text = KeyLayout::caption(key, letters);
            ASSERT_EQ(text.size(), 1) << key;
            EXPECT_EQ(AnsiCodePage::squeeze(text), text) << key;
            EXPECT_NE(text, u"\""_s) << key;
        }
    }
    EXPECT_TRUE(KeyLayout::caption(KeyLayout::keys, Letters::Hebrew).isEmpty());
    EXPECT_TRUE(KeyLayout::caption(-1, Letters::Hebrew).isEmpty());
}

TEST(KeyLayout, HasEachLetterOnOneKeyAndBlanksOnTheOthers) {
    struct Case {
        Letters letters;
        QString alphabet;
        std::set<int> blanks;
    };
    for (const Case& given : {Case{Letters::Hebrew, u"אבגדהוזחטיךכלםמןנסעףפץצקרשת,"_s, {11, 26}},
                              Case{Letters::Small, u"abcdefghijklmnopqrstuvwxyz,"_s, {22, 25, 29}},
                              Case{Letters::Capital, u"ABCDEFGHIJKLMNOPQRSTUVWXYZ,"_s, {22, 25, 29}}}) {
        QString found;
        std::set<int> blanks;
        for (int key = 0; key < KeyLayout::letterKeys; ++key) {
            const QString text = KeyLayout::caption(key, given.letters);
            if (text == u" "_s)
                blanks.insert(key);
            else
                found += text;
        }
        for (const QChar letter : given.alphabet)
            EXPECT_EQ(found.count(letter), 1) << qPrintable(QString(letter));
        EXPECT_EQ(found.size(), given.alphabet.size());
        EXPECT_EQ(blanks, given.blanks);
    }
}

TEST(KeyLayout, LiesAsOnARealKeyboardInBothLanguages) {
    QString latin;
    QString hebrew;
    for (const int key : KeyLayout::places()) {
        latin += KeyLayout::caption(key, Letters::Small);
        hebrew += KeyLayout::caption(key, Letters::Hebrew);
    }
    EXPECT_EQ(latin, u"qwertyuiopasdfghjkl zxcvbnm,  "_s);
    EXPECT_EQ(hebrew, u"  קראטוןםפשדגכעיחלךףזסבהנמצתץ,"_s);
}

TEST(KeyLayout, TakesFromARealKeyboardWhatCanBePrinted) {
    EXPECT_EQ(KeyLayout::typed(u'ש'), u"ש"_s);
    EXPECT_EQ(KeyLayout::typed(u'ñ'), std::nullopt);
    EXPECT_EQ(KeyLayout::typed(u'"'), u"\u05F4"_s) << "a quoted text of the log can't hold the double quote";
    EXPECT_EQ(KeyLayout::typed(u'\t'), std::nullopt);
    EXPECT_EQ(KeyLayout::typed(QChar(0x0090)), std::nullopt);
    EXPECT_EQ(KeyLayout::typed(QChar(0xD83D)), std::nullopt) << "half of a smiley";
}

} // namespace
} // namespace lumora
