#pragma once

#include <Poco/Exception.h>
#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>

#include <QtGlobal>

#include <atomic>
#include <functional>
#include <thread>

namespace lumora {

// A server on a free port of 127.0.0.1 that talks to its clients, one after the other, as a script says.
class ScriptedServer {
public:
    explicit ScriptedServer(std::function<void(Poco::Net::StreamSocket&)> script)
        : m_script(std::move(script))
        , m_thread([this] { serve(); }) {}
    ~ScriptedServer() {
        m_stop = true;
        m_thread.join();
    }
    quint16 port() const { return m_listening.address().port(); }

private:
    void serve() {
        while (!m_stop) {
            try {
                if (!m_listening.poll(Poco::Timespan(0, 20'000), Poco::Net::Socket::SELECT_READ))
                    continue;
                Poco::Net::StreamSocket client = m_listening.acceptConnection();
                m_script(client);
            } catch (const Poco::Exception&) {
                // The client has gone, with bytes of the script unread.
            }
        }
    }

    Poco::Net::ServerSocket m_listening{Poco::Net::SocketAddress("127.0.0.1", 0)};
    std::function<void(Poco::Net::StreamSocket&)> m_script;
    std::atomic<bool> m_stop = false;
    std::thread m_thread;
};

} // namespace lumora
