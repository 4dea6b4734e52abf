#include "platform/line/PocoInternet.h"

#include "common/HostFile.h"
#include "platform/line/BlockingCall.h"
#include "platform/line/HttpCall.h"

#include <ifaddrs.h>
#include <net/if.h>
#include <sys/socket.h>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;
struct PocoInternet::Line {
    LineAbort abort;
    std::shared_ptr<const TlsTrust> trust;
    EventPump* pump = nullptr;
};

namespace {

class WireConnection : public FtpConnection {
    template <class Call>
    auto run(Call call) {
        const std::shared_ptr<FtpSessionWire> wire = m_wire;
        return RunBlocking([&] { return call(*wire); }, m_line->pump);
    }

public:
    WireConnection(std::shared_ptr<PocoInternet::Line> line, std::shared_ptr<FtpSessionWire> wire)
        : m_line(std::move(line))
        , m_wire(std::move(wire)) {}
    ~WireConnection() override {
        // Closed by a click inside a call, which ends by this.
        if (m_wire.use_count() > 1)
            m_line->abort.abort();
        else
            RunBlocking([this] {
                m_wire->close();
                return true;
            });
    }

    Result<void> setCurrentDirectory(const QString& directory) override {
        return run([&](FtpSessionWire& wire) { return wire.changeDirectory(directory); });
    }
    Result<QString> currentDirectory() override {
        return run([](FtpSessionWire& wire) { return wire.currentDirectory(); });
    }
    Result<void> makeDirectory(const QString& name) override {
        return run([&](FtpSessionWire& wire) { return wire.command("MKD", name); });
    }
    Result<void> put(const HostPath& local, const QString& remoteName) override {
        return run([&](FtpSessionWire& wire) { return wire.put(local, remoteName); });
    }
    Result<void> get(const QString& remoteName, const HostPath& local) override {
        return run([&](FtpSessionWire& wire) { return wire.get(remoteName, local, std::nullopt); });
    }
    Result<void> getExact(const QString& remoteName, const HostPath& local) override {
        return run([&](FtpSessionWire& wire) { return wire.get(remoteName, local, FtpType::Image); });
    }
    Result<void> remove(const QString& remoteName) override {
        return run([&](FtpSessionWire& wire) { return wire.command("DELE", remoteName); });
    }
    Result<FtpListing> list(const QString& pattern, EmptyFolder empty) override {
        return run([&](FtpSessionWire& wire) { return wire.list(pattern, empty); });
    }
    Result<std::optional<qint64>> length(const QString& remoteName) override {
        return run([&](FtpSessionWire& wire) { return wire.length(remoteName); });
    }
    QString lastResponse() const override { return m_wire->lastResponse(); }
    FtpType type() const override { return m_wire->type(); }

private:
    std::shared_ptr<PocoInternet::Line> m_line;
    std::shared_ptr<FtpSessionWire> m_wire;
};

} // namespace

PocoInternet::PocoInternet(TimeLimits limits, FtpType type, const LineEncryption& encryption)
    : m_limits(limits)
    , m_type(type)
    , m_tls(encryption.ftp)
    , m_line(std::make_shared<Line>()) {
    m_line->trust = std::make_shared<TlsTrust>(encryption.authorities);
}

PocoInternet::~PocoInternet() = default;

LineCall PocoInternet::call() const {
    return {m_limits, m_line->abort, m_line->trust};
}

void PocoInternet::abort() {
    m_line->abort.abort();
}

EventPump* PocoInternet::pumpWhileWaiting(EventPump* pump) {
    return std::exchange(m_line->pump, pump);
}

qint64 PocoInternet::bytesMoved() const {
    return m_line->abort.bytesMoved();
}

bool PocoInternet::connectedState() const {
    ifaddrs* all = nullptr;
    if (::getifaddrs(&all) != 0)
        return false;
    bool up = false;
    for (const ifaddrs* one = all; one; one = one->ifa_next) {
        const bool internet =
            one->ifa_addr && (one->ifa_addr->sa_family == AF_INET || one->ifa_addr->sa_family == AF_INET6);
        up = up || (internet && (one->ifa_flags & IFF_UP) != 0);
    }
    ::freeifaddrs(all);
    return up;
}

Result<std::unique_ptr<FtpConnection>> PocoInternet::connectFtp(const QString& host, const QString& user,
                                                                const QString& password, DataChannel channel) {
    const auto line = m_line;
    const auto wire = std::make_shared<FtpSessionWire>(call(), m_type, m_tls);
    const auto opened = RunBlocking([&] { return wire->open(host, user, password, channel); }, line->pump);
    if (!opened)
        return opened.failure();
    return std::unique_ptr<FtpConnection>(std::make_unique<WireConnection>(line, wire));
}

namespace {

// An answer with its body, kept whole.
template <class Call>
Result<WebAnswer> answerOf(EventPump* pump, Call call) {
    return RunBlocking(
        [&]() -> Result<WebAnswer> {
            QByteArray body;
            const auto answer = call([&](const char* bytes, std::size_t count) {
                body.append(bytes, static_cast<qsizetype>(count));
                return body.size() <= largestFetchedBody;
            });
            if (!answer)
                return answer.failure();
            return WebAnswer{body, answer->status};
        },
        pump);
}

} // namespace

Result<WebAnswer> PocoInternet::fetch(const QString& url) {
    const LineCall line = call();
    return answerOf(m_line->pump, [&](const BodySink& sink) { return HttpGet(url, line, sink); });
}

Result<WebAnswer> PocoInternet::post(const QString& url, const PostRequest& request) {
    const LineCall line = call();
    return answerOf(m_line->pump, [&](const BodySink& sink) { return HttpPost(url, request, line, sink); });
}

Result<std::optional<qint64>> PocoInternet::contentLength(const QString& url) {
    using Length = std::optional<qint64>;
    const LineCall line = call();
    return RunBlocking(
        [&]() -> Result<Length> {
            const auto answer = HttpHead(url, line);
            if (!answer)
                return answer.failure();
            if (answer->status == 404 || answer->status == 410)
                return Failure{Failure::Kind::NotFound, u"%1: the server has no such file"_s.arg(url)};
            // RFC 9110: timed out, too many requests, and faults of the server but "not implemented".
            const int status = answer->status;
            const bool busy = status == 408 || status == 429 || (status >= 500 && status != 501);
            if (busy)
                return Failure{Failure::Kind::Refused, u"%1: the server answered %2"_s.arg(url).arg(status)};
            return answer->good() ? answer->length : Length();
        },
        m_line->pump);
}

Result<void> PocoInternet::download(const QString& url, const HostPath& target) {
    const LineCall line = call();
    return RunBlocking(
        [&]() -> Result<void> {
            NewContent content(target, toText(target));
            qint64 taken = 0;
            const auto answer = HttpGet(url, line, [&](const char* bytes, std::size_t count) {
                content.append(bytes, count);
                taken += static_cast<qint64>(count);
                return !content.failed() && taken <= largestDownload;
            });
            if (!answer && !content.failed())
                return answer.failure();
            if (answer && !answer->good())
                return Failure{Failure::Kind::Refused, u"%1: the server answered %2"_s.arg(url).arg(answer->status)};
            return content.commit();
        },
        m_line->pump);
}

} // namespace lumora
