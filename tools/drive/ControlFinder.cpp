#include "drive/ControlFinder.h"

#include "session/PageChain.h"
#include "views/kit/ChoiceCards.h"
#include "views/kit/PaletteBar.h"
#include "views/kit/TouchKeyboard.h"
#include "views/window/DoubledPress.h"
#include "views/window/FieldKeyboard.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QEventLoop>
#include <QKeyEvent>
#include <QLineEdit>
#include <QListWidget>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QPointingDevice>
#include <QPushButton>
#include <QScrollArea>
#include <QTimer>
#include <QWindow>
#include <QtGui/qtestsupport_gui.h>

#include <algorithm>
#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

Failure fail(const QString& text) {
    return {Failure::Kind::Other, text};
}

// The middle of the part of the widget that the window shows; a scroll area may hide the rest.
QPoint middleOf(const QWidget& widget) {
    return widget.visibleRegion().boundingRect().center();
}

// A tick box reacts only inside its own contents, and its tick mark is at one side.
QPoint placeToPress(const QWidget& widget) {
    const QRect box = widget.rect();
    return qobject_cast<const QCheckBox*>(&widget)
               ? QPoint(widget.layoutDirection() == Qt::RightToLeft ? box.right() - 16 : 16, box.center().y())
               : middleOf(widget);
}

void mouse(QWidget& widget, QPoint at, QEvent::Type type, Qt::MouseButtons held,
           Qt::MouseButton button = Qt::LeftButton) {
    QMouseEvent event(type, at, widget.mapTo(widget.window(), at), widget.mapToGlobal(at), button, held,
                      Qt::NoModifier);
    QApplication::sendEvent(&widget, &event);
}

// A finger at the screen, which comes to controls that know none as a mouse.
void finger(const QWidget& window, QPoint place, QEventPoint::State state) {
    static QPointingDevice* const screen = QTest::createTouchDevice();
    qt_handleTouchEvent(window.windowHandle(), screen, {{0, state, place, window.mapToGlobal(QPointF(place))}});
}

QPoint pointOf(const QWidget& widget, QPointF percent) {
    return {std::clamp(static_cast<int>(std::lround(percent.x() / 100 * widget.width())), 0, widget.width() - 1),
            std::clamp(static_cast<int>(std::lround(percent.y() / 100 * widget.height())), 0, widget.height() - 1)};
}

// A person scrolls to what lies outside the window.
void bringIntoSight(QWidget& widget) {
    for (QWidget* parent = widget.parentWidget(); parent; parent = parent->parentWidget()) {
        if (auto* area = qobject_cast<QScrollArea*>(parent))
            area->ensureWidgetVisible(&widget);
    }
}

QString unusable(const QWidget& widget) {
    if (!widget.isVisible() || widget.visibleRegion().isEmpty())
        return u"hidden"_s;
    return widget.isEnabled() ? QString() : u"disabled"_s;
}

QString coveredAt(const QWidget& widget, QPoint at) {
    QWidget* hit = widget.window()->childAt(widget.mapTo(widget.window(), at));
    if (hit == &widget || (hit && widget.isAncestorOf(hit)))
        return {};
    return hit ? u"covered by %1"_s.arg(hit->objectName().isEmpty()
                                            ? QString::fromLatin1(hit->metaObject()->className())
                                            : hit->objectName())
               : u"outside the window"_s;
}

void key(QWidget& widget, int code, const QString& text, Qt::KeyboardModifiers modifiers = Qt::NoModifier) {
    QKeyEvent press(QEvent::KeyPress, code, modifiers, text);
    QApplication::sendEvent(&widget, &press);
    QKeyEvent release(QEvent::KeyRelease, code, modifiers, text);
    QApplication::sendEvent(&widget, &release);
}

// The control as the view registered it; if no widget shows it, as the page holds it.
Result<PageView::Control> controlIn(const Result<PageView*>& view, const QString& page, const QString& control) {
    if (!view)
        return view.failure();
    const PageView::Control* bound = (*view)->control(control);
    PageView::Control found = bound ? *bound : PageView::Control{};
    for (const Controls::Entry& entry : (*view)->page().controls().all()) {
        if (entry.name != control)
            continue;
        found.name = control;
        if (!bound && entry.caption)
            found.caption = entry.caption;
        if (!found.list)
            found.list = entry.list;
    }
    return found.name.isEmpty() ? Result<PageView::Control>(fail(u"%1 has no control %2"_s.arg(page, control)))
                                : Result<PageView::Control>(found);
}

Result<const TextList*> listIn(const Result<PageView*>& view, const QString& page, const QString& control) {
    if (!view)
        return view.failure();
    const Result<PageView::Control> found = controlIn(view, page, control);
    if (found && found->list)
        return found->list;
    return fail(u"%1 has no list %2"_s.arg(page, control));
}

// The widget that receives the press; for a list or a text area its viewport.
QWidget& target(QWidget& widget) {
    auto* area = qobject_cast<QAbstractScrollArea*>(&widget);
    return area ? *area->viewport() : widget;
}

} // namespace

ControlFinder::ControlFinder(MainWindow& window, Hand hand)
    : m_window(window)
    , m_hand(hand)
    , m_keys(window) {
    if (hand == Hand::Keys)
        window.activateWindow();
}

QString ControlFinder::frontPage() const {
    return m_window.frontView() ? pageName(m_window.frontView()->page().id()) : QString();
}

Result<PageView*> ControlFinder::view(const QString& page) const {
    PageView* const below = m_window.viewBelow();
    const bool inFront = frontPage() == page;
    if (!inFront && !(below && pageName(below->page().id()) == page))
        return fail(u"the page in front is %1, not %2"_s.arg(frontPage().isEmpty() ? u"none"_s : frontPage(), page));
    m_window.renderNow();
    return inFront ? m_window.frontView() : below;
}

QString ControlFinder::whyNotPressable(const QWidget& widget) {
    const QString why = unusable(widget);
    if (!why.isEmpty())
        return why;
    return coveredAt(widget, middleOf(widget));
}

Result<QWidget*> ControlFinder::inSight(const QString& page, const QString& control) const {
    const Result<PageView*> found = view(page);
    if (!found)
        return found.failure();
    m_window.presses().rest();
    const PageView::Control* bound = (*found)->control(control);
    QWidget* widget = bound ? bound->widget.data() : (*found)->findChild<QWidget*>(control);
    if (!widget)
        return fail(u"%1 has no control %2 that can be pressed"_s.arg(page, control));
    if (m_hand == Hand::Keys) {
        // A disabled or hidden control takes no keyboard, and what lies outside the window comes as it gets it.
        if (const Result<void> there = m_keys.moveTo(*widget); !there)
            return fail(u"%1.%2: %3"_s.arg(page, control, there.failure().message));
    } else {
        bringIntoSight(*widget);
    }
    const QString why = unusable(*widget);
    if (!why.isEmpty())
        return fail(u"%1.%2 is %3"_s.arg(page, control, why));
    return widget;
}

Result<QWidget*> ControlFinder::pressable(const QString& page, const QString& control) const {
    const Result<QWidget*> widget = inSight(page, control);
    if (!widget)
        return widget.failure();
    const QString why = whyNotPressable(**widget);
    if (!why.isEmpty())
        return fail(u"%1.%2 is %3"_s.arg(page, control, why));
    return *widget;
}

Result<ControlFinder::Held> ControlFinder::hold(const QString& page, const QString& control) const {
    const Result<QWidget*> widget = pressable(page, control);
    if (!widget)
        return widget.failure();
    QWidget& hit = target(**widget);
    if (m_hand == Hand::Keys) {
        m_keys.press(Qt::Key_Space);
        return Held{*widget, {}, Qt::LeftButton, m_hand, (*widget)->window(), {}};
    }
    return pressDown(hit, middleOf(hit));
}

Result<ControlFinder::Hit> ControlFinder::hitAt(const QString& page, const QString& control, QPointF percent) const {
    const Result<QWidget*> found = inSight(page, control);
    if (!found)
        return found.failure();
    QWidget& widget = **found;
    const QPoint at = pointOf(widget, percent);
    const QString why = coveredAt(widget, at);
    if (!why.isEmpty())
        return fail(u"%1.%2 at %3 %4 is %5"_s.arg(page, control).arg(percent.x()).arg(percent.y()).arg(why));
    // A child widget at that point receives the press, as from a person.
    QWidget* inside = widget.childAt(at);
    return inside ? Hit{inside, inside->mapFrom(&widget, at)} : Hit{&widget, at};
}

Result<ControlFinder::Held> ControlFinder::hold(const QString& page, const QString& control, QPointF percent,
                                                Qt::MouseButton button) const {
    const Result<Hit> hit = hitAt(page, control, percent);
    if (!hit)
        return hit.failure();
    return pressDown(*hit->widget, hit->at, button);
}

ControlFinder::Held ControlFinder::pressDown(QWidget& widget, QPoint at, Qt::MouseButton button) const {
    const QPointer<QWidget> alive(&widget);
    QWidget* const window = widget.window();
    const QPoint place = widget.mapTo(window, at);
    if (window == &m_window)
        m_last = place;
    if (m_hand == Hand::Finger && button == Qt::LeftButton) {
        finger(*window, place, QEventPoint::Pressed);
        return {alive, at, button, m_hand, window, place};
    }
    // A widget that tracks the mouse sees it move before the press.
    if (widget.hasMouseTracking())
        mouse(widget, at, QEvent::MouseMove, Qt::NoButton, Qt::NoButton);
    if (alive)
        mouse(*alive, at, QEvent::MouseButtonPress, button, button);
    return {alive, at, button, Hand::Mouse, window, place};
}

void ControlFinder::letGo(const Held& held) const {
    if (held.hand == Hand::Keys)
        return m_keys.letGo(Qt::Key_Space);
    if (held.hand == Hand::Mouse) {
        if (held.widget && held.widget->isVisible())
            mouse(*held.widget, held.at, QEvent::MouseButtonRelease, Qt::NoButton, held.button);
        return;
    }
    if (!held.window)
        return;
    finger(*held.window, held.place, QEventPoint::Released);
    // The keys rise behind the touch.
    QCoreApplication::sendPostedEvents(m_window.findChild<FieldKeyboard*>(), QEvent::MetaCall);
}

void ControlFinder::pressAgain() const {
    if (m_hand == Hand::Keys)
        return m_keys.hit(Qt::Key_Return);
    if (!m_last)
        return;
    QWidget* const hit = m_window.childAt(*m_last);
    QWidget& widget = hit ? *hit : m_window;
    click(widget, widget.mapFrom(&m_window, *m_last));
}

Result<void> ControlFinder::pressAt(const QString& page, const QString& control, QPointF percent,
                                    Qt::MouseButton button) const {
    if (m_hand == Hand::Keys)
        return pressFieldByKeys(page, control, percent);
    const Result<Held> held = hold(page, control, percent, button);
    if (!held)
        return held.failure();
    letGo(*held);
    return {};
}

Result<void> ControlFinder::pressFieldByKeys(const QString& page, const QString& control, QPointF percent) const {
    const Result<QWidget*> found = pressable(page, control);
    if (!found)
        return found.failure();
    auto* bar = qobject_cast<PaletteBar*>(*found);
    if (!bar)
        return fail(u"no key presses a place of %1.%2"_s.arg(page, control));
    return m_keys.choose(*bar, std::min(static_cast<int>(percent.x() / 100 * bar->fields()), bar->fields() - 1));
}

Result<void> ControlFinder::drag(const QString& page, const QString& control, QPointF from, QPointF to) const {
    if (m_hand == Hand::Keys)
        return fail(u"no key drags %1.%2"_s.arg(page, control));
    const Result<QWidget*> found = inSight(page, control);
    if (!found)
        return found.failure();
    // Both ends are taken at the press, since the control may move under the mouse.
    const QPoint begin = (*found)->mapToGlobal(pointOf(**found, from));
    const QPoint end = (*found)->mapToGlobal(pointOf(**found, to));
    Result<Held> held = hold(page, control, from, Qt::LeftButton);
    if (!held)
        return held.failure();
    for (int i = 1; i <= dragMoves && held->widget; ++i) {
        const QPoint now = begin + (end - begin) * i / dragMoves;
        held->at = held->widget->mapFromGlobal(now);
        held->place = held->window->mapFromGlobal(now);
        if (held->hand == Hand::Finger)
            finger(*held->window, held->place, QEventPoint::Updated);
        else
            mouse(*held->widget, held->at, QEvent::MouseMove, Qt::LeftButton, Qt::NoButton);
    }
    letGo(*held);
    return {};
}

Result<void> ControlFinder::press(const QString& page, const QString& control) const {
    if (m_hand == Hand::Finger && page == u"keyboard"_s)
        return touchKey(control);
    const Result<QWidget*> widget = pressable(page, control);
    if (!widget)
        return widget.failure();
    if (m_hand == Hand::Keys)
        return m_keys.use(**widget);
    QWidget& hit = target(**widget);
    // A tick box is pressed on its box, since its label may cover the whole row.
    click(hit, m_hand == Hand::Finger ? placeToPress(hit) : middleOf(hit));
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
    if (m_hand == Hand::Finger) {
        const Result<QString> held = this->text(page, control);
        if (const Result<void> touched = press(page, control); !touched)
            return touched.failure();
        for (qsizetype i = 0; held && i < held->size(); ++i) {
            if (const Result<void> gone = touchKey(u"keyBack"_s); !gone)
                return gone.failure();
        }
        const Result<void> typed = touchType(page, control, text);
        return typed ? touchKey(u"keyDone"_s) : typed;
    }
    if (m_hand == Hand::Keys) {
        m_keys.hit(Qt::Key_A, Qt::ControlModifier);
        m_keys.hit(Qt::Key_Delete);
        m_keys.type(text);
        return {};
    }
    click(target(*widget), middleOf(target(*widget)));
    key(*widget, Qt::Key_A, {}, Qt::ControlModifier);
    key(*widget, Qt::Key_Delete, {});
    for (const QChar letter : text)
        key(*widget, letter == u'\n' ? int(Qt::Key_Return) : 0, QString(letter == u'\n' ? QChar(u'\r') : letter));
    return {};
}

Result<void> ControlFinder::touchKey(const QString& name) const {
    const auto* keyboard = m_window.findChild<TouchKeyboard*>();
    if (!keyboard || !keyboard->isVisible())
        return fail(u"no keys are on the screen"_s);
    for (QPushButton* found : keyboard->findChildren<QPushButton*>(name)) {
        if (!whyNotPressable(*found).isEmpty())
            continue;
        m_window.presses().rest();
        click(*found, middleOf(*found));
        return {};
    }
    return fail(u"no key \"%1\" can be touched"_s.arg(name));
}

Result<void> ControlFinder::touchType(const QString& page, const QString& control, const QString& text) const {
    if (const Result<void> touched = press(page, control); !touched)
        return touched.failure();
    for (const QChar letter : text) {
        const QString name = letter == u' ' ? u"keySpace"_s : u"key(%1)"_s.arg(letter);
        Result<void> typed = touchKey(name);
        // The other case, then the other letters in either.
        for (const QString& first : {u"keyCapitals"_s, u"keyLetters"_s, u"keyCapitals"_s}) {
            if (!typed && touchKey(first))
                typed = touchKey(name);
        }
        if (!typed)
            return typed.failure();
    }
    return {};
}

// The rows are a window of their own, which takes no press right behind the one that has opened it.
Result<void> ControlFinder::chooseRow(QComboBox& box, int row) const {
    if (m_hand == Hand::Keys)
        return m_keys.choose(box, row);
    if (m_hand == Hand::Mouse) {
        box.setCurrentIndex(row);
        Q_EMIT box.textActivated(box.itemText(row)); // these follow a press on the row
        Q_EMIT box.activated(row);
        return {};
    }
    const QPointer<QComboBox> alive(&box);
    click(box, middleOf(box));
    QEventLoop opening;
    QTimer::singleShot(QApplication::doubleClickInterval() + 50, &opening, &QEventLoop::quit);
    opening.exec();
    if (!alive || !box.view()->isVisible())
        return fail(u"%1 does not open"_s.arg(box.objectName()));
    QAbstractItemView& rows = *box.view();
    const QModelIndex index = box.model()->index(row, box.modelColumn());
    rows.scrollTo(index);
    click(*rows.viewport(), rows.visualRect(index).center());
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
        return chooseRow(*box, row);
    }
    if (auto* list = qobject_cast<QListWidget*>(*found)) {
        for (int row = 0; row < list->count(); ++row) {
            QListWidgetItem* item = list->item(row);
            if (item->data(Qt::UserRole).toString() != text && item->text() != text)
                continue;
            if (m_hand == Hand::Keys)
                return m_keys.choose(*list, row);
            list->scrollToItem(item);
            click(*list->viewport(), list->visualItemRect(item).center());
            return {};
        }
        return fail(u"%1.%2 has no row \"%3\""_s.arg(page, control, text));
    }
    if (auto* cards = qobject_cast<ChoiceCards*>(*found)) {
        QAbstractButton* card = cards->card(text);
        if (!card)
            return fail(u"%1.%2 has no row \"%3\""_s.arg(page, control, text));
        if (m_hand == Hand::Keys)
            return m_keys.use(*card);
        click(*card, middleOf(*card));
        return {};
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
    if (button->isChecked() == on)
        return {};
    if (m_hand == Hand::Keys)
        return m_keys.use(*button);
    click(*button, placeToPress(*button));
    return {};
}

Result<QString> ControlFinder::text(const QString& page, const QString& control) const {
    const Result<PageView::Control> found = controlIn(view(page), page, control);
    if (!found)
        return found.failure();
    const PageView::Control& is = *found;
    if (is.text)
        return is.text();
    if (is.caption)
        return is.caption->text;
    if (is.list)
        return is.list->currentItem();
    return fail(u"%1.%2 has no text"_s.arg(page, control));
}

Result<bool> ControlFinder::visible(const QString& page, const QString& control) const {
    const Result<PageView::Control> found = controlIn(view(page), page, control);
    if (!found)
        return found.failure();
    const QWidget* widget = found->widget;
    return widget && widget->isVisible();
}

Result<bool> ControlFinder::enabled(const QString& page, const QString& control) const {
    const Result<PageView::Control> found = controlIn(view(page), page, control);
    if (!found)
        return found.failure();
    const PageView::Control& is = *found;
    return is.widget ? is.widget->isEnabled() : is.caption && is.caption->enabled;
}

Result<int> ControlFinder::count(const QString& page, const QString& control) const {
    const Result<const TextList*> found = listIn(view(page), page, control);
    if (!found)
        return found.failure();
    return (*found)->count();
}

Result<QString> ControlFinder::item(const QString& page, const QString& control, int index) const {
    const Result<const TextList*> found = listIn(view(page), page, control);
    if (!found)
        return found.failure();
    const int count = (*found)->count();
    if (index < 0 || index >= count)
        return fail(u"%1.%2 has %3 rows, none with the index %4"_s.arg(page, control).arg(count).arg(index));
    return (*found)->item(index);
}

} // namespace lumora
