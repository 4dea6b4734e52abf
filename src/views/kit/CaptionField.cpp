#include "views/kit/CaptionField.h"

#include <QInputMethodEvent>
#include <QKeyEvent>
#include <QSignalBlocker>

namespace lumora {

using namespace Qt::StringLiterals;

CaptionField::CaptionField(Handlers handlers, QWidget* parent)
    : QLineEdit(parent)
    , m_handlers(std::move(handlers)) {
    setContextMenuPolicy(Qt::NoContextMenu);
    setAcceptDrops(false);
    setProperty("ownKeys", true);
    // A caption's base direction is left to right in both languages, as it is drawn on the print.
    setLayoutDirection(Qt::LeftToRight);
}

void CaptionField::showCaption(const QString& text) {
    QString shown = text;
    shown.replace(u"\r\n"_s, u" \u21B5 "_s).remove(u'\r').remove(u'\n');
    // Without a mark of its own a line that begins in Hebrew would turn over.
    shown.prepend(QChar(0x200E));
    if (shown == this->text())
        return;
    const QSignalBlocker quiet(this);
    setText(shown);
    setCursorPosition(static_cast<int>(shown.size()));
}

void CaptionField::type(QChar character) {
    if (hasSelectedText()) {
        deselect();
        m_handlers.cleared();
    }
    m_handlers.typed(character);
}

bool CaptionField::take(const QKeyEvent& event) {
    if (event.matches(QKeySequence::SelectAll)) {
        selectAll();
        return true;
    }
    switch (event.key()) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
        type(u'\r');
        return true;
    case Qt::Key_Backspace:
    case Qt::Key_Delete:
        if (hasSelectedText()) {
            deselect();
            m_handlers.cleared();
        } else if (event.key() == Qt::Key_Backspace) {
            type(u'\b');
        }
        return true;
    default:
        break;
    }
    if (event.text().isEmpty() || (event.modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier)))
        return false;
    bool taken = false;
    for (const QChar character : event.text()) {
        if (!character.isPrint() && !character.isSurrogate() && character != u'\r')
            continue;
        type(character);
        taken = true;
    }
    return taken;
}

void CaptionField::keyPressEvent(QKeyEvent* event) {
    if (!take(*event))
        event->ignore();
}

void CaptionField::inputMethodEvent(QInputMethodEvent* event) {
    for (const QChar character : event->commitString())
        type(character);
    event->accept();
}

void CaptionField::mousePressEvent(QMouseEvent* event) {
    deselect();
    setFocus(Qt::MouseFocusReason);
    event->accept();
}

} // namespace lumora
