#include "drive/KeyHand.h"

#include "views/kit/PaletteBar.h"
#include "views/window/MainWindow.h"

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QApplication>
#include <QComboBox>
#include <QKeyEvent>
#include <QListWidget>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int stopsOfAPage = 200; // more than any page has
constexpr int rowsOfAList = 500;  // the same

void send(QWidget& widget, QEvent::Type type, int key, Qt::KeyboardModifiers modifiers, const QString& text) {
    QKeyEvent event(type, key, modifiers, text);
    QApplication::sendEvent(&widget, &event);
}

QString textOf(int key) {
    return key == Qt::Key_Return ? u"\r"_s : key == Qt::Key_Space ? u" "_s : key == Qt::Key_Tab ? u"\t"_s : QString();
}

bool hasKeyboard(const QWidget& control) {
    const QWidget* focus = QApplication::focusWidget();
    const auto* area = qobject_cast<const QAbstractScrollArea*>(&control);
    return focus && (focus == &control || focus == control.focusProxy() || (area && focus == area->viewport()));
}

bool isCheckable(const QWidget* widget) {
    const auto* button = qobject_cast<const QAbstractButton*>(widget);
    return button && button->isCheckable();
}

} // namespace

// An open list has the keyboard before the window.
QWidget& KeyHand::focus() const {
    if (QWidget* popup = QApplication::activePopupWidget())
        return popup->focusWidget() ? *popup->focusWidget() : *popup;
    QWidget* focus = QApplication::focusWidget();
    return focus ? *focus : static_cast<QWidget&>(m_window);
}

void KeyHand::press(int key) const {
    send(focus(), QEvent::KeyPress, key, Qt::NoModifier, textOf(key));
}

void KeyHand::letGo(int key) const {
    send(focus(), QEvent::KeyRelease, key, Qt::NoModifier, textOf(key));
}

void KeyHand::hit(int key, Qt::KeyboardModifiers modifiers) const {
    send(focus(), QEvent::KeyPress, key, modifiers, textOf(key));
    send(focus(), QEvent::KeyRelease, key, modifiers, textOf(key));
}

void KeyHand::type(const QString& text) const {
    for (const QChar letter : text) {
        if (letter == u'\n') {
            hit(Qt::Key_Return);
            continue;
        }
        send(focus(), QEvent::KeyPress, 0, Qt::NoModifier, letter);
        send(focus(), QEvent::KeyRelease, 0, Qt::NoModifier, letter);
    }
}

Result<void> KeyHand::moveTo(QWidget& control) const {
    for (int stop = 0; stop < stopsOfAPage; ++stop) {
        if (hasKeyboard(control))
            return {};
        hit(Qt::Key_Tab);
    }
    return Failure{Failure::Kind::Other, u"no Tab leads to %1"_s.arg(control.objectName())};
}

Result<void> KeyHand::use(QWidget& control) const {
    if (const Result<void> there = moveTo(control); !there)
        return there.failure();
    hit(isCheckable(&control) ? Qt::Key_Space : Qt::Key_Return);
    return {};
}

Result<void> KeyHand::choose(QComboBox& box, int row) const {
    if (const Result<void> there = moveTo(box); !there)
        return there.failure();
    hit(Qt::Key_Down, Qt::AltModifier);
    const QAbstractItemView& rows = *box.view();
    if (!rows.isVisible())
        return Failure{Failure::Kind::Other, u"%1 does not open"_s.arg(box.objectName())};
    hit(Qt::Key_Home);
    for (int i = 0; i < rowsOfAList && rows.currentIndex().row() < row; ++i)
        hit(Qt::Key_Down);
    if (rows.currentIndex().row() != row)
        return Failure{Failure::Kind::Other, u"no arrow leads to row %1 of %2"_s.arg(row).arg(box.objectName())};
    hit(Qt::Key_Return);
    m_window.activateWindow(); // where there is no screen a list that was open keeps the keyboard
    return {};
}

// The rows may lie side by side.
Result<void> KeyHand::choose(QListWidget& list, int row) const {
    if (const Result<void> there = moveTo(list); !there)
        return there.failure();
    hit(Qt::Key_Home);
    for (int i = 0; i < rowsOfAList && list.currentRow() != row; ++i) {
        const QRect at = list.visualItemRect(list.currentItem()), wanted = list.visualItemRect(list.item(row));
        hit(wanted.top() > at.bottom()   ? Qt::Key_Down
            : wanted.bottom() < at.top() ? Qt::Key_Up
            : wanted.left() > at.left()  ? Qt::Key_Right
                                         : Qt::Key_Left);
    }
    if (list.currentRow() != row)
        return Failure{Failure::Kind::Other, u"no arrow leads to row %1 of %2"_s.arg(row).arg(list.objectName())};
    hit(Qt::Key_Return);
    return {};
}

Result<void> KeyHand::choose(PaletteBar& bar, int field) const {
    if (const Result<void> there = moveTo(bar); !there)
        return there.failure();
    for (int i = 0; i < bar.fields(); ++i)
        hit(Qt::Key_Left);
    for (int i = 0; i < field; ++i)
        hit(Qt::Key_Right);
    return {};
}

} // namespace lumora
