#pragma once

#include <QString>
#include <QStringList>

namespace lumora {

class Controls;

// A list of texts with a current index. Paging relies on these rules of the index: clearing gives -1, removing the
// current item gives -1, removing below it lowers it by one, inserting at or below it raises it by one, and appending
// never moves it. An item out of range reads as an empty text.
class TextList {
public:
    TextList() = default;
    // A list of a page, entered under its design name.
    TextList(Controls& page, const char16_t* name);

    void clear();
    void append(const QString& text) { m_items.append(text); }
    void append(const QStringList& texts) { m_items.append(texts); }
    void insert(int index, const QString& text);
    void removeAt(int index);
    // Takes the place of the item at index: remove, then insert there.
    void replaceAt(int index, const QString& text);

    int count() const { return static_cast<int>(m_items.size()); }
    bool isEmpty() const { return m_items.isEmpty(); }
    int lastIndex() const { return count() - 1; }
    QString item(int index) const { return m_items.value(index); }
    // The first item equal to the text, else -1.
    int find(const QString& text) const { return static_cast<int>(m_items.indexOf(text)); }
    bool contains(const QString& text) const { return m_items.contains(text); }
    const QStringList& items() const { return m_items; }

    int currentIndex() const { return m_currentIndex; }
    // An index out of range is held at -1.
    void setCurrentIndex(int index);
    QString currentItem() const { return item(m_currentIndex); }

private:
    QStringList m_items;
    int m_currentIndex = -1;
};

} // namespace lumora
