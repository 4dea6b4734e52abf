#pragma once

#include "platform/line/LineAbort.h"
#include "platform/line/TimeLimits.h"

#include <Poco/Net/SocketAddress.h>
#include <Poco/Net/StreamSocket.h>

#include <string>

namespace lumora {

// What a dialogue needs of the line it goes over: its time limits, and whether it has been cut meanwhile.
class LineCall {
public:
    LineCall(const TimeLimits& limits, LineAbort& line)
        : m_limits(limits)
        , m_line(&line)
        , m_begun(line.count()) {}

    const TimeLimits& limits() const { return m_limits; }
    LineAbort& line() const { return *m_line; }
    bool aborted() const { return m_line->count() != m_begun; }
    // Counts bytes of a transfer.
    void moved(std::int64_t bytes) const { m_line->moved(bytes); }
    // Throws when the line has been cut.
    void check() const;

private:
    TimeLimits m_limits;
    LineAbort* m_line;
    int m_begun;
};

// The address of "host", "host:port" or "[address]:port". Asking for a name ends with the limit for connecting and with
// an abort.
Poco::Net::SocketAddress ResolvedAddress(const std::string& host, Poco::UInt16 usualPort, const LineCall& call);

// A connected socket, with the limits of the call, that an abort reaches.
struct LineSocket {
    LineSocket() = default;
    LineSocket(const Poco::Net::SocketAddress& address, const LineCall& call);

    // The other side sees the end of the connection.
    void close();

    Poco::Net::StreamSocket socket;
    LineAbort::Watch watch;
};

} // namespace lumora
