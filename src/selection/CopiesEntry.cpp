#include "selection/CopiesEntry.h"

#include "order/PrintCode.h"

namespace lumora {

void CopiesEntry::begin(int copies) {
    m_text = QString::number(copies);
    m_begun = false;
}

void CopiesEntry::type(int digit) {
    const int before = m_begun ? m_text.toInt() : 0;
    m_begun = true;
    if (const int copies = before * 10 + digit; copies <= PrintCode::mostCopies)
        m_text = QString::number(copies);
}

void CopiesEntry::takeBack() {
    m_begun = true;
    m_text.chop(1);
}

std::optional<int> CopiesEntry::copies() const {
    return m_text.isEmpty() ? std::nullopt : std::optional(m_text.toInt());
}

} // namespace lumora
