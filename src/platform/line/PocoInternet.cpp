#include "platform/line/PocoInternet.h"

#include "common/HostFile.h"
#include "platform/line/BlockingCall.h"
#include "platform/line/HttpCall.h"

#include <ifaddrs.h>
#include <net/if.h>
#include <sys/socket.h>

#include <utility>

namespace lumora {
namespace {

class WireConnection : public FtpConnection {
public:
    explicit WireConnection(std::unique_ptr<FtpSessionWire> wire)
        : m_wire(std::move(wire)) {}
    ~WireConnection() override {
        RunBlocking([this] {
            m_wire->close();
            return true;
        });
    }

    Result<void> setCurrentDirectory(const QString& directory) override {
        return RunBlocking([&] { return m_wire->command("CWD", directory); });
    }
    Result<QString> currentDirectory() override {
        return RunBlocking([&] { return m_wire->currentDirectory(); });
    }
    Result<void> makeDirectory(const QString& name) override {
        return RunBlocking([&] { return m_wire->command("MKD", name); });
    }
    Result<void> put(const HostPath& local, const QString& remoteName) override {
        return RunBlocking([&] { return m_wire->put(local, remoteName); });
    }
    Result<void> get(const QString& remoteName, const HostPath& local) override {
        return RunBlocking([&] { return m_wire->get(remoteName, local); });
    }
    Result<void> remove(const QString& remoteName) override {
        return RunBlocking([&] { return m_wire->command("DELE", remoteName); });
    }
    Result<std::vector<FtpEntry>> list(const QString& pattern) override {
        return RunBlocking([&] { return m_wire->list(pattern); });
    }
    QString lastResponse() const override { return m_wire->lastResponse(); }

private:
    std::unique_ptr<FtpSessionWire> m_wire;
};

} // namespace

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
    auto wire = std::make_unique<FtpSessionWire>(m_limits);
    const auto opened = RunBlocking([&] { return wire->open(host, user, password, channel); });
    if (!opened)
        return opened.failure();
    return std::unique_ptr<FtpConnection>(std::make_unique<WireConnection>(std::move(wire)));
}

namespace {

// The body of an answer, kept whole.
template <class Call>
Result<QByteArray> bodyOf(Call call) {
    return RunBlocking([&]() -> Result<QByteArray> {
        QByteArray body;
        const auto status = call([&](const char* bytes, std::size_t count) {
            body.append(bytes, static_cast<qsizetype>(count));
            return body.size() <= largestFetchedBody;
        });
        if (!status)
            return status.failure();
        return body;
    });
}

} // namespace

Result<QByteArray> PocoInternet::fetch(const QString& url) {
    return bodyOf([&](const BodySink& sink) { return HttpGet(url, m_limits, sink); });
}

Result<QByteArray> PocoInternet::post(const QString& url, const PostRequest& request) {
    return bodyOf([&](const BodySink& sink) { return HttpPost(url, request, m_limits, sink); });
}

Result<void> PocoInternet::download(const QString& url, const HostPath& target) {
    return RunBlocking([&]() -> Result<void> {
        NewContent content(target, toText(target));
        qint64 taken = 0;
        const auto status = HttpGet(url, m_limits, [&](const char* bytes, std::size_t count) {
            content.append(bytes, count);
            taken += static_cast<qint64>(count);
            return !content.failed() && taken <= largestDownload;
        });
        if (!status && !content.failed())
            return status.failure();
        if (status && (*status < 200 || *status > 299))
            return Failure{Failure::Kind::Refused, QStringLiteral("%1: the server answered %2").arg(url).arg(*status)};
        return content.commit();
    });
}

} // namespace lumora
