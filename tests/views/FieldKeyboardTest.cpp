#include "PageLook.h"

#include "entry/details/nnn.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "views/kit/TouchKeyboard.h"
#include "views/window/DoubledPress.h"
#include "views/window/PageView.h"
#include "views/window/ScreenDialogs.h"

#include <QApplication>
#include <QComboBox>
#include <QLineEdit>
#include <QPointingDevice>
#include <QPushButton>
#include <QTest>

#include <memory>

namespace lumora {

namespace {

const QString byTouch = u"[Kiosk]\nKeyboard = auto\n"_s;
const QString toAlbum = toMenu + u"Image1(6) "_s;
const QString toClosing = toDetails + toOptions + toBorder + toTerms + toPictures + u"folder Picture1(0) Image7 "_s;

// The program under a finger: all that is touched goes through the window.
class Finger {
public:
    explicit Finger(const Screen& screen, const QString& labSettings = byTouch)
        : walk(screen, labSettings) {
        walk.activate();
    }
    MainWindow& window() { return walk.program().window(); }
    const QWidget* keys() { return window().findChild<TouchKeyboard*>(); }
    bool keysRise() { return keys() && keys()->isVisible(); }
    QLineEdit& field(const QString& name) {
        auto* box = qobject_cast<QComboBox*>(&walk.control(name));
        return box ? *box->lineEdit() : static_cast<QLineEdit&>(walk.control(name));
    }
    void go(const QString& route) {
        walk.go(route.section(u"folder "_s, 0, 0));
        if (route.contains(u"folder "_s)) {
            walk.pick(u"kyoskNew"_s, u"Image5"_s);
            walk.go(route.section(u"folder "_s, 1));
        }
        window().presses().rest();
    }
    // Keys of letters by what they type, others by their names.
    QPoint key(const QString& name) {
        for (const auto* found : window().findChildren<QPushButton*>(name)) {
            if (found->isVisible() && found->isEnabled())
                return middleOf(*found);
        }
        ADD_FAILURE() << "no key " << qPrintable(name);
        return {};
    }
    void hold(const QString& name, const std::function<bool()>& until) {
        const QPoint at = key(name);
        QTest::touchEvent(&window(), m_device.get()).press(0, at);
        EXPECT_TRUE(QTest::qWaitFor(until, 10000));
        QTest::touchEvent(&window(), m_device.get()).release(0, at);
    }
    // The second key goes down before the first one is up.
    void roll(const QString& first, const QString& second) {
        const QPoint a = key(first), b = key(second);
        auto hand = QTest::touchEvent(&window(), m_device.get(), false);
        hand.press(0, a).commit();
        hand.stationary(0).press(1, b).commit();
        hand.release(0, a).stationary(1).commit();
        hand.release(1, b).commit();
    }
    void touch(QPoint at) {
        QTest::touchEvent(&window(), m_device.get()).press(0, at);
        QTest::touchEvent(&window(), m_device.get()).release(0, at);
        QTest::qWait(0);
        window().renderNow();
    }
    QPoint middleOf(const QWidget& widget) { return widget.mapTo(&window(), widget.rect().center()); }
    void type(const QString& touched) {
        for (const QString& name : touched.split(u' ', Qt::SkipEmptyParts))
            touch(key(name.size() > 2 && !name.contains(u'.') ? name : u"key(%1)"_s.arg(name)));
    }

    Walk walk;

private:
    std::unique_ptr<QPointingDevice> m_device{QTest::createTouchDevice()};
};

} // namespace

TEST(FieldKeyboard, TypesWhatIsTouchedIntoAFieldThatIsSeenAboveIt) {
    const struct {
        bool english;
        QString way, field, keys, in, holds;
    } cases[] = {
        {false, toDetails, u"Text2"_s, u"ד נ ה keySpace ל ו י keyBack ז"_s, u"Text2"_s, u"דנה לוז"_s},
        {true, toDetails, u"Text2"_s, u"D a n a keySpace L keyCapitals E v i"_s, u"Text2"_s, u"Dana LEvi"_s},
        {true, toDetails, u"Text2"_s, u"keyLetters ר ח keySpace 4 / 2 keyNext 0 3 - 1 keyBack 2"_s, u"Text3"_s,
         u"03-2"_s},
        {true, toDetails, u"Text2"_s, u"keyLetters ר ח keySpace 4 / 2 keyNext 0 3"_s, u"Text2"_s, u"רח 4/2"_s},
        {false, toClosing, u"Text1"_s, u"d a n a @ gmail.com keyNext keyLetters O k"_s, u"Combo1"_s, u"gmail.com"_s},
        {true, toClosing, u"Text1"_s, u"d a n a walla.com keyNext keyNext B i g"_s, u"Text2"_s, u"Big"_s},
        {true, toClosing, u"Combo1"_s, u"l a b . e x"_s, u"Combo1"_s, u"lab.ex"_s},
        {false, toAlbum, u"Text1(0)"_s, u"א keyNext 0 5 keyNext ח keyNext o r @ l a b"_s, u"Combo4Mail"_s, u"lab"_s},
    };
    for (const auto& one : cases) {
        SCOPED_TRACE(one.keys.toStdString());
        Finger finger({{800, 600}, one.english});
        finger.go(one.way);
        finger.touch(finger.middleOf(finger.field(one.field)));
        finger.type(one.keys);
        EXPECT_EQ(finger.field(one.in).text(), one.holds);
        ASSERT_TRUE(finger.keysRise());
        const QWidget& field = *QApplication::focusWidget();
        EXPECT_LE(finger.middleOf(field).y() + field.height() / 2, finger.keys()->y());
        EXPECT_GE(finger.middleOf(field).y() - field.height() / 2, 0);
        finger.type(u"keyDone"_s);
        EXPECT_FALSE(finger.keysRise());
        EXPECT_EQ(finger.window().frontView()->y(), 0);
    }
}

TEST(FieldKeyboard, RisesForTheHandsThatTheLabHasNamedAndWhereWhatIsTypedIsSeen) {
    for (const auto& [keyboard, byMouse, byFinger] :
         {std::tuple("never", false, false), {"auto", false, true}, {"always", true, true}}) {
        SCOPED_TRACE(keyboard);
        Finger finger({{1024, 768}, true}, u"[Kiosk]\nKeyboard = "_s + QString::fromLatin1(keyboard) + u'\n');
        finger.go(toDetails);
        QLineEdit& field = finger.field(u"Text2"_s);
        field.setEchoMode(QLineEdit::Password);
        finger.touch(finger.middleOf(field));
        EXPECT_FALSE(finger.keysRise());
        field.setEchoMode(QLineEdit::Normal);
        QTest::mouseClick(&field, Qt::LeftButton);
        finger.walk.settle();
        EXPECT_EQ(finger.keysRise(), byMouse);
        finger.touch(finger.middleOf(field));
        EXPECT_EQ(finger.keysRise(), byFinger);
    }
}

TEST(FieldKeyboard, GoesAtARealKeyAndWithTheFocus) {
    Finger finger({{1024, 768}, true});
    Program& program = finger.walk.program();
    finger.go(toDetails);
    const std::pair<const char*, std::function<void()>> ends[] = {
        {"a key", [&] { finger.walk.key(Qt::Key_X); }},
        {"a box", [&] { program.dialogs().message(u"Look up"_s); }},
        {"a page", [&] { program.chain().show(PageId::SpltForm); }}};
    for (const auto& [what, end] : ends) {
        SCOPED_TRACE(what);
        program.dialogs().closeMessages();
        program.window().presses().rest();
        finger.touch(finger.middleOf(finger.field(u"Text2"_s)));
        ASSERT_TRUE(finger.keysRise());
        end();
        finger.walk.settle();
        EXPECT_FALSE(finger.keysRise());
        EXPECT_EQ(program.window().frontView()->y(), 0);
    }
}

TEST(FieldKeyboard, TakesADoubledTouchOfAFieldForOneAndFastTypingForTyping) {
    qint64 now = 1'000'000;
    Finger finger({{800, 600}, true});
    finger.go(toAlbum);
    finger.window().presses().setClock([&] { return now; });
    const auto& page = finger.walk.page<nnn>(PageId::nnn);
    const QLineEdit& mail = finger.field(u"Text1(3)"_s);
    const auto typed = [&] { return mail.text() + finger.field(u"Combo4Mail"_s).text(); };
    const QString before = typed();
    const QPoint field = finger.middleOf(mail);
    finger.touch(field);
    ASSERT_TRUE(finger.keysRise() && finger.keys()->geometry().contains(field)) << "a key lies there now";
    finger.touch(field);
    EXPECT_EQ(typed(), before);
    finger.type(u"h e l l"_s);
    finger.roll(u"key(o)"_s, u"key(w)"_s);
    EXPECT_EQ(mail.text(), u"hellow"_s);
    finger.hold(u"keyBack"_s, [&] { return mail.text().isEmpty(); });
    finger.type(u"keyDone"_s);
    for (const auto& [wait, stays] : {std::pair(0, true), {400, false}}) {
        now += wait;
        finger.touch(finger.middleOf(finger.walk.control(u"Command4"_s)));
        EXPECT_EQ(page.step() == nnn::Step::Album, stays);
    }
}

TEST(FieldKeyboard, TurnsItsLanguageWithThePageBelowIt) {
    Finger finger({{1024, 768}, false});
    finger.go(toDetails);
    finger.touch(finger.middleOf(finger.field(u"Text2"_s)));
    ASSERT_TRUE(finger.keysRise());
    finger.window().presses().rest();
    finger.touch(finger.middleOf(finger.walk.control(u"Command4Anglit"_s)));
    finger.walk.settle();
    ASSERT_TRUE(finger.keysRise());
    EXPECT_EQ(finger.keys()->layoutDirection(), Qt::LeftToRight);
    EXPECT_EQ(finger.keys()->findChild<QPushButton*>(u"keyDone"_s)->text(), u"Done");
}

class KeyboardLook : public PageLook {};

TEST_P(KeyboardLook, HasNoFaultInItsKeysAndTypesCopies) {
    Finger finger(GetParam());
    finger.go(toDetails);
    for (const auto& [name, file] : {std::pair(u"Text2"_s, u"40-keys"_s), {u"Text3"_s, u"40-keys-telephone"_s}}) {
        finger.touch(finger.middleOf(finger.field(name)));
        look(finger.walk, file);
    }
    finger.type(u"keyDone"_s);
    finger.go(toClosing.mid(toDetails.size()) + u"Command10"_s);
    const QWidget& copies = finger.walk.control(u"Label4(0)"_s);
    finger.touch(finger.middleOf(copies));
    finger.walk.settle();
    finger.type(u"copiesDigit(1) copiesDigit(2)"_s);
    look(finger.walk, u"40-copies"_s);
    finger.go(u"copiesDone Image7"_s);
    EXPECT_EQ(finger.walk.page<kyoskNew>(PageId::kyoskNew).controls().Label7.text, u"12"_s);
    finger.touch(finger.middleOf(finger.field(u"Text1"_s)));
    look(finger.walk, u"40-keys-mail"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, KeyboardLook,
                         ::testing::Values(Screen{{800, 600}, false}, Screen{{800, 600}, true},
                                           Screen{{1920, 1080}, false}, Screen{{1080, 1920}, true}),
                         PageLook::nameOf);

TEST(TabKey, GoesThroughAnAlbumInTheOrderOfReading) {
    for (const bool english : {false, true}) {
        Walk walk({{1024, 768}, english});
        const QWidget& window = walk.program().window();
        const auto place = [&](const QWidget& widget) { return QRect(widget.mapTo(&window, QPoint()), widget.size()); };
        walk.go(
            toAlbum + u"Text1(0)=Or Text1(1)=03-7654321 Text1(2)=Wedding Text1(3)=or Combo4Mail~gmail.com :who "
                      "Command17 SoogAlb(0) Check4+ Combo4Horim~30/40 :kind Command16 Combo4Godel(1) :size Command18 "
                      "Combo4Cricha(1) :cover Command19 Combo4Niyar(1) :paper Command20 Combo4Tosefet(1) :extras "
                      "Command21 :bill"_s,
            [&](const QString& panel) {
                walk.settle(60);
                const QWidget* before = nullptr;
                for (const QWidget* at = window.nextInFocusChain(); at != &window; at = at->nextInFocusChain()) {
                    if (!at->isVisible() || !at->isEnabled() || at->focusProxy() || !(at->focusPolicy() & Qt::TabFocus))
                        continue;
                    if (before) {
                        const QWidget* both = at;
                        while (!both->isAncestorOf(before))
                            both = both->parentWidget();
                        const QRect a = place(*before), b = place(*at);
                        const bool onward =
                            both->layoutDirection() == Qt::LeftToRight ? a.right() < b.left() : b.right() < a.left();
                        EXPECT_TRUE(a.bottom() < b.top() || (onward && a.top() < b.bottom()))
                            << qPrintable(panel) << ": " << qPrintable(before->objectName()) << " before "
                            << qPrintable(at->objectName());
                    }
                    before = at;
                }
            });
    }
}

} // namespace lumora
