#include "session/TextList.h"

#include "session/Controls.h"

namespace lumora {

TextList::TextList(Controls& page, const char16_t* name) {
    page.m_entries.push_back({QString::fromUtf16(name), nullptr, this});
}

void TextList::clear() {
    m_items.clear();
    m_currentIndex = -1;
}

void TextList::insert(int index, const QString& text) {
    if (index < 0 || index > count())
        return;
    m_items.insert(index, text);
    if (index <= m_currentIndex)
        ++m_currentIndex;
}

void TextList::removeAt(int index) {
    if (index < 0 || index >= count())
        return;
    m_items.removeAt(index);
    if (index == m_currentIndex)
        m_currentIndex = -1;
    else if (index < m_currentIndex)
        --m_currentIndex;
}

void TextList::replaceAt(int index, const QString& text) {
    removeAt(index);
    insert(index, text);
}

void TextList::setCurrentIndex(int index) {
    m_currentIndex = index >= 0 && index < count() ? index : -1;
}

} // namespace lumora
