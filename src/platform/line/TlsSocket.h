#pragma once

#include "platform/line/Encryption.h"

#include <Poco/Net/NetException.h>
#include <Poco/Net/StreamSocket.h>
#include <Poco/Timespan.h>

#include <memory>
#include <mutex>
#include <string>
#include <utility>

struct ssl_ctx_st;
struct ssl_session_st;

namespace lumora {

// No encrypted line came about, or none that can be trusted.
class TlsRefused : public Poco::Net::NetException {
public:
    TlsRefused(TlsFault fault, const std::string& detail)
        : NetException(detail)
        , m_fault(fault) {}
    TlsFault fault() const { return m_fault; }

private:
    TlsFault m_fault;
};

// Whom encrypted lines believe: TLS 1.2 and up, certificates of this machine's authorities and of a lab's own, for the
// host that was asked for. Used by any thread.
class TlsTrust {
public:
    // authorities: a PEM file, or empty.
    explicit TlsTrust(QString authorities = {})
        : m_authorities(std::move(authorities)) {}
    ~TlsTrust();
    TlsTrust(const TlsTrust&) = delete;
    TlsTrust& operator=(const TlsTrust&) = delete;

    // Reads the authorities at the first call, which takes some hundredths of a second. Throws TlsRefused where the
    // lab's file can't be read.
    ssl_ctx_st* context() const;

private:
    void read() const;

    QString m_authorities;
    mutable std::once_flag m_once;
    mutable ssl_ctx_st* m_context = nullptr;
    mutable bool m_allRead = false;
};

// The other side has gone without saying that this was all (close_notify), as a cut line looks.
class TlsEndedEarly : public Poco::Net::NetException {
public:
    TlsEndedEarly()
        : NetException("the encrypted line ended before its end was told") {}
};

// What a server knows an encrypted line by, so that another one can be shown to be of the same client.
using TlsSession = std::shared_ptr<ssl_session_st>;

// An encrypted socket in place of a connected one, which is no longer to be used. The library's own secure socket is
// not used: its shutdownSend() tells the other side nothing, and each of its waits lasts twice the limit. host: the
// name that the certificate must have, or an address. limit: for the whole handshake; the limits of the waits behind it
// are those of the socket. Throws TlsRefused, and what a line throws.
Poco::Net::StreamSocket EncryptedSocket(const Poco::Net::StreamSocket& plain, const std::string& host,
                                        const TlsTrust& trust, const Poco::Timespan& limit,
                                        const TlsSession& resumed = {});

// The session of an encrypted line as it stands, for the next one. Under TLS 1.3 the server sends it behind the
// handshake, so it is asked for when it is needed; empty where it has sent none.
TlsSession TlsSessionOf(const Poco::Net::StreamSocket& socket);

} // namespace lumora
