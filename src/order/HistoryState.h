#pragma once

#include "common/Result.h"

#include <QList>

namespace lumora {

class DrivePath;
class Files;
class OrderFolder;
struct SessionState;

// Whether the preparation of an order came to its end.
enum class Completion {
    Finished,
    CanGoOn,   // the basket is kept: the preparation can go on
    OnlyFiles, // neither a log nor a state: nobody knows what is missing
};
Completion CompletionOf(const Files& files, const OrderFolder& folder);

// The orders on the disk that have print files to lose, by what is known of their arrival.
struct HistoryState {
    QList<OrderFolder> notProven; // made for a server, and not proven to have arrived there
    QList<OrderFolder> legacy;    // of these, the finished ones of an earlier version, which kept no state
    QList<OrderFolder> station;   // of the local station
    QList<OrderFolder> mail;      // sent by mail

    static HistoryState of(const SessionState& state, const Files& files);

    // All that are not proven to lie on a server.
    int count() const { return static_cast<int>(notProven.size() + station.size() + mail.size()); }
    bool contains(const DrivePath& folder) const;
    // True where a clean-up asks before it removes their print files; as built in it removes them.
    bool areGuarded(const SessionState& state) const;

    // Counts the orders of an earlier version as arrived from now on.
    Result<void> markLegacyArrived(const Files& files) const;
};

} // namespace lumora
