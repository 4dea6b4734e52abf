#include "entry/details/TileMenu.h"

#include <vector>

namespace lumora {

namespace {

struct ClientTiles {
    const char* letter;
    std::vector<TileIndex> hidden;
    std::vector<TileIndex> shown;
};

} // namespace

std::array<bool, TileCount> visibleTiles(const SessionState& state) {
    static const std::vector<ClientTiles> clients = {
        {"B", {QuickTile}, {}},
        {"C", {QuickTile, NothingTile}, {}},
        {"D", {QuickTile, NothingTile, MailTile}, {}},
        {"CL", {QuickTile, NothingTile}, {AlbumTile}},
        {"AL", {NothingTile}, {QuickTile, AlbumTile}},
        {"AS", {NothingTile}, {QuickTile, OtherTile}},
    };
    std::array<bool, TileCount> visible;
    visible.fill(true);
    visible[AlbumTile] = visible[RestartTile] = visible[OtherTile] = false;
    for (const ClientTiles& client : clients) {
        if (state.profile.ClientLetter != QLatin1String(client.letter))
            continue;
        for (const TileIndex tile : client.hidden)
            visible[tile] = false;
        for (const TileIndex tile : client.shown)
            visible[tile] = true;
    }
    if (state.TmunatPaar == 1)
        visible[RestartTile] = true;
    if (state.MinuyPaar == 2)
        visible[QuickTile] = false;
    if (state.Careful)
        visible[NothingTile] = false;
    if (state.closedToCustomers())
        visible[MailTile] = false;
    return visible;
}

OrderKind orderKindOf(int tile) {
    using enum OrderKind;
    static constexpr std::array<OrderKind, TileCount> kinds = {Print,     EditedPrint, Sequence, NotChosen, Mail,
                                                               NotChosen, Album,       Restart,  NotChosen, Other};
    return tile >= 0 && tile < TileCount ? kinds[static_cast<std::size_t>(tile)] : NotChosen;
}

QString borderCode(int index) {
    static constexpr std::array<const char*, 10> codes = {"NB", "B7",  "BB1", "BB2", "CA1",
                                                          "BB", "CA9", "BL1", "FA9", "WB"};
    if (index < 0 || index >= static_cast<int>(codes.size()))
        return {};
    return QString::fromLatin1(codes[static_cast<std::size_t>(index)]);
}

} // namespace lumora
