#include "views/kit/ScreenReader.h"

#include "views/kit/Overlay.h"

#include <QAbstractButton>
#include <QAccessible>
#include <QAccessibleWidget>
#include <QFrame>
#include <QLabel>
#include <QPushButton>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr const char* exclusive = "excludesOthers";
constexpr const char* alert = "alert";

bool isAlert(const QWidget& widget) {
    return widget.property(alert).toBool() || widget.property("role") == u"alarm"_s;
}

// A page or a window. While a panel lies over it, only the panel is there, and what was raised above it, as the keys.
class PageNode : public QAccessibleWidget {
public:
    using QAccessibleWidget::QAccessibleWidget;

    int childCount() const override {
        const auto open = uncovered();
        return open.isEmpty() ? QAccessibleWidget::childCount() : static_cast<int>(open.size());
    }
    QAccessibleInterface* child(int index) const override {
        const auto open = uncovered();
        return open.isEmpty() ? QAccessibleWidget::child(index)
                              : QAccessible::queryAccessibleInterface(open.value(index));
    }
    int indexOfChild(const QAccessibleInterface* child) const override {
        const auto open = uncovered();
        return open.isEmpty() ? QAccessibleWidget::indexOfChild(child)
               : child        ? static_cast<int>(open.indexOf(child->object()))
                              : -1;
    }
    QAccessibleInterface* childAt(int x, int y) const override {
        for (int i = childCount() - 1; i >= 0; --i) {
            QAccessibleInterface* const at = child(i);
            if (at && !at->state().invisible && at->rect().contains(x, y))
                return at;
        }
        return nullptr;
    }

private:
    // Empty where no panel is open.
    QObjectList uncovered() const {
        QObjectList result;
        for (QObject* part : widget()->children()) { // from the lowest to the highest
            const auto* seen = qobject_cast<QWidget*>(part);
            if (!seen || !seen->isVisible())
                continue;
            const auto* panel = qobject_cast<Overlay*>(part);
            if (panel && panel->isOpen())
                result = {part};
            else if (!result.isEmpty() && !panel)
                result += part;
        }
        return result;
    }
};

// What has no name of its own is called by its first words.
class PanelNode : public QAccessibleWidget {
public:
    PanelNode(QWidget* panel, QAccessible::Role otherwise)
        : QAccessibleWidget(panel)
        , m_otherwise(otherwise) {}

    QAccessible::Role role() const override { return isAlert(*widget()) ? QAccessible::AlertMessage : m_otherwise; }
    QString text(QAccessible::Text kind) const override {
        const QString own = QAccessibleWidget::text(kind);
        if (kind != QAccessible::Name || !own.isEmpty() || role() == QAccessible::Border)
            return own;
        for (const QLabel* label : widget()->findChildren<QLabel*>()) {
            if (label->isVisible() && !label->text().trimmed().isEmpty())
                return label->text().simplified();
        }
        return own;
    }
    QAccessible::State state() const override {
        QAccessible::State state = QAccessibleWidget::state();
        state.modal = m_otherwise == QAccessible::Dialog;
        return state;
    }

private:
    QAccessible::Role m_otherwise;
};

class ButtonNode : public QAccessibleWidget {
public:
    using QAccessibleWidget::QAccessibleWidget;

    QAccessible::Role role() const override {
        return !button().isCheckable()                 ? QAccessible::Button
               : button().property(exclusive).toBool() ? QAccessible::RadioButton
                                                       : QAccessible::CheckBox;
    }
    QString text(QAccessible::Text kind) const override {
        const QString own = QAccessibleWidget::text(kind);
        return kind == QAccessible::Name && own.isEmpty() ? button().text().replace(u"&&"_s, u"&"_s).simplified() : own;
    }
    QAccessible::State state() const override {
        QAccessible::State state = QAccessibleWidget::state();
        state.checkable = button().isCheckable();
        state.checked = button().isChecked();
        state.pressed = button().isDown();
        return state;
    }
    QStringList actionNames() const override {
        return QStringList{button().isCheckable() ? toggleAction() : pressAction()} + QAccessibleWidget::actionNames();
    }
    void doAction(const QString& name) override {
        if (name == pressAction() || name == toggleAction())
            button().click();
        else
            QAccessibleWidget::doAction(name);
    }

private:
    QAbstractButton& button() const { return static_cast<QAbstractButton&>(*widget()); }
};

QAccessibleInterface* node(const QString&, QObject* object) {
    if (auto* panel = qobject_cast<Overlay*>(object))
        return new PanelNode(panel, QAccessible::Dialog);
    if (auto* button = qobject_cast<QAbstractButton*>(object)) {
        const bool ours = qobject_cast<QPushButton*>(button) || button->inherits("lumora::CardButton");
        return ours ? new ButtonNode(button) : nullptr;
    }
    auto* widget = qobject_cast<QWidget*>(object);
    if (!widget)
        return nullptr;
    const QString role = widget->property("role").toString();
    if (role == u"page"_s || widget->objectName() == u"lumoraWindow"_s)
        return new PageNode(widget, widget->isWindow() ? QAccessible::Window : QAccessible::Client);
    if (!role.isEmpty() && qobject_cast<QFrame*>(widget) && widget->metaObject() == &QFrame::staticMetaObject)
        return new PanelNode(widget, QAccessible::Border);
    return nullptr;
}

} // namespace

void tellScreenReaders() {
    QAccessible::installFactory(node);
}

void excludeOthers(QAbstractButton& button) {
    button.setProperty(exclusive, true);
}

void setAlert(QWidget& panel) {
    panel.setProperty(alert, true);
}

void tellAlert(QWidget& widget) {
    if (!isAlert(widget))
        return;
    QAccessibleEvent event(&widget, QAccessible::Alert);
    QAccessible::updateAccessibility(&event);
}

} // namespace lumora
