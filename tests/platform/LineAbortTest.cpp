#include "platform/line/LineAbort.h"

#include <Poco/Net/NetException.h>
#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace lumora {
namespace {

// A server that reads the end of the data takes what came for the whole file.
TEST(LineAbort, TheServerSeesAResetAndNoEndOfData) {
    LineAbort line;
    Poco::Net::ServerSocket listening(Poco::Net::SocketAddress("127.0.0.1", 0));
    Poco::Net::StreamSocket client(listening.address());
    Poco::Net::StreamSocket server = listening.acceptConnection();
    server.setReceiveTimeout(Poco::Timespan(30, 0));
    const LineAbort::Watch watch(line, client);
    const std::string part(4000, 'x');
    client.sendBytes(part.data(), static_cast<int>(part.size()));

    line.abort();

    std::array<char, 8192> bytes{};
    EXPECT_THROW(
        {
            while (server.receiveBytes(bytes.data(), int(bytes.size())) > 0) {
            }
        },
        Poco::Net::ConnectionResetException);
    EXPECT_ANY_THROW(client.sendBytes(part.data(), static_cast<int>(part.size())));
}

} // namespace
} // namespace lumora
