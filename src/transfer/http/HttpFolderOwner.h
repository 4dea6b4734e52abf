#pragma once

#include <QString>
#include <QStringList>

namespace lumora {

class OrderJournal;
struct Platform;
struct ServerAnswer;
struct SessionState;

// Whose order the folder on the web server is that bears an order's name: two data folders with one serial make one
// name. As built in, whatever is there counts as the order's own.
class HttpFolderOwner {
public:
    enum class Owner {
        Ours,      // claimed by this order, or with this order's log in it; of an order that an older version may have
                   // sent, also with nothing but names of its own
        Unclaimed, // not there, or without a file, or with a part of the log that this order has posted
        Foreign,   // the log there differs by a byte at least, or there is none
        NotKnown,  // the list could not be read, the log was not given out, or the line was cut
    };

    HttpFolderOwner(const SessionState& state, const Platform& platform)
        : m_state(state)
        , m_platform(platform) {}

    // answer: of the server about the order's folder. uploads: the folder's address, with its last slash.
    Owner of(const OrderJournal& order, const ServerAnswer& answer, const QString& uploads) const;
    // True where the folder has to be claimed: no server makes a folder for one order alone, so that two orders that
    // found none would post into one. The log goes first, and nothing else until the server gives out this very log
    // from a folder without another order's files. As built in never.
    bool claims() const;
    // Another order's log has taken the place of this order's since; as built in never.
    bool isReplaced(const OrderJournal& order, const QStringList& entries, const QString& uploads) const;

private:
    Owner ownerWithoutLog(const OrderJournal& order, const QStringList& names) const;
    enum class Log { Same, Part, Other, Withheld, NotKnown };
    Log logThere(const OrderJournal& order, const QStringList& entries, const QString& uploads) const;

    const SessionState& m_state;
    const Platform& m_platform;
};

} // namespace lumora
