#include "views/tFrmNew/PaperPlace.h"

#include <algorithm>

namespace lumora {
namespace {

QSize fitted(QSizeF paper, QSize room) {
    const double scale = std::min(room.width() / paper.width(), room.height() / paper.height());
    return {qRound(paper.width() * scale), qRound(paper.height() * scale)};
}

// As near the middle of the table as the room lets it.
QRect placed(QSize size, QSize table, const QRect& room) {
    const QPoint middle((table.width() - size.width()) / 2, (table.height() - size.height()) / 2);
    return {QPoint(std::clamp(middle.x(), room.left(), std::max(room.left(), room.right() + 1 - size.width())),
                   std::clamp(middle.y(), room.top(), std::max(room.top(), room.bottom() + 1 - size.height()))),
            size};
}

int fromMiddle(const QRect& place, QSize table) {
    return (place.center() - QRect(QPoint(), table).center()).manhattanLength();
}

} // namespace

QRect placedPaper(QSize table, QSizeF paper, int edge) {
    const QRect room = QRect(QPoint(), table).adjusted(edge, edge, -edge, -edge);
    return placed(fitted(paper, room.size()), table, room);
}

PaperPlace placedBesidePanel(QSize table, QSizeF paper, int edge, const PanelForms& panel) {
    const QRect room = QRect(QPoint(), table).adjusted(edge, edge, -edge, -edge);
    PaperPlace best;
    for (const bool column : {false, true}) {
        const QSize size = column ? panel.column : panel.row;
        const int rim = edge / 2;
        const int lowest = std::max(rim, table.height() - rim - size.height());
        const QPoint corner(panel.atLeft ? rim : table.width() - rim - size.width(),
                            std::clamp(panel.level - size.height() / 2, rim, lowest));
        const QRect place(corner, size);
        const QRect taken = place.adjusted(-rim, -rim, rim, rim);
        QRect above = room, below = room, aside = room;
        above.setBottom(taken.top() - 1);
        below.setTop(taken.bottom() + 1);
        panel.atLeft ? aside.setLeft(taken.right() + 1) : aside.setRight(taken.left() - 1);
        for (const QRect& part : {above, below, aside}) {
            if (!part.isValid())
                continue;
            const QRect sheet = placed(fitted(paper, part.size()), table, part);
            const bool nearer = fromMiddle(sheet, table) < fromMiddle(best.paper, table);
            if (sheet.width() > best.paper.width() || (sheet.width() == best.paper.width() && nearer))
                best = {sheet, place, column};
        }
    }
    return best;
}

} // namespace lumora
