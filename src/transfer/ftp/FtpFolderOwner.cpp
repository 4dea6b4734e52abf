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

namespace {

bool mayHaveMade(const OrderJournal& order) {
    return order.mayHaveMadeFolder(Sender::Ftp) || order.wasSentBefore();
}

} // namespace

FtpFolderOwner::Owner FtpFolderOwner::of(const OrderJournal& order, FtpConnection& connection,
                                         const FtpListing& listing) const {
    if (!asks())
        return Owner::NotAsked;
    if (order.ownsFolder(Sender::Ftp))
        return Owner::Ours;
    const QString log = order.folder().logPath().leaf();
    const auto isNamed = [](const FtpEntry& entry) {
        return !entry.name.isEmpty() && entry.name != u"."_s && entry.name != u".."_s;
    };
    const bool isRead = listing.unread.isEmpty() && !listing.refused;
    if (isRead && std::none_of(listing.entries.begin(), listing.entries.end(), isNamed))
        return mayHaveMade(order) ? Owner::Ours : Owner::Foreign;
    if (isRead && std::none_of(listing.entries.begin(), listing.entries.end(),
                               [&](const FtpEntry& entry) { return entry.name == log; }))
        return Owner::Foreign;
    const Log there = logThere(order, connection);
    if (there == Log::Same)
        return Owner::Ours;
    if (there == Log::NotKnown || !listing.unread.isEmpty())
        return Owner::NotKnown;
    return listing.refused && there == Log::None && mayHaveMade(order) ? Owner::Ours : Owner::Foreign;
}

// None where the server refuses it: no other try would tell more.
FtpFolderOwner::Log FtpFolderOwner::logThere(const OrderJournal& order, FtpConnection& connection) const {
    const DrivePath log = order.folder().logPath();
    const Result<QByteArray> ours = m_files.read(log);
    if (!ours && ours.failure().kind != Failure::Kind::NotFound)
        return Log::NotKnown;
    const DrivePath fetched = order.folder().fetchedLogPath();
    const Result<HostPath> target = m_files.host(fetched);
    if (!target)
        return Log::NotKnown;
    const Result<void> got = connection.getExact(log.leaf(), *target);
    const Result<QByteArray> theirs = got ? m_files.read(fetched) : Result<QByteArray>(got.failure());
    static_cast<void>(m_files.removeFile(fetched)); // hidden; the next fetch replaces one that stays
    if (!theirs) {
        const Failure& why = theirs.failure();
        const bool answered = why.kind == Failure::Kind::Refused || why.kind == Failure::Kind::AccessDenied;
        return answered && !why.passing ? Log::None : Log::NotKnown;
    }
    return ours && *theirs == *ours ? Log::Same : Log::Other;
}

} // namespace lumora
