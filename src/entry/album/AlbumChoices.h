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

// The text of the list before a row is taken.
QString albumPrompt(AlbumChoice choice, bool english);
QStringList albumItems(AlbumChoice choice, bool english);

// The most copies of the album that the parents can have.
constexpr int mostParentCopies = 4;

} // namespace lumora
