#include "platform/line/SmtpMail.h"

#include "common/HostFile.h"
#include "platform/line/BlockingCall.h"
#include "platform/line/MailText.h"
#include "platform/line/SmtpReply.h"

#include <Poco/Net/Context.h>
#include <Poco/Net/MailStream.h>
#include <Poco/Net/NetException.h>
#include <Poco/Net/SMTPClientSession.h>
#include <Poco/Net/SecureStreamSocket.h>
#include <Poco/Net/SocketStream.h>

#include <QStringList>

#include <algorithm>
#include <new>
#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Some servers take less, none is known to take more; read whole, a few copies of it stand in memory.
constexpr qint64 largestAttachment = 256 * 1024 * 1024;

using Poco::Net::Context;
using Poco::Net::StreamSocket;

Context::Ptr verifyingContext() {
    Context::Params params;
    params.verificationMode = Context::VERIFY_STRICT;
    params.loadDefaultCAs = true;
    return new Context(Context::TLS_CLIENT_USE, params);
}

StreamSocket connected(const MailAccount& account, const TimeLimits& limits) {
    const std::string host = account.host.toStdString();
    const Poco::Net::SocketAddress address(host, SmtpPort(account));
    if (account.encryption != MailEncryption::Tls) {
        StreamSocket socket;
        socket.connect(address, limits.connect);
        return socket;
    }
    Poco::Net::SecureStreamSocket socket(verifyingContext());
    socket.setPeerHostName(host);
    socket.connect(address, limits.connect);
    return socket;
}

// One exchange with a server. A step that fails throws; the library's exception carries the code of the reply, or 0
// where there was none.
class Exchange : public Poco::Net::SMTPClientSession {
public:
    Exchange(const MailAccount& account, const TimeLimits& limits)
        : SMTPClientSession(connected(account, limits))
        , m_account(account)
        , m_limits(limits) {
        limitSilence();
    }

    void deliver(const std::string& text) {
        greet();
        login();
        m_step = SmtpStep::Sender;
        std::string from = "MAIL FROM:<" + m_account.from.toStdString() + ">";
        if (offers("SIZE"))
            from += " SIZE=" + std::to_string(text.size());
        ask(from);
        m_step = SmtpStep::Recipient;
        ask("RCPT TO:<" + m_account.to.toStdString() + ">");
        m_step = SmtpStep::Text;
        sendData();
        sendText(text);
    }

    // So that the end of this object does not wait once more for a server that has fallen silent.
    void hangUp() { socket().close(); }

    SmtpStep step() const { return m_step; }

private:
    void limitSilence() {
        setTimeout(m_limits.silence);
        socket().setSendTimeout(m_limits.silence);
    }

    void greet() {
        open();
        hello();
        if (m_account.encryption != MailEncryption::StartTls)
            return;
        if (!offers("STARTTLS"))
            throw Poco::Net::SMTPException("the server offers no encryption");
        ask("STARTTLS");
        // What had come in the open is forgotten with the old socket.
        socket() = Poco::Net::SecureStreamSocket::attach(socket(), m_account.host.toStdString(), verifyingContext());
        limitSilence();
        hello();
    }

    // By address and not by name: the names that people give to such machines are no names to a mail server.
    void hello() {
        const Poco::Net::IPAddress own = socket().address().host();
        const bool six = own.family() == Poco::Net::IPAddress::IPv6;
        std::string reply;
        SMTPClientSession::login((six ? "[IPv6:" : "[") + own.toString() + "]", reply);
        m_offers = QString::fromStdString(reply).split(u'\n');
    }

    // The words of an extension that the server offers, "AUTH PLAIN LOGIN"; empty when it does not.
    QStringList offer(QLatin1String name) const {
        for (const QString& line : m_offers) {
            const QStringList words = line.mid(4).simplified().toUpper().split(u' ');
            if (words.first() == name)
                return words;
        }
        return {};
    }
    bool offers(const char* name) const { return !offer(QLatin1String(name)).isEmpty(); }

    void login() {
        if (m_account.user.isEmpty())
            return;
        m_step = SmtpStep::Login;
        const std::string user = m_account.user.toStdString();
        const std::string password = m_account.password.toStdString();
        const QStringList ways = offer(QLatin1String("AUTH"));
        if (ways.contains(u"CRAM-MD5"))
            loginUsingCRAMMD5(user, password);
        else if (ways.contains(u"PLAIN"))
            loginUsingPlain(user, password);
        else if (ways.contains(u"LOGIN"))
            loginUsingLogin(user, password);
        else
            throw Poco::Net::SMTPException("the server offers no login that is known here");
    }

    void ask(const std::string& command) {
        std::string reply;
        const int code = sendCommand(command, reply);
        judge(command, code, reply);
    }

    void judge(const std::string& what, int code, const std::string& reply) {
        if (!isPositiveCompletion(code))
            throw Poco::Net::SMTPException(what, reply, code);
    }

    void sendText(const std::string& text) {
        Poco::Net::SocketOutputStream out(socket());
        Poco::Net::MailOutputStream lines(out);
        lines.write(text.data(), static_cast<std::streamsize>(text.size()));
        lines.close();
        out.flush();
        std::string reply;
        const int code = socket().receiveStatusMessage(reply);
        judge("the text", code, reply);
    }

    const MailAccount& m_account;
    TimeLimits m_limits;
    QStringList m_offers;
    SmtpStep m_step = SmtpStep::Greeting;
};

// An address stands between "<" and ">" of a command; anything else in it would be a command of its own.
bool isAddress(const QString& text) {
    return !text.isEmpty() && std::all_of(text.begin(), text.end(), [](QChar c) {
        return c.unicode() > 0x20 && c.unicode() < 0x7F && c != u'<' && c != u'>';
    });
}

MailOutcome delivered(const MailAccount& account, const std::string& text, const TimeLimits& limits) {
    std::optional<Exchange> exchange;
    try {
        exchange.emplace(account, limits);
        exchange->deliver(text);
        return {};
    } catch (const Poco::Net::SMTPException& refusal) {
        const QString words = QString::fromStdString(refusal.message());
        if (refusal.code() == 0)
            return {MailEnd::NoContact, words};
        return {EndOfRefusal(exchange->step(), refusal.code(), words.toLatin1()), words};
    } catch (const Poco::Exception& lost) {
        if (exchange)
            exchange->hangUp();
        return {MailEnd::NoContact, QString::fromStdString(lost.displayText())};
    }
}

MailOutcome sendNow(const MailAccount& account, const MailMessage& message, const TimeLimits& limits) {
    const QString name = toText(message.attachment);
    auto attachment = readWholeFile(message.attachment, name, largestAttachment);
    if (!attachment) {
        const Failure& failure = attachment.failure();
        switch (failure.kind) {
        case Failure::Kind::NotFound:
            return {MailEnd::AttachmentMissing, failure.message};
        case Failure::Kind::TooLarge:
            return {MailEnd::TooLarge, failure.message};
        default:
            return {MailEnd::AttachmentUnreadable, failure.message};
        }
    }
    for (const QString& address : {account.from, account.to}) {
        if (!isAddress(address))
            return {MailEnd::RecipientRefused, u"\"%1\" is no mail address"_s.arg(address)};
    }
    const std::string text = MailText(account, message, *attachment);
    attachment->clear();
    return delivered(account, text, limits);
}

} // namespace

quint16 SmtpPort(const MailAccount& account) {
    if (account.port != 0)
        return account.port;
    switch (account.encryption) {
    case MailEncryption::None:
        return 25;
    case MailEncryption::StartTls:
        return 587;
    case MailEncryption::Tls:
        return 465;
    }
    return 25;
}

MailOutcome SmtpMail::send(const MailAccount& account, const MailMessage& message) {
    return RunBlocking([&]() -> MailOutcome {
        try {
            return sendNow(account, message, m_limits);
        } catch (const std::bad_alloc&) {
            return {MailEnd::NoMemory, u"no memory for %1"_s.arg(toText(message.attachment))};
        } catch (const std::exception& exception) {
            return {MailEnd::NoContact, QString::fromLocal8Bit(exception.what())};
        }
    });
}

} // namespace lumora
