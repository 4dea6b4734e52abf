#pragma once

#include "session/SessionState.h"

#include <QString>

#include <array>

namespace lumora {

// The menu's tiles by their index.
enum TileIndex {
    PrintTile,    // prints, with the details page
    QuickTile,    // prints through the editor
    SequenceTile, // prints picked in one sequence
    NothingTile,  // a tile that the menu lets through without any change
    MailTile,     // finished orders and mail
    ExitTile,
    AlbumTile,
    RestartTile,
    EnglishTile,
    OtherTile, // a page of the lab's own
    TileCount
};

// Which tiles a client sees, by its letter; a letter that is not known has all the ordinary tiles. Then the switches:
// TmunatPaar 1 adds the restart tile, MinuyPaar 2 takes the quick order away, and with Careful the tile that does
// nothing is gone. On a kiosk the finished orders are the staff's.
std::array<bool, TileCount> visibleTiles(const SessionState& state);

// The kind of order that the tile begins, or the mode that it leaves in Optint; NotChosen for the others.
OrderKind orderKindOf(int tile);

// The border code of Image13(i), two or three letters; empty for an index out of range.
QString borderCode(int index);

} // namespace lumora
