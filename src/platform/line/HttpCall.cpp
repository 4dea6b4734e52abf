#include "platform/line/HttpCall.h"

#include "common/AnsiCodePage.h"

#include <Poco/Exception.h>
#include <Poco/Net/HTTPBasicCredentials.h>
#include <Poco/Net/HTTPClientSession.h>
#include <Poco/Net/HTTPRequest.h>
#include <Poco/Net/HTTPResponse.h>
#include <Poco/Net/SocketAddress.h>

#include <algorithm>
#include <array>
#include <istream>
#include <ostream>
#include <vector>

namespace lumora {
namespace {

Failure callFailure(Failure::Kind kind, const QString& url, const QString& reason) {
    return {kind, QStringLiteral("%1: %2").arg(url, reason)};
}

constexpr qint64 pieceOfBody = 64 * 1024;

struct Address {
    std::string host; // with its port, if one is named
    QByteArray target;
};

Result<Address> addressOf(const QString& url) {
    const QString scheme = QStringLiteral("http://");
    if (!url.startsWith(scheme, Qt::CaseInsensitive))
        return callFailure(Failure::Kind::Unsupported, url, QStringLiteral("only http addresses can be called"));
    const QString rest = url.mid(scheme.size());
    qsizetype hostEnd = 0;
    while (hostEnd < rest.size() && !QStringLiteral("/?#").contains(rest[hostEnd]))
        ++hostEnd;
    Address address{rest.left(hostEnd).toStdString(), HttpTarget(rest.mid(hostEnd))};
    if (address.host.empty())
        return callFailure(Failure::Kind::Unsupported, url, QStringLiteral("the address names no host"));
    return address;
}

// A numeric host of the newer kind has colons of its own, in brackets.
std::string withPort(const std::string& host) {
    const std::size_t name = host.rfind(']');
    return host.find(':', name == std::string::npos ? 0 : name) == std::string::npos ? host + ":80" : host;
}

using Request = Poco::Net::HTTPRequest;
using Sending = std::function<void(std::ostream&)>;

// One request and its answer. send writes the request's body.
Result<int> call(const QString& url, const char* method, const std::string& version, const TimeLimits& limits,
                 const std::function<void(Request&)>& fill, const Sending& send, const BodySink& sink) {
    const auto to = addressOf(url);
    if (!to)
        return to.failure();
    try {
        const Poco::Net::SocketAddress address(withPort(to->host));
        Poco::Net::HTTPClientSession session(address);
        session.setTimeout(limits.connect, limits.silence, limits.silence);
        session.setKeepAlive(false);
        Request request(method, to->target.toStdString(), version);
        request.setHost(to->host);
        request.set("User-Agent", "vb wininet");
        request.set("Cache-Control", "no-cache");
        request.set("Pragma", "no-cache");
        fill(request);
        std::ostream& out = session.sendRequest(request);
        send(out);
        out.flush();
        // The streams keep what went wrong on the line to themselves.
        if (const Poco::Exception* lost = session.networkException())
            lost->rethrow();
        Poco::Net::HTTPResponse response;
        std::istream& body = session.receiveResponse(response);
        std::vector<char> bytes(16 * 1024);
        std::streamsize received = 0;
        while (body.good()) {
            body.read(bytes.data(), static_cast<std::streamsize>(bytes.size()));
            received += body.gcount();
            if (body.gcount() > 0 && !sink(bytes.data(), static_cast<std::size_t>(body.gcount())))
                return callFailure(Failure::Kind::TooLarge, url, QStringLiteral("the answer could not be taken whole"));
        }
        if (const Poco::Exception* lost = session.networkException())
            lost->rethrow();
        const std::streamsize announced = response.hasContentLength() ? response.getContentLength64() : received;
        if (received < announced)
            return callFailure(Failure::Kind::Disconnected, url, QStringLiteral("the answer was cut short"));
        return static_cast<int>(response.getStatus());
    } catch (const Poco::TimeoutException&) {
        return callFailure(Failure::Kind::TimedOut, url, QStringLiteral("no answer within the time limit"));
    } catch (const Poco::Exception& exception) {
        return callFailure(Failure::Kind::Disconnected, url, QString::fromStdString(exception.displayText()));
    } catch (const std::exception& exception) {
        return callFailure(Failure::Kind::Other, url, QString::fromLocal8Bit(exception.what()));
    }
}

} // namespace

QByteArray HttpTarget(const QString& pathAndQuery) {
    QByteArray target;
    for (const char c : AnsiCodePage::encode(pathAndQuery)) {
        if (c == ' ' || c == '\r' || c == '\n' || c == '\0')
            target += "%20";
        else
            target += c;
    }
    if (!target.startsWith('/'))
        target.prepend('/');
    return target;
}

Result<int> HttpGet(const QString& url, const TimeLimits& limits, const BodySink& sink) {
    return call(
        url, Request::HTTP_GET.c_str(), Request::HTTP_1_1, limits, [](Request&) {}, [](std::ostream&) {}, sink);
}

Result<int> HttpPost(const QString& url, const PostRequest& post, const TimeLimits& limits, const BodySink& sink) {
    const qint64 announced = std::max<qint64>(post.announcedLength, post.body.size());
    const auto fill = [&](Request& request) {
        request.setContentType(post.contentType.toStdString());
        request.setContentLength64(announced);
        if (!post.user.isEmpty() && !post.password.isEmpty())
            Poco::Net::HTTPBasicCredentials(AnsiCodePage::encode(post.user).toStdString(),
                                            AnsiCodePage::encode(post.password).toStdString())
                .authenticate(request);
    };
    const auto send = [&](std::ostream& out) {
        for (qint64 at = 0; at < post.body.size() && out.good(); at += pieceOfBody)
            out.write(post.body.constData() + at, std::min<qint64>(pieceOfBody, post.body.size() - at));
        static constexpr std::array<char, pieceOfBody> zeros{};
        for (qint64 left = announced - post.body.size(); left > 0 && out.good(); left -= pieceOfBody)
            out.write(zeros.data(), std::min<qint64>(pieceOfBody, left));
    };
    const auto& version = post.version == PostRequest::Version::Http10 ? Request::HTTP_1_0 : Request::HTTP_1_1;
    return call(url, Request::HTTP_POST.c_str(), version, limits, fill, send, sink);
}

} // namespace lumora
