#include "transfer/http/HttpArrival.h"

#include "common/DrivePath.h"
#include "order/ArrivalProof.h"
#include "order/OrderCompleteness.h"
#include "order/OrderFolder.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "transfer/delivery/Attempts.h"

#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// After so many names in a row without an answer a server is not asked again in this check.
constexpr int mostUnanswered = 3;

// In an address these would end the path or begin an escape.
QString inAddress(const QString& name) {
    QString encoded = name;
    return encoded.replace(u"%"_s, u"%25"_s).replace(u"#"_s, u"%23"_s).replace(u"?"_s, u"%3F"_s);
}

} // namespace

struct HttpArrival::Asked {
    std::optional<qint64> length;
    bool cut = false; // by the line
};

void HttpArrival::beginOrder() {
    m_proven.clear();
    m_byName = false;
}

void HttpArrival::forget(const QString& path) {
    m_proven.remove(path);
}

bool HttpArrival::isWholeOrder(const OrderFolder& order, const QStringList& names) const {
    return !m_state.Careful ||
           OrderCompleteness::read(m_platform.files, order, names).verdict() != OrderCompleteness::Verdict::Fewer;
}

bool HttpArrival::byNameOnly() const {
    return m_byName || !m_state.Careful;
}

// A server that changes the letter case has the file under the name of its list.
HttpArrival::Asked HttpArrival::ask(const QString& name, const QStringList& entries, const QString& uploads) const {
    QStringList names{name};
    for (const QString& entry : entries) {
        const QString there = entry.trimmed();
        if (there != name && there.compare(name, Qt::CaseInsensitive) == 0)
            names += there;
    }
    for (const QString& each : names) {
        const Result<std::optional<qint64>> told = m_platform.internet.contentLength(uploads + inAddress(each));
        m_platform.pump.pump();
        if (!told)
            return {{}, true};
        if (*told)
            return {*told, false};
    }
    return {};
}

QStringList HttpArrival::unproven(const QStringList& paths, const QStringList& entries, const QString& uploads) {
    if (!m_state.Careful)
        return {};
    QList<LocalFile> here;
    QList<RemoteFile> there;
    QStringList cut;
    m_byName = false;
    int unanswered = 0;
    int cuts = 0;
    for (const QString& path : paths) {
        const Result<qint64> size = m_platform.files.size(DrivePath(path));
        const qint64 length = size ? *size : -1; // a file that is gone here proves nothing by its length
        if (m_proven.contains(path) && m_proven[path] == length)
            continue;
        const bool asks = unanswered < mostUnanswered && cuts < mostUnanswered && !m_stop.left;
        const Asked asked = asks ? ask(LeafName(path), entries, uploads) : Asked{{}, cuts > 0};
        if (asked.cut) {
            ++cuts;
            cut += path;
            continue;
        }
        unanswered = asked.length ? 0 : unanswered + 1;
        here += {LeafName(path), length};
        there += {LeafName(path), asked.length};
        if (asked.length == length)
            m_proven[path] = length;
    }
    const ArrivalProof proof = ArrivalProof::of(here, there, ArrivalProof::Names::WithoutCase);
    m_byName = !proof.byName.isEmpty();
    QStringList left = cut;
    for (const QString& path : paths) {
        if (proof.broken.contains(LeafName(path)))
            left += path;
    }
    return left;
}

} // namespace lumora
