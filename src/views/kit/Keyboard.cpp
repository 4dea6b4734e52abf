#include "views/kit/Keyboard.h"

#include <QAbstractButton>
#include <QComboBox>
#include <QKeyEvent>

namespace lumora {

bool pressByEnter(const QKeyEvent& event, QWidget* focus) {
    if (event.key() != Qt::Key_Return && event.key() != Qt::Key_Enter)
        return false;
    if (auto* button = qobject_cast<QAbstractButton*>(focus)) {
        if (!event.isAutoRepeat())
            button->click();
        return true;
    }
    if (auto* box = qobject_cast<QComboBox*>(focus)) {
        box->showPopup();
        return true;
    }
    return false;
}

} // namespace lumora
