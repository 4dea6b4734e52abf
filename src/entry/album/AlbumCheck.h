#pragma once

#include <QString>

#include <optional>

namespace lumora {

struct SessionState;

// What is missing in an album order: what to say, and where the customer sets it right.
struct AlbumProblem {
    enum class Place { Name, Telephone, Event, Mail, Kind, Size, Cover, Paper };
    QString message;
    Place place;
};

// The album of the session with its photographer, in the order of the panels; the first fault found. mailName is what
// was typed before the "@". A paper that was left untouched passes.
std::optional<AlbumProblem> CheckAlbum(const SessionState& state, const QString& mailName);

// On the panel of the kind: copies for the parents need a kind of album and a size. The message, when one is missing.
std::optional<QString> checkParentAlbum(const SessionState& state, int copies, bool chosen);

// Writes a checked album into the order's record, over what an earlier order left there.
void takeAlbumOrder(SessionState& state);

} // namespace lumora
