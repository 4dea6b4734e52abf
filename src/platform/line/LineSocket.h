#pragma once

#include "platform/line/LineAbort.h"
#include "platform/line/TimeLimits.h"
#include "platform/line/TlsSocket.h"

#include <Poco/Net/SocketAddress.h>
#include <Poco/Net/StreamSocket.h>

#include <memory>
#include <string>
#include <utility>

namespace lumora {

constexpr Poco::UInt16 httpPort = 80;
constexpr Poco::UInt16 httpsPort = 443;

// What a dialogue needs of the line it goes over: its time limits, and whether it has been cut meanwhile.
class LineCall {
public:
    LineCall(const TimeLimits& limits, LineAbort& line, std::shared_ptr<const TlsTrust> trust)
        : m_limits(limits)
        , m_line(&line)
        , m_begun(line.count())
        , m_trust(std::move(trust)) {}

    const TimeLimits& limits() const { return m_limits; }
    LineAbort& line() const { return *m_line; }
    const TlsTrust& trust() const { return *m_trust; }
    bool aborted() const { return m_line->count() != m_begun; }
    // Counts bytes of a transfer.
    void moved(std::int64_t bytes) const { m_line->moved(bytes); }
    // Throws when the line has been cut.
    void check() const;

private:
    TimeLimits m_limits;
    LineAbort* m_line;
    int m_begun;
    std::shared_ptr<const TlsTrust> m_trust;
};

// "host" of "host", "host:port" and "[address]:port".
std::string HostWithoutPort(const std::string& host);

// The address of "host", "host:port" or "[address]:port". Asking for a name ends with the limit for connecting and with
// an abort.
Poco::Net::SocketAddress ResolvedAddress(const std::string& host, Poco::UInt16 usualPort, const LineCall& call);

// A connected socket, with the limits of the call, that an abort reaches.
struct LineSocket {
    LineSocket() = default;
    LineSocket(const Poco::Net::SocketAddress& address, const LineCall& call);

    // From here on encrypted, with a server that has proven to be the host, which may have a port. Ends with an abort.
    void encrypt(const std::string& host, const LineCall& call, const TlsSession& resumed = {});

    // The other side sees the end of the connection.
    void close();

    Poco::Net::StreamSocket socket;
    LineAbort::Watch watch;
};

} // namespace lumora
