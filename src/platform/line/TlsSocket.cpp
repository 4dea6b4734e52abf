#include "platform/line/TlsSocket.h"

#include <openssl/err.h>
#include <openssl/ssl.h>
#include <openssl/x509v3.h>

#include <Poco/Net/IPAddress.h>
#include <Poco/Net/StreamSocketImpl.h>

#include <fcntl.h>

#include <cerrno>
#include <chrono>
#include <cstring>
#include <new>
#include <optional>

namespace lumora {
namespace {

using namespace std::chrono_literals;
using Poco::Net::StreamSocket;
using TlsClock = std::chrono::steady_clock;

std::string reasonOf(unsigned long error) {
    const char* text = ERR_reason_error_string(error);
    return text ? text : "";
}

TlsFault faultOfCertificate(long verdict) {
    switch (verdict) {
    case X509_V_ERR_HOSTNAME_MISMATCH:
    case X509_V_ERR_IP_ADDRESS_MISMATCH:
        return TlsFault::WrongHost;
    case X509_V_ERR_CERT_HAS_EXPIRED:
        return TlsFault::Expired;
    case X509_V_ERR_CERT_NOT_YET_VALID:
        return TlsFault::NotYetValid;
    case X509_V_ERR_DEPTH_ZERO_SELF_SIGNED_CERT:
        return TlsFault::SelfSigned;
    case X509_V_ERR_SELF_SIGNED_CERT_IN_CHAIN:
    case X509_V_ERR_UNABLE_TO_GET_ISSUER_CERT:
    case X509_V_ERR_UNABLE_TO_GET_ISSUER_CERT_LOCALLY:
    case X509_V_ERR_UNABLE_TO_VERIFY_LEAF_SIGNATURE:
        return TlsFault::UnknownAuthority;
    default:
        return TlsFault::NotTrusted;
    }
}

// What was read in place of a handshake: words, or a protocol that is not taken; no value for a line that broke.
std::optional<TlsFault> faultOfHandshake(int reason) {
    switch (reason) {
    case SSL_R_WRONG_VERSION_NUMBER:
    case SSL_R_HTTP_REQUEST:
    case SSL_R_HTTPS_PROXY_REQUEST:
    case SSL_R_PACKET_LENGTH_TOO_LONG:
    case SSL_R_UNEXPECTED_MESSAGE:
        return TlsFault::NotOffered;
    case SSL_R_UNSUPPORTED_PROTOCOL:
    case SSL_R_NO_PROTOCOLS_AVAILABLE:
    case SSL_R_TLSV1_ALERT_PROTOCOL_VERSION:
        return TlsFault::TooOld;
    default:
        return std::nullopt;
    }
}

class TlsSocketImpl : public Poco::Net::StreamSocketImpl {
public:
    TlsSocketImpl(int descriptor, SSL_CTX* context, const std::string& host, const TlsSession& resumed)
        : StreamSocketImpl(descriptor)
        , m_ssl(SSL_new(context)) {
        if (!m_ssl)
            throw std::bad_alloc();
        Poco::Net::IPAddress address;
        if (Poco::Net::IPAddress::tryParse(host, address)) {
            X509_VERIFY_PARAM_set1_ip_asc(SSL_get0_param(m_ssl), host.c_str());
        } else {
            // RFC 9525, section 6.3: the common name says nothing.
            SSL_set_hostflags(m_ssl, X509_CHECK_FLAG_NO_PARTIAL_WILDCARDS | X509_CHECK_FLAG_NEVER_CHECK_SUBJECT);
            SSL_set1_host(m_ssl, host.c_str());
            SSL_set_tlsext_host_name(m_ssl, host.c_str());
        }
        SSL_set_fd(m_ssl, descriptor);
        if (resumed)
            SSL_set_session(m_ssl, resumed.get());
        // The waits are ours, so that each ends with its limit.
        ::fcntl(descriptor, F_SETFL, ::fcntl(descriptor, F_GETFL) | O_NONBLOCK);
    }

    void shakeHands(const Poco::Timespan& limit) {
        const auto until = TlsClock::now() + std::chrono::microseconds(limit.totalMicroseconds());
        step([this] { return SSL_connect(m_ssl); },
             [&](int mode) {
                 const auto left = std::chrono::duration_cast<std::chrono::microseconds>(until - TlsClock::now());
                 return left > 0us && poll(Poco::Timespan(left.count()), mode);
             });
        m_ready = true;
    }

    TlsSession session() const {
        SSL_SESSION* known = SSL_get0_session(m_ssl);
        if (!known || SSL_SESSION_is_resumable(known) == 0)
            return {};
        // A copy: a line that ends badly spoils its session for the others.
        return TlsSession(SSL_SESSION_dup(known), SSL_SESSION_free);
    }

    int sendBytes(const void* bytes, int length, int) override {
        return length <= 0 ? 0 : step([&] { return SSL_write(m_ssl, bytes, length); }, Silence{this, getSendTimeout()});
    }

    int receiveBytes(void* bytes, int length, int) override {
        return length <= 0 ? 0
                           : step([&] { return SSL_read(m_ssl, bytes, length); }, Silence{this, getReceiveTimeout()});
    }

    int available() override { return SSL_pending(m_ssl); }

    bool secure() const override { return true; }

    // Tells the other side that this was all; what it still says can be read.
    void shutdownSend() override {
        step([this] { return SSL_shutdown(m_ssl) < 0 ? -1 : 1; }, Silence{this, getSendTimeout()});
        StreamSocketImpl::shutdownSend();
    }

protected:
    ~TlsSocketImpl() override { SSL_free(m_ssl); }

private:
    // The time begins anew with each byte, as it does on a plain line.
    struct Silence {
        TlsSocketImpl* line;
        Poco::Timespan limit;
        bool operator()(int mode) const { return line->poll(limit, mode); }
    };

    // Repeats a call of the library until it has bytes, the end (0), or throws. wait: for SELECT_READ or SELECT_WRITE;
    // false when its time is over.
    template <class Call, class Wait>
    int step(Call call, Wait wait) {
        for (;;) {
            ERR_clear_error();
            errno = 0;
            const int result = call();
            if (result > 0)
                return result;
            const int lastErrno = errno;
            switch (SSL_get_error(m_ssl, result)) {
            case SSL_ERROR_WANT_READ:
                if (!wait(SELECT_READ))
                    throw Poco::TimeoutException();
                break;
            case SSL_ERROR_WANT_WRITE:
                if (!wait(SELECT_WRITE))
                    throw Poco::TimeoutException();
                break;
            case SSL_ERROR_ZERO_RETURN:
                return 0;
            case SSL_ERROR_SYSCALL:
                throw Poco::Net::ConnectionResetException(lastErrno == 0 ? "the server closed the connection"
                                                                         : std::strerror(lastErrno));
            default:
                fail();
            }
        }
    }

    [[noreturn]] void fail() {
        const unsigned long error = ERR_peek_error();
        const int reason = ERR_GET_REASON(error);
        if (reason == SSL_R_UNEXPECTED_EOF_WHILE_READING) {
            if (!m_ready)
                throw Poco::Net::ConnectionResetException("the server ended the handshake");
            throw TlsEndedEarly();
        }
        if (reason == SSL_R_CERTIFICATE_VERIFY_FAILED) {
            const long verdict = SSL_get_verify_result(m_ssl);
            throw TlsRefused(faultOfCertificate(verdict), X509_verify_cert_error_string(verdict));
        }
        if (const auto fault = faultOfHandshake(reason); fault && !m_ready)
            throw TlsRefused(*fault, reasonOf(error));
        throw Poco::Net::NetException("encryption", reasonOf(error));
    }

    SSL* m_ssl;
    bool m_ready = false; // the handshake is behind; after a fault the library no longer tells
};

} // namespace

ssl_ctx_st* TlsTrust::context() const {
    std::call_once(m_once, [this] { read(); });
    if (!m_allRead)
        throw TlsRefused(TlsFault::NoAuthorities, m_authorities.toStdString());
    return m_context;
}

void TlsTrust::read() const {
    m_context = SSL_CTX_new(TLS_client_method());
    if (!m_context)
        throw std::bad_alloc();
    SSL_CTX_set_min_proto_version(m_context, TLS1_2_VERSION);
    SSL_CTX_set_options(m_context, SSL_OP_NO_RENEGOTIATION | SSL_OP_NO_COMPRESSION);
    SSL_CTX_set_session_cache_mode(m_context, SSL_SESS_CACHE_OFF);
    SSL_CTX_set_verify(m_context, SSL_VERIFY_PEER, nullptr);
    // A lab may name its server's own certificate, or an authority that another one stands above.
    X509_VERIFY_PARAM_set_flags(SSL_CTX_get0_param(m_context), X509_V_FLAG_PARTIAL_CHAIN);
    SSL_CTX_set_default_verify_paths(m_context);
    m_allRead = m_authorities.isEmpty() ||
                SSL_CTX_load_verify_locations(m_context, m_authorities.toLocal8Bit().constData(), nullptr) == 1;
    ERR_clear_error();
}

TlsTrust::~TlsTrust() {
    SSL_CTX_free(m_context);
}

StreamSocket EncryptedSocket(const StreamSocket& plain, const std::string& host, const TlsTrust& trust,
                             const Poco::Timespan& limit, const TlsSession& resumed) {
    ssl_ctx_st* const context = trust.context();
    const int descriptor = ::fcntl(plain.impl()->sockfd(), F_DUPFD_CLOEXEC, 0);
    if (descriptor < 0)
        throw Poco::Net::NetException("no further connection can be opened");
    Poco::AutoPtr<TlsSocketImpl> impl(new TlsSocketImpl(descriptor, context, host, resumed));
    StreamSocket socket(impl.duplicate());
    impl->shakeHands(limit);
    return socket;
}

TlsSession TlsSessionOf(const StreamSocket& socket) {
    const auto* impl = dynamic_cast<const TlsSocketImpl*>(socket.impl());
    return impl ? impl->session() : TlsSession();
}

} // namespace lumora
