#pragma once

#include <QChar>
#include <QPointF>
#include <QRect>

namespace lumora {

// The palette of line frames: twelve colours in three columns of four cells, numbered down the columns, and the marker
// on the cell that the pointer was over last.
class LineFramePalette {
public:
    static constexpr int cell = 33;
    static constexpr int columns = 3;
    static constexpr int rows = 4;
    static constexpr int bottom = 124; // below it the pointer moves nothing

    // Puts the marker on the cell at a point of the palette; outside the cells it stays.
    void moveTo(QPointF at);

    int index() const { return m_index; }
    QRect marker() const;

    // The letter that the record carries for a cell.
    static QChar letterOf(int cellIndex);
    QChar letter() const { return letterOf(m_index); }

private:
    int m_index = 0;
};

} // namespace lumora
