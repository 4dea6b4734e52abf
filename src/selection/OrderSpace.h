#pragma once

#include <QStringList>

#include <optional>

namespace lumora {

class Files;
struct SessionState;

// The room on the disk that an order needs, in bytes, looked at before a kiosk makes it: a full disk is told while
// nothing is begun.
class OrderSpace {
public:
    // lines: the basket. It is reckoned high: for each print its paper at the printer's resolution or the picture's
    // own file, whichever is larger, and what passes through the disk meanwhile.
    static qint64 neededFor(const QStringList& lines, const SessionState& state, const Files& files);

    // What the customer is told where less than that is free; nothing where it fits, or where nothing tells what is
    // free.
    static std::optional<QString> lacking(const QStringList& lines, const SessionState& state, const Files& files);
    static std::optional<QString> words(const SessionState& state, qint64 needed, qint64 free);
};

} // namespace lumora
