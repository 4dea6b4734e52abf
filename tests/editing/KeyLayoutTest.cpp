#include "editing/caption/KeyLayout.h"

#include "common/AnsiCodePage.h"

#include <gtest/gtest.h>

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

TEST(KeyLayout, LiesAsOnARealKeyboardInBothLanguages) {
    QString latin;
    QString capital;
    QString hebrew;
    for (const int key : KeyLayout::places()) {
        latin += KeyLayout::caption(key, Letters::Small);
        capital += KeyLayout::caption(key, Letters::Capital);
        hebrew += KeyLayout::caption(key, Letters::Hebrew);
    }
    EXPECT_EQ(latin, u"qwertyuiopasdfghjkl zxcvbnm,  "_s);
    EXPECT_EQ(capital, latin.toUpper());
    EXPECT_EQ(hebrew, u"  קראטוןםפשדגכעיחלךףזסבהנמצתץ,"_s);
}

} // namespace
} // namespace lumora
