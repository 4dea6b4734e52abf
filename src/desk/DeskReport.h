#pragma once

#include "common/Result.h"
#include "desk/Book.h"

#include <QByteArray>
#include <QDate>

namespace lumora {

// What the desk did from one day to another, both included, by the days of this machine.
class DeskReport {
public:
    static Result<DeskReport> of(Book& book, const QDate& from, const QDate& to);

    // One line for each order, for the prints of each size, and for each fault.
    QByteArray csv() const;
    // One page without anything outside it: the figures, the copies of each day as a plot, prints by size, faults.
    QByteArray html() const;

    qsizetype orders() const { return m_period.orders.size(); }
    qsizetype faults() const { return m_period.faults.size(); }
    int copies() const;

private:
    QString plot() const;

    QDate m_from, m_to;
    Book::Period m_period;
};

} // namespace lumora
