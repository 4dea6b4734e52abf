#include "platform/line/HttpCall.h"

#include "common/AnsiCodePage.h"
#include "common/StationLog.h"

#include <QElapsedTimer>

#include <Poco/Exception.h>
#include <Poco/Net/HTTPBasicCredentials.h>
#include <Poco/Net/HTTPClientSession.h>
#include <Poco/Net/HTTPRequest.h>
#include <Poco/Net/HTTPResponse.h>

#include <algorithm>
#include <array>
#include <istream>
#include <ostream>
#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

Failure callFailure(Failure::Kind kind, const QString& url, const QString& reason) {
    return {kind, u"%1: %2"_s.arg(url, reason)};
}

constexpr qint64 pieceOfBody = 64 * 1024;

struct Address {
    std::string host; // with its port, if one is named
    QByteArray target;
    bool encrypted = false;

    QString scheme() const { return encrypted ? u"https://"_s : u"http://"_s; }
    Poco::UInt16 usualPort() const { return encrypted ? httpsPort : httpPort; }
};

Result<Address> addressOf(const QString& url) {
    const bool encrypted = url.startsWith(u"https://"_s, Qt::CaseInsensitive);
    if (!encrypted && !url.startsWith(u"http://"_s, Qt::CaseInsensitive))
        return callFailure(Failure::Kind::Unsupported, url, u"only http and https addresses can be called"_s);
    Address address{.host = {}, .target = {}, .encrypted = encrypted};
    const QString rest = url.mid(address.scheme().size());
    qsizetype hostEnd = 0;
    while (hostEnd < rest.size() && !u"/?#"_s.contains(rest[hostEnd]))
        ++hostEnd;
    address.host = rest.left(hostEnd).toStdString();
    address.target = HttpTarget(rest.mid(hostEnd));
    if (address.host.empty())
        return callFailure(Failure::Kind::Unsupported, url, u"the address names no host"_s);
    return address;
}

constexpr int mostRedirects = 5;

using Request = Poco::Net::HTTPRequest;
using Sending = std::function<void(std::ostream&)>;

// What is asked, of whichever address.
struct Asking {
    std::string method;
    std::string version = Request::HTTP_1_1;
    std::function<void(Request&)> fill = [](Request&) {};
    Sending send = [](std::ostream&) {}; // writes the request's body
};

struct Answered : HttpAnswer {
    std::optional<QString> next; // where a redirect leads that is to be followed
};

bool isRedirect(int status) {
    return (status >= 301 && status <= 303) || status == 307 || status == 308;
}

QString hostAndPort(const Address& address) {
    const QString usual = u":%1"_s.arg(address.usualPort());
    const QString text = address.scheme() + QString::fromStdString(address.host).toLower();
    return text.endsWith(usual) ? text.chopped(usual.size()) : text;
}

// Where a redirect leads on the same host and port, encrypted as before; no value where it leads elsewhere.
std::optional<QString> redirectTarget(const Address& from, const QString& location) {
    const QString host = from.scheme() + QString::fromStdString(from.host);
    QString url = location.left(location.indexOf(u'#'));
    if (url.startsWith(u"//"_s)) {
        url.prepend(from.scheme().chopped(2));
    } else if (url.startsWith(u'/')) {
        url.prepend(host);
    } else if (!url.contains(u"://"_s)) {
        const qsizetype query = from.target.indexOf('?');
        const QByteArray path = query < 0 ? from.target : from.target.left(query);
        url = host + AnsiCodePage::decode(path.left(path.lastIndexOf('/') + 1)) + url;
    }
    const auto to = addressOf(url);
    return to && hostAndPort(*to) == hostAndPort(from) ? std::optional(url) : std::nullopt;
}

// One request and its answer. The body of a redirect is not taken.
Result<Answered> askOnce(const QString& url, const Address& to, const Asking& asking, const LineCall& line,
                         const BodySink& sink) {
    try {
        LineSocket socket(ResolvedAddress(to.host, to.usualPort(), line), line);
        if (to.encrypted)
            socket.encrypt(to.host, line);
        Poco::Net::HTTPClientSession session(socket.socket);
        session.setKeepAlive(false);
        Request request(asking.method, to.target.toStdString(), asking.version);
        request.setHost(to.host);
        request.set("User-Agent", "vb wininet");
        request.set("Cache-Control", "no-cache");
        request.set("Pragma", "no-cache");
        asking.fill(request);
        std::ostream& out = session.sendRequest(request);
        asking.send(out);
        out.flush();
        // The streams keep what went wrong on the line to themselves.
        if (const Poco::Exception* lost = session.networkException())
            lost->rethrow();
        Poco::Net::HTTPResponse response;
        std::istream& body = session.receiveResponse(response);
        Answered answer;
        answer.status = static_cast<int>(response.getStatus());
        if (response.hasContentLength())
            answer.length = response.getContentLength64();
        if (isRedirect(answer.status)) {
            const bool post = asking.method == Request::HTTP_POST;
            if (response.has("Location") && (!post || answer.status >= 307))
                answer.next =
                    redirectTarget(to, AnsiCodePage::decode(QByteArray::fromStdString(response.get("Location"))));
            if (answer.next)
                return answer;
            if (post)
                return callFailure(Failure::Kind::Refused, url,
                                   u"the server answered %1 and did not take it"_s.arg(answer.status));
        }
        std::vector<char> bytes(16 * 1024);
        std::streamsize received = 0;
        while (body.good()) {
            body.read(bytes.data(), static_cast<std::streamsize>(bytes.size()));
            received += body.gcount();
            line.moved(body.gcount());
            if (body.gcount() > 0 && !sink(bytes.data(), static_cast<std::size_t>(body.gcount())))
                return callFailure(Failure::Kind::TooLarge, url, u"the answer could not be taken whole"_s);
        }
        if (const Poco::Exception* lost = session.networkException())
            lost->rethrow();
        line.check();
        if (asking.method != Request::HTTP_HEAD && received < answer.length.value_or(received))
            return callFailure(Failure::Kind::Disconnected, url, u"the answer was cut short"_s);
        return answer;
    } catch (const TlsRefused& refusal) {
        return tlsFailure(refusal.fault(), url, QString::fromStdString(refusal.message()));
    } catch (const Poco::TimeoutException&) {
        return callFailure(Failure::Kind::TimedOut, url, u"no answer within the time limit"_s);
    } catch (const Poco::Exception& exception) {
        return callFailure(Failure::Kind::Disconnected, url, QString::fromStdString(exception.displayText()));
    } catch (const std::exception& exception) {
        return callFailure(Failure::Kind::Other, url, QString::fromLocal8Bit(exception.what()));
    }
}

Result<HttpAnswer> ask(QString url, const Asking& asking, const LineCall& line, const BodySink& sink) {
    for (int redirects = 0; redirects <= mostRedirects; ++redirects) {
        const auto to = addressOf(url);
        if (!to)
            return to.failure();
        QElapsedTimer timer;
        timer.start();
        const auto answer = askOnce(url, *to, asking, line, sink);
        // Without the address: a report's holds the customer's name.
        const QString step = u"http %1"_s.arg(QString::fromStdString(asking.method));
        if (!answer) {
            writeLog(step, answer.failure());
            return answer.failure();
        }
        writeLog(u"%1 %2, %3 ms"_s.arg(step).arg(answer->status).arg(timer.elapsed()));
        if (!answer->next)
            return HttpAnswer(*answer);
        url = *answer->next;
    }
    return callFailure(Failure::Kind::Refused, url, u"the server redirects without an end"_s);
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

Result<HttpAnswer> HttpGet(const QString& url, const LineCall& line, const BodySink& sink) {
    return ask(url, {.method = Request::HTTP_GET}, line, sink);
}

Result<HttpAnswer> HttpHead(const QString& url, const LineCall& line) {
    return ask(url, {.method = Request::HTTP_HEAD}, line, [](const char*, std::size_t) { return true; });
}

Result<HttpAnswer> HttpPost(const QString& url, const PostRequest& post, const LineCall& line, const BodySink& sink) {
    const qint64 announced = std::max<qint64>(post.announcedLength, post.body.size());
    Asking asking{.method = Request::HTTP_POST};
    if (post.version == PostRequest::Version::Http10)
        asking.version = Request::HTTP_1_0;
    asking.fill = [&](Request& request) {
        request.setContentType(post.contentType.toStdString());
        request.setContentLength64(announced);
        if (!post.user.isEmpty() && !post.password.isEmpty())
            Poco::Net::HTTPBasicCredentials(AnsiCodePage::encode(post.user).toStdString(),
                                            AnsiCodePage::encode(post.password).toStdString())
                .authenticate(request);
    };
    const auto write = [&line](std::ostream& out, const char* bytes, qint64 count) {
        out.write(bytes, count);
        if (out.good())
            line.moved(count);
    };
    asking.send = [&](std::ostream& out) {
        for (qint64 at = 0; at < post.body.size() && out.good(); at += pieceOfBody)
            write(out, post.body.constData() + at, std::min<qint64>(pieceOfBody, post.body.size() - at));
        static constexpr std::array<char, pieceOfBody> zeros{};
        for (qint64 left = announced - post.body.size(); left > 0 && out.good(); left -= pieceOfBody)
            write(out, zeros.data(), std::min<qint64>(pieceOfBody, left));
    };
    return ask(url, asking, line, sink);
}

} // namespace lumora
