#pragma once

#include <QByteArray>
#include <QList>
#include <QSize>
#include <QString>

class QPainter;

namespace lumora {

struct SessionState;

// The slip that a customer takes along: the order's number, its prints and the telephone, no name. It fits on a roll of
// 80 mm and on A6.
class OrderSlip {
public:
    explicit OrderSlip(const SessionState& state);

    // What the staff reads with a scanner: the order's name, its prints and the telephone, a line each.
    static QString codeOf(const SessionState& state);

    // In tenths of a millimetre.
    QSize size() const;
    // In the same measure, from the painter's origin on.
    void paint(QPainter& painter) const;
    // A page of that size; empty where it can't be made.
    QByteArray pdf() const;

private:
    struct Row {
        QString name; // empty: the text stands in the middle
        QString text;
        int height;
        int letters; // their size
        bool strong = false;
    };
    int rowsHeight() const;

    bool m_english;
    QList<Row> m_rows;
    QString m_code;
    QString m_end; // below the code
};

} // namespace lumora
