#include "platform/line/LineSocket.h"

#include "common/Background.h"

#include <Poco/Exception.h>
#include <Poco/Net/IPAddress.h>
#include <Poco/Net/NetException.h>

#include <algorithm>
#include <chrono>
#include <condition_variable>
#include <memory>
#include <mutex>
#include <optional>

namespace lumora {
namespace {

using Poco::Net::SocketAddress;

// A name server is asked by a thread that outlives the call when the answer does not come.
struct NameAnswer {
    std::mutex mutex;
    std::condition_variable told;
    std::optional<SocketAddress> address;
    std::exception_ptr failure;
    bool done = false;
};

constexpr auto lookAtAbort = std::chrono::milliseconds(50);

// The place of the colon before a port; npos without one.
std::size_t portSign(const std::string& host) {
    const std::size_t bracket = host.rfind(']');
    return host.find(':', bracket == std::string::npos ? 0 : bracket);
}

} // namespace

void LineCall::check() const {
    if (aborted())
        throw Poco::Net::ConnectionAbortedException("the sending was stopped");
}

std::string HostWithoutPort(const std::string& host) {
    const std::string name = host.substr(0, portSign(host));
    return !name.empty() && name.front() == '[' && name.back() == ']' ? name.substr(1, name.size() - 2) : name;
}

SocketAddress ResolvedAddress(const std::string& host, Poco::UInt16 usualPort, const LineCall& call) {
    const std::size_t colon = portSign(host);
    const std::string name = HostWithoutPort(host);
    const std::string port = colon == std::string::npos ? std::to_string(usualPort) : host.substr(colon + 1);
    Poco::Net::IPAddress numeric;
    if (Poco::Net::IPAddress::tryParse(name, numeric))
        return SocketAddress(name, port);

    const auto answer = std::make_shared<NameAnswer>();
    runInBackground([answer, name, port] {
        std::optional<SocketAddress> address;
        std::exception_ptr failure;
        try {
            address = SocketAddress(name, port);
        } catch (...) {
            failure = std::current_exception();
        }
        const std::lock_guard lock(answer->mutex);
        answer->address = address;
        answer->failure = failure;
        answer->done = true;
        answer->told.notify_one();
    });
    std::unique_lock lock(answer->mutex);
    const auto limit =
        std::chrono::steady_clock::now() + std::chrono::microseconds(call.limits().connect.totalMicroseconds());
    while (!answer->told.wait_for(lock, lookAtAbort, [&] { return answer->done; })) {
        call.check();
        if (std::chrono::steady_clock::now() > limit)
            throw Poco::TimeoutException();
    }
    if (!answer->address)
        std::rethrow_exception(answer->failure);
    return *answer->address;
}

LineSocket::LineSocket(const SocketAddress& address, const LineCall& call)
    : socket(address.family())
    , watch(call.line(), socket) {
    call.check();
    try {
        socket.connect(address, call.limits().connect);
    } catch (const Poco::Exception&) {
        call.check();
        throw;
    }
    call.check();
    socket.setReceiveTimeout(call.limits().silence);
    socket.setSendTimeout(call.limits().silence);
}

void LineSocket::encrypt(const std::string& host, const LineCall& call, const TlsSession& resumed) {
    call.check();
    socket = EncryptedSocket(socket, HostWithoutPort(host), call.trust(),
                             std::min(call.limits().connect, call.limits().silence), resumed);
    call.check();
}

void LineSocket::close() {
    watch.release();
    socket.close();
}

} // namespace lumora
