#include "transfer/ftp/FtpFolderOwner.h"

#include "order/OrderJournal.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

bool FtpFolderOwner::asks() const {
    return m_state.Careful;
}

FtpFolderOwner::Owner FtpFolderOwner::of(const OrderJournal& order, FtpConnection& connection,
                                         const FtpListing& listing) const {
    if (!asks())
        return Owner::NotAsked;
    if (order.state().folderMadeByUs)
        return Owner::Ours;
    if (!listing.unread.isEmpty())
        return byLog(order, connection) == Owner::Ours ? Owner::Ours : Owner::NotKnown;
    const auto isNamed = [](const FtpEntry& entry) {
        return !entry.name.isEmpty() && entry.name != u"."_s && entry.name != u".."_s;
    };
    if (std::none_of(listing.entries.begin(), listing.entries.end(), isNamed))
        return Owner::Ours;
    const QString log = order.folder().logPath().leaf();
    const auto found = std::find_if(listing.entries.begin(), listing.entries.end(),
                                    [&](const FtpEntry& entry) { return entry.name == log; });
    if (found == listing.entries.end())
        return Owner::Foreign;
    return byLog(order, connection);
}

FtpFolderOwner::Owner FtpFolderOwner::byLog(const OrderJournal& order, FtpConnection& connection) const {
    const DrivePath log = order.folder().logPath();
    const Result<QByteArray> ours = m_files.read(log);
    if (!ours)
        return Owner::Foreign;
    const DrivePath fetched = order.folder().fetchedLogPath();
    const Result<HostPath> target = m_files.host(fetched);
    if (!target)
        return Owner::NotKnown;
    const Result<void> got = connection.get(log.leaf(), *target);
    const Result<QByteArray> theirs = got ? m_files.read(fetched) : Result<QByteArray>(got.failure());
    static_cast<void>(m_files.removeFile(fetched)); // hidden; the next fetch replaces one that stays
    if (!theirs) {
        const Failure::Kind why = theirs.failure().kind;
        const bool answered = why == Failure::Kind::Refused || why == Failure::Kind::AccessDenied;
        return answered ? Owner::Foreign : Owner::NotKnown; // no other try would tell more
    }
    return *theirs == *ours ? Owner::Ours : Owner::Foreign;
}

} // namespace lumora
