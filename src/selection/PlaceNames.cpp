#include "selection/PlaceNames.h"

#include "selection/CardWords.h"

#include <algorithm>
#include <cstdlib>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

bool liesIn(const HostPath& place, const HostPath& folder) {
    return std::mismatch(place.begin(), place.end(), folder.begin(), folder.end()).first == place.end();
}

} // namespace

Place placeOf(const HostPath& medium, const std::vector<Cards::Card>& cards, bool english) {
    const auto card = std::ranges::find_if(cards, [&](const Cards::Card& one) { return one.medium.folder == medium; });
    if (card == cards.end())
        return {mediumWords({}, english), u"card"_s, medium, toText(medium.filename())};
    const QString label = card->medium.label.isEmpty() ? toText(medium.filename()) : card->medium.label;
    return {mediumWords(card->medium, english), u"card"_s, medium, label};
}

QString nameOf(const Place& place, const std::vector<Place>& all) {
    const auto isOfItsKind = [&](const Place& other) { return other.words == place.words; };
    return std::ranges::count_if(all, isOfItsKind) > 1 ? withLabel(place.words, place.label) : place.words;
}

QString whereIs(const HostPath& folder, const std::vector<Place>& places) {
    const Place* nearest = nullptr;
    for (const Place& place : places) {
        if (liesIn(place.folder, folder) &&
            (!nearest || place.folder.native().size() > nearest->folder.native().size()))
            nearest = &place;
    }
    if (!nearest)
        return toText(folder);
    QString words = nameOf(*nearest, places);
    for (auto at = std::next(folder.begin(), std::distance(nearest->folder.begin(), nearest->folder.end()));
         at != folder.end(); ++at)
        words += u" \u203A \u2068"_s + toText(*at) + QChar(0x2069);
    return words;
}

QStringList inTwoLines(const QString& text) {
    const auto away = [&](qsizetype at) { return std::abs(2 * at - text.size()); };
    qsizetype blank = -1;
    for (qsizetype at = text.indexOf(u' '); at >= 0; at = text.indexOf(u' ', at + 1))
        blank = blank < 0 || away(at) < away(blank) ? at : blank;
    return blank < 0 ? QStringList(text) : QStringList{text.left(blank), text.mid(blank + 1)};
}

} // namespace lumora
