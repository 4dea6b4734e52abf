#include "transfer/ftp/FtpArrival.h"

#include "common/DrivePath.h"
#include "order/LineEnds.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"

#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

bool isShared(const QString& name) {
    return name == u"000.jpg"_s;
}

// Where a name comes twice, the longest length is believed.
const RemoteFile* entryOf(const QList<RemoteFile>& there, const QString& name) {
    const RemoteFile* found = nullptr;
    for (const RemoteFile& entry : there) {
        if (entry.name == name && (!found || entry.length > found->length))
            found = &entry;
    }
    return found;
}

} // namespace

void FtpArrival::beginOrder() {
    m_unanswered = 0;
    m_answered = false;
    m_firstLooked = false;
    m_lengths.clear();
}

bool FtpArrival::decides() const {
    return m_state.Careful;
}

std::optional<qint64> FtpArrival::ask(FtpConnection& connection, const QString& name) {
    if (!m_answered && m_unanswered >= ArrivalProof::mostUnanswered)
        return std::nullopt;
    const Result<std::optional<qint64>> told = connection.length(name);
    const std::optional<qint64> length = told ? *told : std::nullopt;
    m_cut = m_cut || !told;
    if (told && !m_answered)
        m_unanswered += length ? 0 : 1;
    m_answered = m_answered || length;
    return length;
}

// SIZE is asked where the listing does not already tell the length of the file here, and overrules the listing.
std::optional<FtpArrival::Found> FtpArrival::lengthsOf(FtpConnection& connection, const QString& path,
                                                       const QList<RemoteFile>& there) {
    const QString name = LeafName(path);
    const RemoteFile* entry = entryOf(there, name);
    const Result<qint64> here = m_files.size(DrivePath(path));
    if (!entry || !here)
        return std::nullopt;
    Found found{*here, entry->length};
    if (found.there != *here && !isShared(name)) {
        if (const std::optional<qint64> asked = ask(connection, name))
            found.there = asked;
    }
    return found;
}

bool FtpArrival::isOther(FtpConnection& connection, const QString& path, const QList<RemoteFile>& there) {
    if (!decides() || isShared(LeafName(path)))
        return false;
    const std::optional<Found> found = lengthsOf(connection, path, there);
    return found && found->there && *found->there != found->here;
}

bool FtpArrival::isWhole(FtpConnection& connection, const QString& path, const QList<RemoteFile>& there) {
    if (!decides() || isShared(LeafName(path)))
        return false;
    const std::optional<Found> found = lengthsOf(connection, path, there);
    return found && found->there == found->here;
}

std::optional<ArrivalProof> FtpArrival::proofOf(FtpConnection& connection, const QStringList& paths,
                                                const QList<RemoteFile>& there) {
    if (!decides())
        return std::nullopt;
    QList<LocalFile> here;
    m_lengths.clear();
    m_cut = false;
    for (const QString& path : paths) {
        const QString name = LeafName(path);
        const Result<qint64> length = m_files.size(DrivePath(path));
        here += {name, length ? *length : -1}; // a file that is gone here proves nothing by its length
        if (const std::optional<Found> found = lengthsOf(connection, path, there))
            m_lengths += {name, found->there};
        else if (const RemoteFile* entry = entryOf(there, name))
            m_lengths += *entry;
    }
    if (m_cut)
        return std::nullopt;
    return ArrivalProof::of(here, m_lengths, ArrivalProof::Names::Exact);
}

// A server that changes line ends does it in one way, to every file.
bool FtpArrival::oneWayExplains(const QStringList& changed, const QList<RemoteFile>& there,
                                const QStringList& whole) const {
    std::vector<std::size_t> ways = {0, 1, 2, 3};
    const auto keep = [&](const QString& path, qint64 longer) {
        const Result<LineEnds> ends = LineEndsOf(m_files, DrivePath(path));
        std::erase_if(ways, [&](std::size_t way) { return !ends || ends->changes().at(way) != longer; });
    };
    for (const QString& path : changed) {
        const RemoteFile* entry = entryOf(there, LeafName(path));
        const Result<qint64> here = m_files.size(DrivePath(path));
        if (!entry || !entry->length || !here || *entry->length == *here)
            return false;
        keep(path, *entry->length - *here);
    }
    for (const QString& path : whole) {
        if (ways.empty())
            break;
        keep(path, 0);
    }
    return !changed.isEmpty() && !ways.empty();
}

// Under type A many a server refuses SIZE, and the type is to be changed for it and back again.
std::optional<qint64> FtpArrival::lengthAfterPut(FtpConnection& connection, const QString& name) {
    const auto listed = [&] {
        const Result<FtpListing> listing = connection.list(u"*.*"_s);
        std::optional<qint64> length;
        for (const FtpEntry& entry : listing ? listing->entries : std::vector<FtpEntry>()) {
            if (entry.name == name)
                length = entry.length;
        }
        return length;
    };
    const bool listsFirst = m_state.transfer.keptFtpSession && connection.type() == FtpType::Ascii;
    if (const std::optional<qint64> length = listsFirst ? listed() : ask(connection, name))
        return length;
    return listsFirst ? ask(connection, name) : listed();
}

bool FtpArrival::lineEndsChanged(FtpConnection& connection, const QString& path, const QStringList& paths,
                                 const QList<RemoteFile>& there) {
    const QString name = LeafName(path);
    if (!decides() || m_firstLooked || isShared(name))
        return false;
    m_firstLooked = true;
    const std::optional<qint64> length = lengthAfterPut(connection, name);
    QStringList whole;
    for (const QString& each : paths) {
        const RemoteFile* entry = entryOf(there, LeafName(each));
        const Result<qint64> here = m_files.size(DrivePath(each));
        if (each != path && entry && here && entry->length == *here && !isShared(entry->name))
            whole += each;
    }
    return oneWayExplains({path}, {{name, length}}, whole);
}

bool FtpArrival::lineEndsExplain(const ArrivalProof& proof, const QStringList& paths) const {
    const auto pathsOf = [&](const QStringList& names) {
        QStringList found;
        for (const QString& path : paths) {
            if (names.contains(LeafName(path)))
                found += path;
        }
        return found;
    };
    return oneWayExplains(pathsOf(proof.broken), m_lengths, pathsOf(proof.byLength));
}

} // namespace lumora
