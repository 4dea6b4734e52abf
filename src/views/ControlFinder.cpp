#include "views/ControlFinder.h"

#include "session/PageChain.h"
#include "views/MainWindow.h"
#include "views/PageView.h"

#include <QAbstractButton>
#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QKeyEvent>
#include <QLineEdit>
#include <QListWidget>
#include <QMouseEvent>
#include <QPlainTextEdit>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

Failure fail(const QString& text) {
    return {Failure::Kind::Other, text};
}

// A point of the widget that is really on the window, also when a scroll area cuts it.
QPoint middleOf(const QWidget& widget) {
    return widget.visibleRegion().boundingRect().center();
}

void mouse(QWidget& widget, QPoint at, QEvent::Type type, Qt::MouseButtons held) {
    QMouseEvent event(type, at, widget.mapTo(widget.window(), at), widget.mapToGlobal(at), Qt::LeftButton, held,
                      Qt::NoModifier);
    QApplication::sendEvent(&widget, &event);
}

void click(QWidget& widget, QPoint at) {
    const QPointer<QWidget> alive(&widget);
    mouse(widget, at, QEvent::MouseButtonPress, Qt::LeftButton);
    if (alive && alive->isVisible())
        mouse(*alive, at, QEvent::MouseButtonRelease, Qt::NoButton);
}

void key(QWidget& widget, int code, const QString& text, Qt::KeyboardModifiers modifiers = Qt::NoModifier) {
    QKeyEvent press(QEvent::KeyPress, code, modifiers, text);
    QApplication::sendEvent(&widget, &press);
    QKeyEvent release(QEvent::KeyRelease, code, modifiers, text);
    QApplication::sendEvent(&widget, &release);
}

// What really takes the press: a list or a text area does so by its viewport.
QWidget& target(QWidget& widget) {
    auto* area = qobject_cast<QAbstractScrollArea*>(&widget);
    return area ? *area->viewport() : widget;
}

} // namespace

QString ControlFinder::frontPage() const {
    return m_window.frontView() ? pageName(m_window.frontView()->page().id()) : QString();
}

Result<PageView*> ControlFinder::view(const QString& page) const {
    if (frontPage() != page)
        return fail(u"the page in front is %1, not %2"_s.arg(frontPage().isEmpty() ? u"none"_s : frontPage(), page));
    m_window.renderNow();
    return m_window.frontView();
}

QString ControlFinder::whyNotPressable(const QWidget& widget) {
    if (!widget.isVisible() || widget.visibleRegion().isEmpty())
        return u"hidden"_s;
    if (!widget.isEnabled())
        return u"disabled"_s;
    const QPoint at = middleOf(widget);
    QWidget* hit = widget.window()->childAt(widget.mapTo(widget.window(), at));
    if (hit != &widget && !(hit && widget.isAncestorOf(hit)))
        return hit ? u"covered by %1"_s.arg(hit->objectName().isEmpty()
                                                ? QString::fromLatin1(hit->metaObject()->className())
                                                : hit->objectName())
                   : u"outside the window"_s;
    return {};
}

Result<QWidget*> ControlFinder::pressable(const QString& page, const QString& control) const {
    const Result<PageView*> found = view(page);
    if (!found)
        return found.failure();
    const PageView::Control* bound = (*found)->control(control);
    QWidget* widget = bound ? bound->widget.data() : (*found)->findChild<QWidget*>(control);
    if (!widget)
        return fail(u"%1 has no control %2 that can be pressed"_s.arg(page, control));
    const QString why = whyNotPressable(*widget);
    if (!why.isEmpty())
        return fail(u"%1.%2 is %3"_s.arg(page, control, why));
    return widget;
}

Result<void> ControlFinder::press(const QString& page, const QString& control) const {
    const Result<QWidget*> widget = pressable(page, control);
    if (!widget)
        return widget.failure();
    QWidget& hit = target(**widget);
    // A tick box is pressed on its box: its label may be drawn over the whole row.
    click(hit, middleOf(hit));
    return {};
}

Result<void> ControlFinder::type(const QString& page, const QString& control, const QString& text) const {
    const Result<QWidget*> found = pressable(page, control);
    if (!found)
        return found.failure();
    QWidget* widget = *found;
    auto* box = qobject_cast<QComboBox*>(widget);
    if (box && box->isEditable())
        widget = box->lineEdit();
    if (!qobject_cast<QLineEdit*>(widget) && !qobject_cast<QPlainTextEdit*>(widget))
        return fail(u"%1.%2 takes no text"_s.arg(page, control));
    click(target(*widget), middleOf(target(*widget)));
    key(*widget, Qt::Key_A, {}, Qt::ControlModifier);
    key(*widget, Qt::Key_Delete, {});
    for (const QChar letter : text)
        key(*widget, letter == u'\n' ? int(Qt::Key_Return) : 0, QString(letter == u'\n' ? QChar(u'\r') : letter));
    return {};
}

Result<void> ControlFinder::choose(const QString& page, const QString& control, const QString& text) const {
    const Result<QWidget*> found = pressable(page, control);
    if (!found)
        return found.failure();
    if (auto* box = qobject_cast<QComboBox*>(*found)) {
        int row = box->findData(text);
        if (row < 0)
            row = box->findText(text);
        if (row < 0)
            return fail(u"%1.%2 has no row \"%3\""_s.arg(page, control, text));
        // The popup is a window of its own; what follows a press on its row is this.
        box->setCurrentIndex(row);
        Q_EMIT box->textActivated(box->itemText(row));
        Q_EMIT box->activated(row);
        return {};
    }
    if (auto* list = qobject_cast<QListWidget*>(*found)) {
        for (int row = 0; row < list->count(); ++row) {
            QListWidgetItem* item = list->item(row);
            if (item->data(Qt::UserRole).toString() != text && item->text() != text)
                continue;
            list->scrollToItem(item);
            click(*list->viewport(), list->visualItemRect(item).center());
            return {};
        }
        return fail(u"%1.%2 has no row \"%3\""_s.arg(page, control, text));
    }
    return fail(u"%1.%2 has no rows"_s.arg(page, control));
}

Result<void> ControlFinder::tick(const QString& page, const QString& control, bool on) const {
    const Result<QWidget*> found = pressable(page, control);
    if (!found)
        return found.failure();
    auto* button = qobject_cast<QAbstractButton*>(*found);
    if (!button || !button->isCheckable())
        return fail(u"%1.%2 can't be ticked"_s.arg(page, control));
    if (button->isChecked() != on) {
        const QRect box = button->rect();
        // Where its mark stands: a tick box answers only on its own contents.
        click(*button,
              qobject_cast<QCheckBox*>(button)
                  ? QPoint(button->layoutDirection() == Qt::RightToLeft ? box.right() - 16 : 16, box.center().y())
                  : middleOf(*button));
    }
    return {};
}

Result<QString> ControlFinder::text(const QString& page, const QString& control) const {
    const Result<PageView*> found = view(page);
    if (!found)
        return found.failure();
    if (const PageView::Control* bound = (*found)->control(control)) {
        if (bound->text)
            return bound->text();
        if (bound->caption)
            return bound->caption->text;
        if (bound->list)
            return bound->list->currentItem();
    }
    return fail(u"%1 has no control %2"_s.arg(page, control));
}

Result<bool> ControlFinder::visible(const QString& page, const QString& control) const {
    const Result<PageView*> found = view(page);
    if (!found)
        return found.failure();
    const PageView::Control* bound = (*found)->control(control);
    if (!bound)
        return fail(u"%1 has no control %2"_s.arg(page, control));
    return bound->widget && bound->widget->isVisible();
}

Result<bool> ControlFinder::enabled(const QString& page, const QString& control) const {
    const Result<PageView*> found = view(page);
    if (!found)
        return found.failure();
    const PageView::Control* bound = (*found)->control(control);
    if (!bound)
        return fail(u"%1 has no control %2"_s.arg(page, control));
    return bound->widget ? bound->widget->isEnabled() : bound->caption && bound->caption->enabled;
}

Result<int> ControlFinder::count(const QString& page, const QString& control) const {
    const Result<PageView*> found = view(page);
    if (!found)
        return found.failure();
    const PageView::Control* bound = (*found)->control(control);
    if (!bound || !bound->list)
        return fail(u"%1 has no list %2"_s.arg(page, control));
    return bound->list->count();
}

Result<QString> ControlFinder::item(const QString& page, const QString& control, int index) const {
    const Result<PageView*> found = view(page);
    if (!found)
        return found.failure();
    const PageView::Control* bound = (*found)->control(control);
    if (!bound || !bound->list)
        return fail(u"%1 has no list %2"_s.arg(page, control));
    if (index < 0 || index >= bound->list->count())
        return fail(
            u"%1.%2 has %3 rows, none with the index %4"_s.arg(page, control).arg(bound->list->count()).arg(index));
    return bound->list->item(index);
}

} // namespace lumora
