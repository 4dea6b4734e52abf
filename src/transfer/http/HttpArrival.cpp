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
    std::optional<qint64> length = {};
    bool cut = false;  // by the line
    bool gone = false; // the server has no such file
};

void HttpArrival::beginOrder(const QStringList& inHand) {
    m_leftBehind = inHand;
    m_proven.clear();
    m_knowsHead.reset();
    m_byName = false;
}

void HttpArrival::postBegins(const QString& path) {
    m_proven.remove(path);
}

void HttpArrival::postUnconfirmed(const QString& path) {
    if (m_state.Careful && !m_leftBehind.contains(path))
        m_leftBehind += path;
}

std::optional<OrderCompleteness> HttpArrival::lacking(const OrderFolder& order, const QStringList& names) const {
    if (!m_state.Careful)
        return std::nullopt;
    const OrderCompleteness counts = OrderCompleteness::read(m_state, m_platform.files, order, names);
    return counts.verdict() == OrderCompleteness::Verdict::Fewer ? std::optional(counts) : std::nullopt;
}

bool HttpArrival::byNameOnly() const {
    return m_byName || !m_state.Careful;
}

HttpArrival::Asked HttpArrival::ask(const QString& name, const Listed& there) {
    bool gone = true;
    for (const QString& each : NamesAsListed(name, there.entries)) {
        m_silence.begin();
        const Result<std::optional<qint64>> told =
            m_platform.internet.contentLength(there.uploads + NameInAddress(each));
        m_platform.pump.pump();
        const bool missing = !told && told.failure().kind == Failure::Kind::NotFound;
        if (!told && !missing)
            return {.cut = true};
        if (told && *told)
            return {.length = *told};
        gone = gone && missing;
    }
    if (!gone)
        return {};
    const std::optional<bool> knows = knowsHead(there);
    return knows ? Asked{.gone = *knows} : Asked{.cut = true};
}

// Some servers answer each HEAD with 404, also for the list that has just been read.
std::optional<bool> HttpArrival::knowsHead(const Listed& there) {
    for (int number = 0; !m_knowsHead && !ListFileName(number).isEmpty(); ++number) {
        if (m_stop.left || m_stop.StopFlag)
            return std::nullopt;
        m_silence.begin();
        const Result<std::optional<qint64>> told =
            m_platform.internet.contentLength(there.uploads + ListFileName(number));
        m_platform.pump.pump();
        if (told)
            m_knowsHead = true;
        else if (told.failure().kind != Failure::Kind::NotFound)
            return std::nullopt;
    }
    if (!m_knowsHead)
        m_knowsHead = false;
    return m_knowsHead;
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
    QStringList left; // the asking was cut, or the server has no such file
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
        const bool asks = (unanswered < most || !m_proven.isEmpty()) && cuts < most && !stopped;
        const Asked asked = asks ? ask(LeafName(path), there) : Asked{.cut = cuts > 0 || stopped};
        if (asked.cut || asked.gone) {
            cuts += asked.cut ? 1 : 0;
            left += path;
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
    for (const QString& path : paths) {
        if (proof.broken.contains(LeafName(path)) || proof.missing.contains(LeafName(path)))
            left += path;
    }
    return left;
}

} // namespace lumora
