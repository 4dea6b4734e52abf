// The page of pictures: the copies of a picture, typed on digits.
#include "selection/pictures/kyoskNew.h"
#include "session/SessionState.h"

namespace lumora {

bool kyoskNew::typesCopies() const {
    return m_state.screenKeys != ScreenKeys::Never;
}

void kyoskNew::askCopies(int cell) {
    if (!typesCopies() || !m_choice.chosen(cell))
        return;
    m_countedCell = cell;
    m_countedPath = m_choice.path(cell);
    m_copiesEntry.begin(m_choice.copies(cell));
    copiesPanel.visible = true;
    copiesPicture = Picture1[static_cast<std::size_t>(cell)].bitmap;
    showEntry();
}

void kyoskNew::typeCopies(int digit) {
    m_copiesEntry.type(digit);
    showEntry();
}

void kyoskNew::takeBackDigit() {
    m_copiesEntry.takeBack();
    showEntry();
}

void kyoskNew::showEntry() {
    copiesTyped.text = m_copiesEntry.text();
    copiesNote.text = m_copiesEntry.removes()
                          ? m_state.wording(u"התמונה תצא מההזמנה", u"The picture will go out of the order")
                          : m_state.wording(u"0 מוציא את התמונה מההזמנה", u"0 takes the picture out of the order");
    copiesDone.enabled = m_copiesEntry.copies().has_value();
    Q_EMIT changed();
}

void kyoskNew::closeEntry() {
    copiesPanel.visible = false;
    Q_EMIT changed();
}

// What a card has done meanwhile may have put another picture into the cell.
void kyoskNew::takeEntry() {
    closeEntry();
    if (m_copiesEntry.copies() && m_choice.path(m_countedCell) == m_countedPath && m_choice.chosen(m_countedCell))
        setCopies(m_countedCell, *m_copiesEntry.copies());
}

} // namespace lumora
