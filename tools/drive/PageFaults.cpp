#include "drive/PageFaults.h"

#include "app/Program.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/kit/ChoiceCards.h"
#include "views/kit/Overlay.h"
#include "views/kit/TouchKeyboard.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"

#include <QAbstractButton>
#include <QAbstractItemModel>
#include <QAbstractScrollArea>
#include <QAccessible>
#include <QCheckBox>
#include <QComboBox>
#include <QImage>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QRegularExpression>
#include <QScrollArea>

#include <algorithm>
#include <climits>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// A part of one will do: names are cut where there is no room.
bool hasHebrew(const QString& text, const QString& data = {}) {
    static const QRegularExpression word(u"[\u0590-\u05FF]+"_s);
    for (auto found = word.globalMatch(text); found.hasNext();) {
        if (!data.contains(found.next().captured()))
            return true;
    }
    return false;
}

QString nameOf(const QWidget& widget) {
    return u"%1 \"%2\""_s.arg(QString::fromLatin1(widget.metaObject()->className()), widget.objectName());
}

QString nameOf(QAccessibleInterface& node) {
    return u"%1 \"%2\""_s.arg(QString::fromLatin1(node.object()->metaObject()->className()),
                              node.object()->objectName());
}

// What the keyboard can come to behind the panel.
void behind(QAccessibleInterface* node, const QWidget& panel, QStringList& faults) {
    const auto* widget = node ? qobject_cast<QWidget*>(node->object()) : nullptr;
    if (!widget || node->state().invisible)
        return;
    const bool apart = widget != &panel && !panel.isAncestorOf(widget) && !widget->isAncestorOf(&panel) &&
                       widget->focusPolicy() != Qt::NoFocus;
    if (apart)
        faults += u"a screen reader finds what a panel covers: "_s + nameOf(*widget);
    for (int i = 0; i < node->childCount(); ++i)
        behind(node->child(i), panel, faults);
}

// Buttons by their roles. What can be chosen excludes its neighbours, but for boxes to tick, the key of capitals and
// the switch of the language.
void rolesOf(QAccessibleInterface* node, QStringList& faults) {
    if (!node || !node->object() || node->state().invisible)
        return;
    if (const auto* button = qobject_cast<QAbstractButton*>(node->object())) {
        const bool box = qobject_cast<const QCheckBox*>(button);
        const bool keys = button->objectName() == u"keyCapitals"_s || button->objectName() == u"Check1"_s;
        const bool choice = !box && button->isCheckable() && !keys;
        const QAccessible::Role role = node->role();
        if (choice ? role != QAccessible::RadioButton
                   : role != QAccessible::Button && role != QAccessible::CheckBox && role != QAccessible::RadioButton)
            faults += u"%1 has the role %2"_s.arg(nameOf(*node)).arg(role);
        if (button->isCheckable() && (!node->state().checkable || node->state().checked != button->isChecked()))
            faults += u"a screen reader hears another mark than %1 shows"_s.arg(nameOf(*node));
    }
    for (int i = 0; i < node->childCount(); ++i)
        rolesOf(node->child(i), faults);
}

// Named in another language than the page has. In Hebrew a name or a number may stand in Latin letters where it is
// shown so.
void foreignNames(QAccessibleInterface* node, bool english, const QString& typed, QStringList& faults) {
    if (!node || !node->object() || node->state().invisible || node->object()->property("letterOfAnyLanguage").toBool())
        return;
    const QString name = node->text(QAccessible::Name);
    const auto* button = qobject_cast<QAbstractButton*>(node->object());
    static const QRegularExpression latinWord(u"[A-Za-z]{3,}"_s), data(u"\\.\\w+$|@"_s);
    const bool shown = !button || isolated(button->text()).contains(isolated(name));
    if (english ? hasHebrew(name, typed)
                : !shown && !hasHebrew(name) && name.contains(latinWord) && !name.contains(data))
        faults += u"%1 is called \"%2\""_s.arg(nameOf(*node), name);
    if (node->role() == QAccessible::ComboBox || node->role() == QAccessible::List)
        return; // rows are data
    for (int i = 0; i < node->childCount(); ++i)
        foreignNames(node->child(i), english, typed, faults);
}

void unnamed(QAccessibleInterface* node, QStringList& faults) {
    if (!node || !node->isValid() || node->state().invisible)
        return;
    switch (node->role()) {
    case QAccessible::Button:
    case QAccessible::CheckBox:
    case QAccessible::RadioButton:
    case QAccessible::EditableText:
    case QAccessible::ComboBox:
    case QAccessible::List:
        if (node->text(QAccessible::Name).trimmed().isEmpty() && node->object() &&
            node->object()->objectName() != u"qt_scrollarea_viewport"_s)
            faults += u"no accessible name: %1 \"%2\""_s.arg(
                QString::fromLatin1(node->object()->metaObject()->className()), node->object()->objectName());
        break;
    default:
        break;
    }
    if (node->role() == QAccessible::ComboBox)
        return; // its rows are a window of their own
    for (int i = 0; i < node->childCount(); ++i)
        unnamed(node->child(i), faults);
}

QString rowsOf(const QAbstractItemModel& model) {
    QString all;
    for (int row = 0; row < model.rowCount(); ++row)
        all += model.index(row, 0).data().toString() + u' ';
    return all;
}

// Of those that can be chosen.
int leastRow(const QWidget& widget) {
    int least = INT_MAX;
    if (const auto* box = qobject_cast<const QComboBox*>(&widget); box && box->count() > 0) {
        box->view()->ensurePolished();
        least = box->view()->sizeHintForRow(0);
    }
    const auto* list = qobject_cast<const QListWidget*>(&widget);
    for (int i = 0; list && list->focusPolicy() != Qt::NoFocus && i < list->count(); ++i) {
        if (list->item(i)->flags() & Qt::ItemIsEnabled)
            least = std::min(least, list->visualItemRect(list->item(i)).height());
    }
    return least;
}

bool insideScroller(const QWidget& widget) {
    for (const QWidget* parent = widget.parentWidget(); parent; parent = parent->parentWidget()) {
        if (qobject_cast<const QAbstractScrollArea*>(parent))
            return true;
    }
    return false;
}

// Drawn with room around it, the label puts ink outside its place. The rim of a letter may reach a pixel out.
bool cutsInk(QLabel& label) {
    constexpr int room = 30;
    constexpr int rim = 1;
    const QRect place = label.geometry();
    const QMargins margins = label.contentsMargins();
    label.setContentsMargins(margins + room);
    label.setGeometry(place + QMargins(room, room, room, room));
    QImage drawn(label.size(), QImage::Format_Alpha8);
    drawn.fill(0);
    label.render(&drawn, {}, {}, QWidget::RenderFlags());
    label.setContentsMargins(margins);
    label.setGeometry(place);
    const QRect seen(QPoint(room - rim, room - rim), place.size() + QSize(2 * rim, 2 * rim));
    for (int y = 0; y < drawn.height(); ++y) {
        for (int x = 0; x < drawn.width(); ++x) {
            if (!seen.contains(x, y) && drawn.constScanLine(y)[x] > 64)
                return true;
        }
    }
    return false;
}

// Of two controls that lie over one another a finger can't tell which it presses.
QStringList overlaps(const QWidget& root) {
    QStringList result;
    QList<std::pair<const QWidget*, QRect>> seen;
    for (const QWidget* control : root.findChildren<QWidget*>()) {
        if (!control->isVisible() ||
            !(qobject_cast<const QAbstractButton*>(control) || qobject_cast<const QLineEdit*>(control) ||
              qobject_cast<const QComboBox*>(control)))
            continue;
        const QRect place =
            control->visibleRegion().boundingRect().translated(control->mapTo(control->window(), QPoint()));
        for (const auto& [other, where] : seen) {
            if (where.intersects(place) && !other->isAncestorOf(control) && !control->isAncestorOf(other))
                result += u"%1 lies over %2"_s.arg(nameOf(*control), nameOf(*other));
        }
        seen += {control, place};
    }
    return result;
}

QString clippedText(const QWidget& widget) {
    if ((qobject_cast<const QPushButton*>(&widget) || widget.inherits("QCheckBox")) &&
        widget.sizeHint().width() > widget.width() + 1)
        return u"needs %1 and is %2 wide"_s.arg(widget.sizeHint().width()).arg(widget.width());
    return {};
}

} // namespace

QStringList pageFaults(Program& program, const QString& data) {
    const bool english = program.state().english();
    QStringList result;
    MainWindow& window = program.window();
    const int least = window.width() >= 800 && window.height() >= 600 ? 44 : 36; // a finger's width
    unnamed(QAccessible::queryAccessibleInterface(&window), result);
    QAccessibleInterface* const spoken = QAccessible::queryAccessibleInterface(&window);
    rolesOf(spoken, result);
    foreignNames(spoken, english, data, result);
    const Overlay* panel = frontOverlay(window);
    if (panel) {
        QAccessibleInterface* const box = QAccessible::queryAccessibleInterface(const_cast<Overlay*>(panel));
        const bool told = panel->objectName() == u"messagePanel"_s && !panel->findChild<QWidget*>(u"messageNo"_s);
        if (box->role() != (told ? QAccessible::AlertMessage : QAccessible::Dialog) &&
            (told || box->role() != QAccessible::AlertMessage))
            result += u"the panel has the role %1"_s.arg(box->role());
        if (box->text(QAccessible::Name).isEmpty())
            result += u"the panel has no name"_s;
    }
    const auto* keys = window.findChild<TouchKeyboard*>();
    if (panel && !(keys && keys->isVisible()))
        behind(spoken, *panel, result);
    const QWidget* root = keys && keys->isVisible() ? static_cast<const QWidget*>(keys)
                          : panel                   ? static_cast<const QWidget*>(panel)
                                                    : window.frontView();
    if (root->layoutDirection() != (english ? Qt::LeftToRight : Qt::RightToLeft))
        result += u"the page runs the other way"_s;
    if (english && hasHebrew(window.windowTitle()))
        result += u"a Hebrew title"_s;
    for (const Controls::Entry& entry : program.chain().front()->controls().all()) {
        if (!entry.caption)
            continue;
        const auto* cards = root->findChild<ChoiceCards*>(entry.name);
        const auto* mark = cards ? cards->card(entry.caption->text) : root->findChild<QAbstractButton*>(entry.name);
        if (mark && mark->isCheckable() &&
            mark->isChecked() != (cards || static_cast<const CheckCaption&>(*entry.caption).checked))
            result += u"%1 shows another mark than the page has"_s.arg(entry.name);
    }
    for (const auto* area : root->findChildren<QScrollArea*>()) {
        const auto parts = area->widget()->findChildren<QWidget*>(Qt::FindDirectChildrenOnly);
        for (auto at = parts.begin(); at != parts.end(); ++at) {
            for (auto other = parts.begin(); other != at; ++other) {
                if ((*at)->isVisible() && (*other)->isVisible() && (*at)->geometry().intersects((*other)->geometry()))
                    result += u"%1 lies over %2"_s.arg(nameOf(**at), nameOf(**other));
            }
        }
    }
    result += overlaps(*root);
    for (QWidget* widget : root->findChildren<QWidget*>()) {
        if (!widget->isVisible() || widget->size().isEmpty())
            continue;
        const auto* button = qobject_cast<const QAbstractButton*>(widget);
        const bool control =
            button ||
            (qobject_cast<const QLineEdit*>(widget) && !qobject_cast<const QComboBox*>(widget->parentWidget())) ||
            qobject_cast<const QComboBox*>(widget);
        const bool partOfBox = widget->parentWidget() && widget->parentWidget()->inherits("QComboBox");
        const bool foreign = insideScroller(*widget) || partOfBox;
        if (control && !partOfBox && (widget->width() < least || widget->height() < least))
            result +=
                u"%1 is %2x%3, under %4"_s.arg(nameOf(*widget)).arg(widget->width()).arg(widget->height()).arg(least);
        if (const int row = leastRow(*widget); row < least)
            result += u"%1 has rows of %2, under %3"_s.arg(nameOf(*widget)).arg(row).arg(least);
        if (control && !foreign) {
            if (widget->objectName().isEmpty())
                result += u"no object name: "_s + nameOf(*widget);
            const QRect whole = widget->rect();
            if (widget->visibleRegion().boundingRect() != whole)
                result += u"%1 is cut off"_s.arg(nameOf(*widget));
        }
        if (!foreign) {
            const QString clipped = clippedText(*widget);
            if (!clipped.isEmpty())
                result += u"%1: %2"_s.arg(nameOf(*widget), clipped);
            if (auto* label = qobject_cast<QLabel*>(widget); label && !label->text().isEmpty() && cutsInk(*label))
                result += u"%1 \"%2\" loses ink at an edge"_s.arg(nameOf(*label), label->text());
            if (qobject_cast<const QLabel*>(widget) && widget->visibleRegion().boundingRect() != widget->rect())
                result += u"%1 \"%2\" is cut off"_s.arg(nameOf(*widget), qobject_cast<const QLabel*>(widget)->text());
        }
        if (!foreign && button && (button->text() + button->accessibleName()).trimmed().isEmpty())
            result += u"no caption: "_s + nameOf(*widget);
        if (english && !widget->property("letterOfAnyLanguage").toBool()) {
            QString said = widget->accessibleName() + widget->accessibleDescription() + widget->toolTip();
            if (button)
                said += u' ' + button->text();
            if (const auto* label = qobject_cast<const QLabel*>(widget))
                said += u' ' + label->text();
            if (const auto* box = qobject_cast<const QComboBox*>(widget))
                said += u' ' + box->placeholderText() + u' ' + box->currentText() + u' ' + rowsOf(*box->model());
            if (const auto* line = qobject_cast<const QLineEdit*>(widget))
                said += u' ' + line->placeholderText();
            if (const auto* list = qobject_cast<const QListWidget*>(widget))
                said += u' ' + rowsOf(*list->model());
            if (hasHebrew(said, data))
                result += u"Hebrew on an English page: %1: %2"_s.arg(nameOf(*widget), said);
        }
    }
    return result;
}

} // namespace lumora
