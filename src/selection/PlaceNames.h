#pragma once

#include "platform/files/HostPath.h"
#include "platform/media/Cards.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace lumora {

// Where pictures may lie: a card, a folder of this computer.
struct Place {
    QString words; // as customers say it
    QString icon;
    HostPath folder;
    QString label = {}; // of a medium; tells it from another of its kind
};

// A card or stick at this folder, by the words of its tile where it is one of the cards.
Place placeOf(const HostPath& medium, const std::vector<Cards::Card>& cards, bool english);

// How a place is called among the others: two of a kind are told apart by what their owner or camera has named them.
QString nameOf(const Place& place, const std::vector<Place>& all);

// The place that is nearest above the folder, and the folders below it; the path where there is none.
QString whereIs(const HostPath& folder, const std::vector<Place>& places);

// Broken at the blank nearest to its middle; one line where there is none.
QStringList inTwoLines(const QString& text);

} // namespace lumora
