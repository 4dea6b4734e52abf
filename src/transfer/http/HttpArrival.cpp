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
#include "transfer/delivery/SilenceLimit.h"
#include "transfer/http/ServerList.h"

namespace lumora {

struct HttpArrival::Asked {
    std::optional<qint64> length;
    bool cut = false; // by the line
};

void HttpArrival::beginOrder(const QStringList& inHand) {
    m_leftBehind = inHand;
    m_proven.clear();
    m_byName = false;
}

void HttpArrival::postBegins(const QString& path) {
    m_proven.remove(path);
}

void HttpArrival::postCut(const QString& path) {
    if (m_state.Careful && !m_leftBehind.contains(path))
        m_leftBehind += path;
}

std::optional<OrderCompleteness> HttpArrival::lacking(const OrderFolder& order, const QStringList& names) const {
    if (!m_state.Careful)
        return std::nullopt;
    const OrderCompleteness counts = OrderCompleteness::read(m_platform.files, order, names);
    return counts.verdict() == OrderCompleteness::Verdict::Fewer ? std::optional(counts) : std::nullopt;
}

bool HttpArrival::byNameOnly() const {
    return m_byName || !m_state.Careful;
}

// A server that changes the letter case has the file under the name of its list.
HttpArrival::Asked HttpArrival::ask(const QString& name, const Listed& there) const {
    QStringList names{name};
    for (const QString& entry : there.entries) {
        const QString listed = entry.trimmed();
        if (listed != name && listed.compare(name, Qt::CaseInsensitive) == 0)
            names += listed;
    }
    for (const QString& each : names) {
        m_silence.begin();
        const Result<std::optional<qint64>> told =
            m_platform.internet.contentLength(there.uploads + NameInAddress(each));
        m_platform.pump.pump();
        if (!told)
            return {{}, true};
        if (*told)
            return {*told, false};
    }
    return {};
}

QStringList HttpArrival::remains(const QStringList& paths, const Listed& there) {
    QStringList left;
    for (const QString& path : paths) {
        if (!isLeftBehind(path))
            continue;
        const Result<qint64> size = m_platform.files.size(DrivePath(path));
        const bool asks = m_state.Careful && size && !m_stop.left && !m_stop.StopFlag;
        if (asks && ask(LeafName(path), there).length == *size) {
            m_proven[path] = *size;
            postConfirmed(path);
        } else {
            left += path;
        }
    }
    return left;
}

QStringList HttpArrival::unproven(const QStringList& paths, const Listed& there) {
    if (!m_state.Careful)
        return {};
    QList<LocalFile> here;
    QList<RemoteFile> told;
    QStringList cut;
    m_byName = false;
    int unanswered = 0;
    int cuts = 0;
    constexpr int most = ArrivalProof::mostUnanswered;
    for (const QString& path : paths) {
        const Result<qint64> size = m_platform.files.size(DrivePath(path));
        const qint64 length = size ? *size : -1; // a file that is gone here proves nothing by its length
        if (m_proven.contains(path) && m_proven[path] == length)
            continue;
        const bool stopped = m_stop.left || m_stop.StopFlag;
        const bool asks = unanswered < most && cuts < most && !stopped;
        const Asked asked = asks ? ask(LeafName(path), there) : Asked{{}, cuts > 0 || stopped};
        if (asked.cut) {
            ++cuts;
            cut += path;
            continue;
        }
        unanswered = asked.length ? 0 : unanswered + 1;
        here += {LeafName(path), length};
        told += {LeafName(path), asked.length};
        if (asked.length == length)
            m_proven[path] = length;
    }
    const ArrivalProof proof = ArrivalProof::of(here, told, ArrivalProof::Names::WithoutCase);
    m_byName = !proof.byName.isEmpty();
    QStringList left = cut;
    for (const QString& path : paths) {
        if (proof.broken.contains(LeafName(path)))
            left += path;
    }
    return left;
}

} // namespace lumora
