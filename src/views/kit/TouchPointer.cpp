#include "views/kit/TouchPointer.h"

#include "views/kit/FingerMoves.h"

#include <QApplication>
#include <QMouseEvent>

#include <utility>

namespace lumora {

TouchPointer::TouchPointer(QObject* parent)
    : QObject(parent) {
    qApp->installEventFilter(this);
}

TouchPointer::~TouchPointer() {
    setHidden(false);
}

bool TouchPointer::eventFilter(QObject*, QEvent* event) {
    if (event->type() == QEvent::TouchBegin)
        setHidden(true);
    else if (event->type() == QEvent::MouseMove && !isTouch(static_cast<const QMouseEvent&>(*event)))
        setHidden(false);
    return false;
}

void TouchPointer::setHidden(bool hidden) {
    if (std::exchange(m_hidden, hidden) == hidden)
        return;
    if (hidden)
        QGuiApplication::setOverrideCursor(Qt::BlankCursor);
    else
        QGuiApplication::restoreOverrideCursor();
}

} // namespace lumora
