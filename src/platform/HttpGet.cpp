#include "platform/HttpGet.h"

#include "common/AnsiCodePage.h"

#include <Poco/Exception.h>
#include <Poco/Net/HTTPClientSession.h>
#include <Poco/Net/HTTPRequest.h>
#include <Poco/Net/HTTPResponse.h>
#include <Poco/Net/SocketAddress.h>

#include <istream>
#include <vector>

namespace lumora {
namespace {

constexpr Poco::UInt16 httpPort = 80;

Failure failure(Failure::Kind kind, const QString& url, const QString& reason) {
    return {kind, QStringLiteral("%1: %2").arg(url, reason)};
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
    const QString scheme = QStringLiteral("http://");
    if (!url.startsWith(scheme, Qt::CaseInsensitive))
        return failure(Failure::Kind::Unsupported, url, QStringLiteral("only http addresses can be called"));
    const QString rest = url.mid(scheme.size());
    qsizetype hostEnd = 0;
    while (hostEnd < rest.size() && !QStringLiteral("/?#").contains(rest[hostEnd]))
        ++hostEnd;
    const std::string host = rest.left(hostEnd).toStdString();
    if (host.empty())
        return failure(Failure::Kind::Unsupported, url, QStringLiteral("the address names no host"));

    try {
        const bool withPort = host.find(':') != std::string::npos;
        const Poco::Net::SocketAddress address =
            withPort ? Poco::Net::SocketAddress(host) : Poco::Net::SocketAddress(host, httpPort);
        Poco::Net::HTTPClientSession session(address);
        session.setTimeout(limits.connect, limits.silence, limits.silence);
        session.setKeepAlive(false);
        Poco::Net::HTTPRequest request(Poco::Net::HTTPRequest::HTTP_GET, HttpTarget(rest.mid(hostEnd)).toStdString(),
                                       Poco::Net::HTTPMessage::HTTP_1_1);
        request.setHost(host);
        request.set("User-Agent", "vb wininet");
        request.set("Cache-Control", "no-cache");
        request.set("Pragma", "no-cache");
        session.sendRequest(request);
        Poco::Net::HTTPResponse response;
        std::istream& body = session.receiveResponse(response);
        std::vector<char> bytes(16 * 1024);
        std::streamsize received = 0;
        while (body.good()) {
            body.read(bytes.data(), static_cast<std::streamsize>(bytes.size()));
            received += body.gcount();
            if (body.gcount() > 0 && !sink(bytes.data(), static_cast<std::size_t>(body.gcount())))
                return failure(Failure::Kind::TooLarge, url, QStringLiteral("the answer could not be taken whole"));
        }
        // The stream keeps what went wrong on the line to itself.
        if (const Poco::Exception* lost = session.networkException())
            lost->rethrow();
        const std::streamsize announced = response.hasContentLength() ? response.getContentLength64() : received;
        if (received < announced)
            return failure(Failure::Kind::Disconnected, url, QStringLiteral("the answer was cut short"));
        return static_cast<int>(response.getStatus());
    } catch (const Poco::TimeoutException&) {
        return failure(Failure::Kind::TimedOut, url, QStringLiteral("no answer within the time limit"));
    } catch (const Poco::Exception& exception) {
        return failure(Failure::Kind::Disconnected, url, QString::fromStdString(exception.displayText()));
    } catch (const std::exception& exception) {
        return failure(Failure::Kind::Other, url, QString::fromLocal8Bit(exception.what()));
    }
}

} // namespace lumora
