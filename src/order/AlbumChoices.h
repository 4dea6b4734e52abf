#pragma once

#include <QString>
#include <QStringList>

namespace lumora {

// The lists from which a parent album is put together.
enum class AlbumChoice {
    Kind,         // SoogAlb
    ParentSize,   // Combo4Horim
    Size,         // Combo4Godel
    Cover,        // Combo4Cricha
    Paper,        // Combo4Niyar
    Extra,        // Combo4Tosefet
    SpecialExtra, // Check3
};

// What the pages show: the text of the list before a row is taken, and its rows.
QString albumPrompt(AlbumChoice choice, bool english);
QStringList albumItems(AlbumChoice choice, bool english);
// What the order carries for a row in either language: the Hebrew item, or the Hebrew prompt for a row that is not
// there.
QString orderedItem(AlbumChoice choice, int row);
// The row of an item that an order carries; -1 where none was taken.
int orderedRow(AlbumChoice choice, const QString& item);

// The most copies of the album that the parents can have.
constexpr int mostParentCopies = 4;

} // namespace lumora
