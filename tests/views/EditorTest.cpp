#include "PageLook.h"

#include "views/window/MainWindow.h"
#include "views/window/PageView.h"

#include <QWidget>

namespace lumora {

namespace {

class EditorLook : public PageLook {
protected:
    // The panel is at hand and hides nothing of the paper.
    static void expectBesidePaper(Walk& walk, const QString& panel) {
        const auto place = [&](const QString& name) {
            const QWidget& widget = walk.control(name);
            return QRect(widget.mapTo(&walk.program().window(), QPoint()), widget.size());
        };
        EXPECT_TRUE(walk.control(panel).isVisible());
        EXPECT_FALSE(place(panel).intersects(place(u"PicPic"_s)));
    }
};

} // namespace

TEST_P(EditorLook, ShowsEachToolWholeAndInReach) {
    Walk walk(GetParam());
    walk.toEditor();
    look(walk, u"30-editor"_s);
    const QString editor = u"tFrmNew"_s;
    // What a customer sees is in reach, and what doubles it or is the operator's is not in the way.
    for (const char* name : {"CommandImprove", "Image2(0)", "Image2(1)", "Image2(3)",  "Image2(4)",   "Image2(5)",
                             "Image2(6)",      "Image2(7)", "Image2(8)", "Image2(10)", "Image115",    "Image125",
                             "Image135",       "Image145",  "Image13",   "Image15",    "Image20",     "Image21",
                             "Image22",        "Image28",   "Image29",   "Command8",   "Combo4",      "Combo2",
                             "Misgerett",      "PicPic",    "Strip(1)",  "Strip(11)",  "CommandDone", "Frame4Opener"}) {
        const auto* widget = walk.program().window().frontView()->findChild<QWidget*>(QString::fromLatin1(name));
        ASSERT_TRUE(widget) << name;
        EXPECT_EQ(ControlFinder::whyNotPressable(*widget), QString()) << name;
    }
    for (const char* name : {"Command24", "Command10", "Label13", "Command14", "VScrollZ", "Image16", "Image4"})
        EXPECT_FALSE(walk.pressable(editor, QString::fromLatin1(name))) << name;

    go(walk, u"Frame4Opener :31-turn"_s);
    expectBesidePaper(walk, u"Frame4"_s);
    go(walk, u"Image16 Image13 :32-tones"_s);
    expectBesidePaper(walk, u"Frame3"_s);
    // Each press elsewhere closes the tones, and their own button does.
    for (const char* elsewhere : {"Image125", "Image145", "PicPic", "Image13"}) {
        if (!walk.pressable(editor, u"Frame3"_s))
            go(walk, u"Image13"_s);
        go(walk, QString::fromLatin1(elsewhere));
        EXPECT_FALSE(walk.pressable(editor, u"Frame3"_s)) << elsewhere;
    }
    go(walk, u"Image13 Image11"_s);
    // The caption's keyboard lies below the picture, which stays whole and can be dragged.
    go(walk, u"Image20 Image20 Image20 :33-frame Image29 :34-hints hintsClose Command8>mikledet :37-keyboard"_s);
    const auto* paper = walk.program().window().findChild<QWidget*>(u"PicPic"_s);
    EXPECT_EQ(paper->visibleRegion().boundingRect(), paper->rect());
    EXPECT_LT(paper->mapTo(&walk.program().window(), QPoint(0, paper->height())).y(),
              walk.program().window().frontView()->y());
    go(walk, u"Command5 :38-keyboard-symbols Command5"_s);
    walk.type(u"mikledet"_s, u"Text1"_s, GetParam().english ? u"Our summer 2024"_s : u"הקיץ שלנו 2024"_s);
    look(walk, u"39-caption"_s);
    go(walk, u"CommandDone>tFrmNew Strip(2)"_s);
    walk.settle(300);
    go(walk, u":35-other-picture Frame4Opener :35-turn"_s);
    expectBesidePaper(walk, u"Frame4"_s);
    go(walk, u"CommandDone>kyoskNew :36-pictures-edited"_s);
}

TEST_P(EditorLook, OpensTheOperatorsToolsWhereTheLabSaysSo) {
    Walk walk(GetParam(), u"[Operator]\nEditor = yes\n"_s);
    walk.toEditor();
    go(walk,
       u"CommandImprove Frame5Opener :40-operator Command6 Command9 pic4Msgrt Command14 Command4 :41-operator-tools"_s);
}

TEST(EditorByKeyboard, ReachesEachTool) {
    Walk walk({1024, 768});
    walk.toEditor();
    walk.activate();
    EXPECT_EQ(focusName(), u"Image2(0)"_s);
    QStringList wanted =
        u"Image2(1) Image2(3) Image2(5) Image2(7) Image2(10) Image115 Image13 Image15 Frame4Opener Image20 Image22 Combo4 Combo2 Misgerett Command8 Strip(3) CommandDone"_s
            .split(u' ');
    for (int i = 0; i < 60; ++i) {
        wanted.removeAll(focusName());
        walk.key(Qt::Key_Tab);
    }
    EXPECT_EQ(wanted, QStringList()) << qPrintable(wanted.join(u' '));
}

INSTANTIATE_TEST_SUITE_P(Screens, EditorLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
