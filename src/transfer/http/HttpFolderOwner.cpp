#include "transfer/http/HttpFolderOwner.h"

#include "order/OrderJournal.h"
#include "order/OrderNames.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "transfer/http/ServerList.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Statuses of a web server's answer.
constexpr int unauthorized = 401;
constexpr int forbidden = 403;

bool isSame(const QString& name, const QString& other) {
    return name.compare(other, Qt::CaseInsensitive) == 0;
}

// Names that only an order brings, other than files of the server's own making.
bool isPrintOrSheet(const QString& name) {
    return IsSheet(name) || name.endsWith(u".jpp"_s, Qt::CaseInsensitive) ||
           name.endsWith(u".prk"_s, Qt::CaseInsensitive);
}

} // namespace

bool HttpFolderOwner::claims() const {
    return m_state.Careful;
}

HttpFolderOwner::Owner HttpFolderOwner::of(const OrderJournal& order, const ServerAnswer& answer,
                                           const QString& uploads) const {
    if (!m_state.Careful || order.ownsFolder(Sender::Http))
        return Owner::Ours;
    if (!answer.files)
        return Owner::NotKnown;
    // This order has posted its log and nothing else.
    const bool posted = order.mayHaveMadeFolder(Sender::Http);
    if (answer.files->isEmpty())
        return Owner::Unclaimed;
    if (posted && std::any_of(answer.files->begin(), answer.files->end(), isPrintOrSheet))
        return Owner::Foreign;
    const QString log = order.folder().logPath().leaf();
    if (std::none_of(answer.files->begin(), answer.files->end(),
                     [&](const QString& name) { return isSame(name, log); }))
        return posted ? Owner::Unclaimed : ownerWithoutLog(order, *answer.files);
    switch (logThere(order, *answer.files, uploads)) {
    case Log::Same:
        return Owner::Ours;
    case Log::Part:
        return posted ? Owner::Unclaimed : Owner::Foreign;
    case Log::Withheld:
        return posted ? Owner::Ours : Owner::NotKnown;
    case Log::NotKnown:
        return Owner::NotKnown;
    case Log::Other:
        break;
    }
    return Owner::Foreign;
}

// An older version posted the log last.
HttpFolderOwner::Owner HttpFolderOwner::ownerWithoutLog(const OrderJournal& order, const QStringList& names) const {
    const QStringList own = m_platform.files.names(order.folder().path(), u"*"_s);
    const auto isOwn = [&](const QString& name) { return own.contains(name, Qt::CaseInsensitive); };
    return order.wasSentBefore() && std::all_of(names.begin(), names.end(), isOwn) ? Owner::Ours : Owner::Foreign;
}

bool HttpFolderOwner::isReplaced(const OrderJournal& order, const QStringList& entries, const QString& uploads) const {
    const QString log = order.folder().logPath().leaf();
    const bool isListed =
        std::any_of(entries.begin(), entries.end(), [&](const QString& entry) { return isSame(entry.trimmed(), log); });
    return m_state.Careful && isListed && m_platform.files.fileExists(order.folder().logPath()) &&
           logThere(order, entries, uploads) == Log::Other;
}

// A server that changes the letter case may give a file out under the name of its list alone.
HttpFolderOwner::Log HttpFolderOwner::logThere(const OrderJournal& order, const QStringList& entries,
                                               const QString& uploads) const {
    const DrivePath path = order.folder().logPath();
    const Result<QByteArray> ours = m_platform.files.read(path);
    if (!ours)
        return ours.failure().kind == Failure::Kind::NotFound ? Log::Other : Log::NotKnown;
    for (const QString& name : NamesAsListed(path.leaf(), entries)) {
        const Result<WebAnswer> theirs = m_platform.internet.fetch(uploads + NameInAddress(name));
        if (!theirs)
            return Log::NotKnown;
        if (theirs->good())
            return theirs->body == *ours ? Log::Same : ours->startsWith(theirs->body) ? Log::Part : Log::Other;
        if (theirs->status == unauthorized || theirs->status == forbidden)
            return Log::Withheld;
    }
    return Log::NotKnown;
}

} // namespace lumora
