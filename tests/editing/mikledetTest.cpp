#include "TheEditor.h"

#include <tuple>

namespace lumora {
namespace {

// The caption's keyboard over a picture that is open in the editor.
class CaptionKeys : public TheEditor {
protected:
    CaptionKeys() {
        open(lying).Command8_Click();
        stored.clear();
    }

    mikledet& page() { return chain.load<mikledet>(); }
    const mikledetControls& keys() { return page().controls(); }
    // What the stored record gives back.
    EditFields kept() const {
        EditFields fields;
        UnpackEditState(state.edit.EditState, fields);
        return fields;
    }
};

TEST_F(CaptionKeys, theSixtyFirstLetterIsRefusedWhileSpaceAndEnterGoOn) {
    for (int i = 0; i < 60; ++i)
        page().leter_Click(12);
    EXPECT_TRUE(machine.dialogs.messages.isEmpty());
    page().leter_Click(12);
    EXPECT_EQ(machine.dialogs.messages, QStringList{u"עד  60  אותיות"_s});
    EXPECT_EQ(stored.size(), 60);
    page().Command1_Click();
    page().Command7_Click();
    EXPECT_EQ(keys().Text1.text, QString(60, u'ש') + u" \r\n"_s);
    EXPECT_EQ(state.edit.TextBody, keys().Text1.text);
    state.EnglishTips = 1;
    page().KeyPress(u'x');
    EXPECT_EQ(machine.dialogs.messages.last(), u"Up to 60 letters"_s);
    EXPECT_EQ(kept().TextBody.size(), 63) << "the record has room for 70";
}

TEST_F(CaptionKeys, aBlankReachesThePictureWithTheNextKey) {
    page().Command3_Click();
    EXPECT_EQ(stored.size(), 0) << "nothing to take back";
    page().leter_Click(7);
    page().Command1_Click();
    EXPECT_EQ(keys().Text1.text, u"א "_s);
    EXPECT_EQ(state.edit.TextBody, u"א"_s);
    page().leter_Click(19);
    EXPECT_EQ(kept().TextBody, u"א ב"_s);
    page().leter_Click(11); // a key without a letter types a blank as a letter
    EXPECT_EQ(state.edit.TextBody, u"א ב "_s);
    page().Command3_Click();
    EXPECT_EQ(stored.size(), 4);
    EXPECT_EQ(state.edit.TextBody, u"א ב"_s);
    page().Command6_Click();
    EXPECT_TRUE(kept().TextBody.isEmpty());
    page().Command5_Click();
    page().leter_Click(KeyLayout::firstSymbol);
    page().leter_Click(KeyLayout::keys);
    EXPECT_EQ(keys().Text1.text.size(), 1) << "there is no such key";
    page().Command6_Click();
    for (const auto press : {&mikledet::Command2_Click, &mikledet::Command9_Click, &mikledet::Command4_Click}) {
        (page().*press)();
        page().leter_Click(0);
    }
    page().leter_Click(KeyLayout::firstDigit + 7);
    EXPECT_EQ(state.edit.TextBody, u"Ggע7"_s) << "letters change on their keys";
}

TEST_F(CaptionKeys, aHeldButtonIsLetGoWhenAnotherPageComes) {
    page().Image2_MouseDown();
    chain.show(PageId::tFrmNew);
    page().Image2_MouseUp();
    EXPECT_EQ(state.edit.TextFontSize, 24);
}

TEST_F(CaptionKeys, styleDirectionAlignmentAndColourReachTheRecord) {
    for (const auto& [style, vertical] : {std::pair(1, 3), std::pair(2, 0), std::pair(3, 3), std::pair(0, 0)}) {
        page().Image3_Click();
        page().Image4_Click();
        EXPECT_EQ(kept().TextStyle, style);
        EXPECT_EQ(kept().TextVertical, vertical);
    }
    page().Image5_Click(2);
    page().Image5_Click(3); // there is no fourth
    const QImage& palette = keys().Picture18Image.image();
    page().Picture18_MouseDown(palette.rect().bottomRight());
    page().Picture18_MouseDown({palette.width(), 0}); // outside
    EXPECT_EQ(kept().TextAlign, 2);
    EXPECT_TRUE(keys().Image5[2].checked);
    EXPECT_EQ(qRgb(kept().TextRed, kept().TextGreen, kept().TextBlue), palette.pixel(palette.rect().bottomRight()));
}

TEST_F(CaptionKeys, aRealKeyboardDoesWhatTheKeysDo) {
    for (const QChar character : u"Ab \"ש\rx\b\t\u0090"_s)
        page().KeyPress(character);
    EXPECT_EQ(kept().TextBody, keys().Text1.text);
    EXPECT_EQ(keys().Text1.text, u"Ab \u05F4ש\r\n"_s);
    page().KeyPress(u'\u0416');
    for (const QChar half : QString::fromUcs4(U"\U0001F600"))
        page().KeyPress(half);
    EXPECT_EQ(machine.dialogs.messages.size(), 2) << "one for each character that can't be printed";
    EXPECT_EQ(keys().Text1.text, u"Ab \u05F4ש\r\n"_s);
}

TEST_F(CaptionKeys, aRemovedCaptionIsSeenAsSoonAsItsKeyboardOpensAgain) {
    for (const bool careful : {false, true}) {
        SCOPED_TRACE(careful);
        state.Careful = careful;
        tFrmNew& editor = open(lying);
        editor.Command8_Click();
        page().KeyPress(u'D');
        state.edit.TextX = 60;
        state.edit.TextRed = 10;
        state.edit.TextFontSize = 31;
        page().Command8_Click();
        EXPECT_FALSE(keys().Check4.checked);
        const QImage without = paper();
        page().CommandDone_Click();
        editor.Command8_Click();
        EXPECT_NE(paper(), without);
        EXPECT_EQ(kept().TextOn, 1) << "what is seen prints";
        EXPECT_EQ(kept().TextBody, u"D"_s);
        EXPECT_EQ(QString::number(kept().TextFontSize) + u'/' + QString::number(kept().TextX),
                  careful ? u"31/60"_s : u"24/100"_s);
        EXPECT_EQ(kept().TextRed, careful ? 10 : 255);
    }
}

TEST_F(CaptionKeys, carefullyKeepsTheCaptionWithinItsColumnsAndTakesALineBreakBackWhole) {
    for (const bool careful : {false, true}) {
        SCOPED_TRACE(careful);
        state.Careful = careful;
        tFrmNew& editor = open(lying);
        editor.Command8_Click();
        page().open({}, true);
        for (const QChar character : u"a\rb\b\b"_s)
            page().KeyPress(character);
        EXPECT_EQ(state.edit.TextBody, careful ? u"a"_s : u"a\r"_s);
        for (const auto& [direction, from, builtIn, guarded] :
             {std::tuple(0, -98, -10, -99), {1, 998, 100, 999}, {2, -98, -10, -99}, {3, 998, 100, 999}}) {
            state.edit.TextX = state.edit.TextY = static_cast<std::int16_t>(from);
            page().Image15_MouseDown(direction);
            page().Timer1_Tick();
            page().Image15_MouseUp();
            EXPECT_EQ(direction < 2 ? kept().TextX : kept().TextY, careful ? guarded : builtIn);
        }
        state.edit.TextX = 100;
        editor.Command11_Click();
        editor.Labeltext_MouseDown({110, 110});
        editor.Labeltext_MouseMove({110 - 13 * 300, 110});
        editor.Labeltext_MouseUp();
        EXPECT_EQ(kept().TextX, careful ? -99 : 100) << "as built in, the place waits for the next change";
        EXPECT_EQ(shown().LabeltextBox.left, careful ? -99 : -200) << "the box stays at the caption";
        stored.clear();
        state.edit.TextFontSize = 94;
        for (const auto& [press, size] :
             {std::pair(&mikledet::Image1_MouseDown, careful ? 98 : 10), std::pair(&mikledet::Image2_MouseDown, 8)}) {
            (page().*press)();
            for (int i = 0; i < 3; ++i)
                page().Timer2_Tick();
            page().Image1_MouseUp();
            EXPECT_EQ(kept().TextFontSize, size);
            state.edit.TextFontSize = 12;
        }
        EXPECT_EQ(stored.size(), 2) << "once for a hold";
    }
}

TEST_F(CaptionKeys, beginsWithTheCaptionOfThePicture) {
    state.edit.TextBody = u"שלום"_s;
    chain.unload(PageId::mikledet);
    EXPECT_EQ(keys().Text1.text, u"שלום"_s);
    EXPECT_TRUE(keys().Check4.checked);
    chain.unload(PageId::mikledet);
    state.edit.TextOn = 0;
    EXPECT_TRUE(keys().Text1.text.isEmpty());
    EXPECT_FALSE(keys().Check4.checked);
    EXPECT_EQ(state.edit.TextFont, u"David"_s);
    EXPECT_EQ(state.edit.TextFontSize, 14);
}

} // namespace
} // namespace lumora
