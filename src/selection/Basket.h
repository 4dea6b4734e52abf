#pragma once

#include "order/BasketLine.h"
#include "session/TextList.h"

#include <QHash>

#include <vector>

namespace lumora {

// The basket of an order: its lines in the order of first choice. A replaced line stays in its place. Each page change
// looks for twelve paths, so that finding a line takes as long among thousands of lines as among ten.
class Basket {
public:
    // The form of all lines; given once, while the basket is empty.
    void setForm(LineForm form) { m_form = form; }
    LineForm form() const { return m_form; }

    const TextList& lines() const { return m_lines; }
    int count() const { return m_lines.count(); }
    bool isEmpty() const { return m_lines.isEmpty(); }
    QString item(int index) const { return m_lines.item(index); }
    // The paths of all lines.
    QStringList paths() const;
    // The reading position of the pages of chosen pictures.
    int currentIndex() const { return m_lines.currentIndex(); }
    void setCurrentIndex(int index) { m_lines.setCurrentIndex(index); }

    // The first line of the path, which stands from column 10 on in the short form and from column 210 on in the full
    // one. In the short form a line of under 12 characters ends the search: it can only be part of a corrupted list.
    int FindByPath(const QString& path) const;

    void clear();
    void append(const QString& line);
    void replaceAt(int index, const QString& line);
    void removeAt(int index);

    // The copies of all lines. The sum is limited to 16 bits.
    int SumCopies() const;

    // Removes each line that differs from an earlier one in its copies at most; the earlier copies stay.
    void removeDuplicates();

private:
    QString pathOf(const QString& line) const;
    void addToIndex(int index) const;
    void indexAll() const;

    LineForm m_form = LineForm::Short;
    TextList m_lines;
    long long m_copies = 0;
    // A number for each line, ascending through the list, so that a path finds its line after earlier lines were
    // removed.
    std::vector<unsigned> m_ids;
    unsigned m_nextId = 0;
    mutable QHash<QString, unsigned> m_byPath; // the number of the first line of each path
    mutable bool m_indexed = true;
    mutable bool m_unique = true;       // no path occurs twice
    mutable bool m_indexClosed = false; // a line that is too short precedes the lines that follow
};

} // namespace lumora
