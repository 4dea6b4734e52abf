#include "views/kit/Keyboard.h"

#include <QAbstractButton>
#include <QComboBox>
#include <QKeyEvent>
#include <QLineEdit>

namespace lumora {

bool pressByEnter(const QKeyEvent& event, QWidget* focus) {
    if (event.key() != Qt::Key_Return && event.key() != Qt::Key_Enter)
        return false;
    if (auto* button = qobject_cast<QAbstractButton*>(focus)) {
        if (!event.isAutoRepeat())
            button->click();
        return true;
    }
    if (auto* box = qobject_cast<QComboBox*>(focus); box && !box->isEditable()) {
        box->showPopup();
        return true;
    }
    return false;
}

bool endsTyping(const QKeyEvent& event, const QWidget* focus) {
    const auto* box = qobject_cast<const QComboBox*>(focus);
    return (event.key() == Qt::Key_Return || event.key() == Qt::Key_Enter) && !event.isAutoRepeat() &&
           (qobject_cast<const QLineEdit*>(focus) || (box && box->isEditable()));
}

} // namespace lumora
