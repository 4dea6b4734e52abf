#pragma once

#include <QString>

namespace lumora {

class OrderJournal;
struct Platform;
struct ServerAnswer;
struct SessionState;

// Whose order the folder on the web server is that bears an order's name: two data folders with one serial make one
// name. As built in, whatever is there counts as the order's own.
class HttpFolderOwner {
public:
    enum class Owner {
        Ours,     // posted into by this order, or not there, or without a file, or with this order's log in it
        Foreign,  // the log there differs by a byte at least, or there is none
        NotKnown, // the list could not be read, the log was not given out, or the line was cut
    };

    HttpFolderOwner(const SessionState& state, const Platform& platform)
        : m_state(state)
        , m_platform(platform) {}

    // answer: of the server about the order's folder. uploads: the folder's address, with its last slash.
    Owner of(const OrderJournal& order, const ServerAnswer& answer, const QString& uploads) const;
    // True where a first post makes the folder known as the order's own; as built in never.
    bool claims() const;

private:
    const SessionState& m_state;
    const Platform& m_platform;
};

} // namespace lumora
