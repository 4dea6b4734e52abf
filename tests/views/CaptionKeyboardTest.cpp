#include "PageLook.h"

#include "editing/caption/mikledet.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"

#include <QTest>
#include <QWidget>

#include <gtest/gtest.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

class CaptionKeyboard : public PageLook {};

} // namespace

TEST_P(CaptionKeyboard, FitsBelowThePictureWithEveryKeyInReach) {
    Walk walk(GetParam());
    PageChain& chain = walk.program().chain();
    SessionState& state = walk.program().state();
    state.edit.TextOn = 1;
    chain.show(PageId::mikledet);
    auto& page = walk.page<mikledet>(PageId::mikledet);
    page.Check4_Click(true);
    look(walk, u"30-keyboard"_s);
    MainWindow& window = walk.program().window();
    EXPECT_LE(window.frontView()->height(), window.height() * 48 / 100);

    const ControlFinder finder(window);
    const auto press = [&](int key) {
        const Result<void> done = finder.press(u"mikledet"_s, u"leter(%1)"_s.arg(key));
        EXPECT_TRUE(done.ok()) << (done ? "" : qPrintable(done.failure().message));
    };
    for (int key = 0; key < KeyLayout::firstSymbol; ++key)
        press(key);
    EXPECT_EQ(page.controls().Text1.text.size(), KeyLayout::firstSymbol);
    look(walk, u"31-keyboard-text"_s);
    walk.press(u"mikledet"_s, u"Command5"_s);
    look(walk, u"32-keyboard-symbols"_s);
    for (int key = KeyLayout::firstSymbol; key < KeyLayout::keys; ++key) {
        press(key);
        EXPECT_TRUE(finder.press(u"mikledet"_s, u"Command5"_s).ok());
    }
    EXPECT_EQ(page.controls().Text1.text.size(), 60);
}

TEST_P(CaptionKeyboard, StandsBelowThePictureThatItWritesOn) {
    Walk walk(GetParam());
    walk.toEditor();
    walk.press(u"tFrmNew"_s, u"Command8"_s);
    walk.waitFor(u"mikledet"_s);
    walk.type(u"mikledet"_s, u"Text1"_s, GetParam().english ? u"Our summer 2024"_s : u"הקיץ שלנו 2024"_s);
    for (int i = 0; i < 4; ++i)
        walk.press(u"mikledet"_s, u"Image1"_s);
    walk.press(u"mikledet"_s, u"Image3"_s);
    look(walk, u"33-caption"_s);
    walk.press(u"mikledet"_s, u"CommandDone"_s);
    walk.waitFor(u"tFrmNew"_s);
    look(walk, u"34-captioned"_s);
}

TEST(CaptionPanel, TakesARealKeyboardTheTapOfAHeldButtonAndAFieldOfThePalette) {
    Walk walk({1024, 768});
    SessionState& state = walk.program().state();
    PageChain& chain = walk.program().chain();
    state.edit.TextFontSize = 24;
    state.edit.TextOn = 1;
    chain.show(PageId::mikledet);
    auto& page = walk.page<mikledet>(PageId::mikledet);
    walk.type(u"mikledet"_s, u"Text1"_s, u"שלום 24"_s);
    EXPECT_EQ(state.edit.TextBody, u"שלום 24"_s);
    walk.type(u"mikledet"_s, u"Text1"_s, u"a\nb"_s);
    EXPECT_EQ(state.edit.TextBody, u"a\r\nb"_s) << "typing replaces";
    walk.press(u"mikledet"_s, u"leter(%1)"_s.arg(KeyLayout::firstDigit + 5));
    EXPECT_EQ(page.controls().Text1.text, u"a\r\nb5"_s);
    QTest::keyClick(walk.program().window().frontView(), Qt::Key_Backspace);
    EXPECT_EQ(page.controls().Text1.text, u"a\r\nb"_s) << "wherever the keyboard is";

    walk.press(u"mikledet"_s, u"Image1"_s);
    EXPECT_EQ(state.edit.TextFontSize, 26);
    const auto y = state.edit.TextY;
    walk.press(u"mikledet"_s, u"Image15(2)"_s);
    EXPECT_EQ(state.edit.TextY, y - 2);

    const QImage& palette = page.controls().Picture18Image.image();
    for (const double percent : {3.0, 40.0, 97.0}) {
        const ControlFinder finder(walk.program().window());
        EXPECT_TRUE(finder.pressAt(u"mikledet"_s, u"Picture18"_s, {percent, 50}).ok());
        const QRgb wanted = palette.pixel(static_cast<int>(palette.width() * percent / 100), palette.height() / 2);
        EXPECT_EQ(qRgb(state.edit.TextRed, state.edit.TextGreen, state.edit.TextBlue), wanted) << percent;
    }
    QTest::keyClick(walk.program().window().frontView(), Qt::Key_Escape);
    EXPECT_EQ(chain.front()->id(), PageId::tFrmNew);
}

INSTANTIATE_TEST_SUITE_P(Screens, CaptionKeyboard, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
