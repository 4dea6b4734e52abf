#include "platform/line/HostReach.h"

#include "platform/line/BlockingCall.h"
#include "platform/line/LineSocket.h"

#include <QUrl>

#include <Poco/Exception.h>

namespace lumora {

using namespace Qt::StringLiterals;

Result<void> ReachHost(const QString& host, quint16 usualPort, const LineEncryption& encryption,
                       const TimeLimits& limits) {
    const QString asked = host.contains(u"://"_s) ? QUrl(host).authority() : host;
    const auto failed = [&](Failure::Kind kind, const QString& reason) {
        return Failure{kind, u"%1: %2"_s.arg(asked, reason)};
    };
    LineAbort line;
    const LineCall call(limits, line, std::make_shared<TlsTrust>(encryption.authorities));
    const bool encrypted = host.startsWith(u"https://"_s, Qt::CaseInsensitive);
    const bool plain = host.startsWith(u"http://"_s, Qt::CaseInsensitive);
    const WithoutBrokenPipeSignal guard;
    try {
        const quint16 port = encrypted ? httpsPort : plain ? httpPort : usualPort;
        LineSocket socket(ResolvedAddress(asked.toStdString(), port, call), call);
        if (encrypted)
            socket.encrypt(asked.toStdString(), call);
        socket.close();
        return {};
    } catch (const TlsRefused& refusal) {
        return tlsFailure(refusal.fault(), asked, QString::fromStdString(refusal.message()));
    } catch (const Poco::TimeoutException&) {
        return failed(Failure::Kind::TimedOut, u"no answer within the time limit"_s);
    } catch (const Poco::Exception& exception) {
        return failed(Failure::Kind::Disconnected, QString::fromStdString(exception.displayText()));
    } catch (const std::exception& exception) {
        return failed(Failure::Kind::Other, QString::fromLocal8Bit(exception.what()));
    }
}

} // namespace lumora
