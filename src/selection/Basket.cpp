#include "selection/Basket.h"

#include <QSet>

#include <algorithm>

namespace lumora {

namespace {
constexpr int shortestLine = 12;
}

QString Basket::pathOf(const QString& line) const {
    return line.mid(BasketLine::pathColumn(m_form));
}

int Basket::FindByPath(const QString& path) const {
    if (!m_indexed)
        indexAll();
    const auto found = m_byPath.constFind(path);
    if (found == m_byPath.cend())
        return -1;
    return static_cast<int>(std::lower_bound(m_ids.begin(), m_ids.end(), *found) - m_ids.begin());
}

void Basket::clear() {
    m_lines.clear();
    m_copies = 0;
    m_ids.clear();
    indexAll();
}

void Basket::append(const QString& line) {
    m_lines.append(line);
    m_ids.push_back(m_nextId++);
    m_copies += PrintCode::copiesOf(line);
    if (m_indexed)
        addToIndex(m_lines.lastIndex());
}

void Basket::replaceAt(int index, const QString& line) {
    if (index < 0 || index >= count())
        return;
    const QString old = m_lines.item(index);
    m_copies += PrintCode::copiesOf(line) - PrintCode::copiesOf(old);
    m_lines.replaceAt(index, line);
    if (pathOf(old) != pathOf(line) || old.size() < shortestLine || line.size() < shortestLine)
        m_indexed = false;
}

void Basket::removeAt(int index) {
    if (index < 0 || index >= count())
        return;
    const QString old = m_lines.item(index);
    m_copies -= PrintCode::copiesOf(old);
    m_lines.removeAt(index);
    m_ids.erase(m_ids.begin() + index);
    if (m_unique && !m_indexClosed)
        m_byPath.remove(pathOf(old));
    else
        m_indexed = false;
}

QStringList Basket::paths() const {
    QStringList paths;
    for (const QString& line : m_lines.items())
        paths += pathOf(line);
    return paths;
}

int Basket::SumCopies() const {
    return HoldIn16Bits(static_cast<double>(m_copies));
}

void Basket::removeDuplicates() {
    QSet<QString> seen;
    for (int i = 0; i < count();) {
        const QString rest = BasketLine::withoutCopies(item(i));
        if (seen.contains(rest)) {
            removeAt(i);
        } else {
            seen.insert(rest);
            ++i;
        }
    }
}

void Basket::addToIndex(int index) const {
    const QString& line = m_lines.items().at(index);
    m_indexClosed = m_indexClosed || (m_form == LineForm::Short && line.size() < shortestLine);
    if (m_indexClosed)
        return;
    const QString path = pathOf(line);
    if (m_byPath.contains(path))
        m_unique = false;
    else
        m_byPath.insert(path, m_ids[static_cast<std::size_t>(index)]);
}

void Basket::indexAll() const {
    m_byPath.clear();
    m_indexed = true;
    m_unique = true;
    m_indexClosed = false;
    for (int i = 0; i < count(); ++i)
        addToIndex(i);
}

} // namespace lumora
