#pragma once

#include <QRect>

namespace lumora {

// A panel that lies beside the paper: its size with its buttons in a row and in a column, and where it belongs.
struct PanelForms {
    QSize row;
    QSize column;
    int level = 0; // middle of the button that opens it, in pixels from the table's top
    bool atLeft = true;
};

// Where the paper and a panel lie on the editor's table, in pixels of the table. They never lie over one another.
struct PaperPlace {
    QRect paper;
    QRect panel;
    bool column = false;
};

// The paper without a panel: in the middle, as large as the edge that is left free on each side lets it be.
QRect placedPaper(QSize table, QSizeF paper, int edge);

// The panel lies near its side of the table and as near its level as the table lets it, in the form that leaves the
// paper larger or, where both leave it as large, nearer to the middle of the table.
PaperPlace placedBesidePanel(QSize table, QSizeF paper, int edge, const PanelForms& panel);

} // namespace lumora
