#pragma once

#include "platform/line/Mail.h"
#include "support/LabServers.h"

#include <QByteArray>

namespace lumora {

using namespace Qt::StringLiterals;

// A real mail server (exim) on free ports of 127.0.0.1, ended with this object. It serves the lab's one mailbox to
// those who log in. A test asserts running() and so fails, and never skips, where it could not start.
class MailServer {
public:
    MailServer();
    ~MailServer();
    MailServer(const MailServer&) = delete;
    MailServer& operator=(const MailServer&) = delete;

    bool running() const { return m_failure.isEmpty(); }
    QString failure() const { return m_failure; }

    // An account that the server takes, to the lab's mailbox.
    MailAccount account(MailEncryption encryption = MailEncryption::None) const;
    // Whole messages above this many bytes are refused.
    static constexpr int largestMessage = 6 * 1024 * 1024;
    // The authority that has signed the server's certificate, which names 127.0.0.1 and nothing else.
    QString authority() const { return m_folder.filePath(u"authority.pem"_s); }

    // The messages in the mailbox, one behind the other, with all that the server has taken so far.
    QByteArray mailbox() const;
    // What the server noted about who called and what it refused.
    QByteArray log() const;

private:
    QTemporaryDir m_folder;
    QProcess m_server;
    QString m_failure;
    quint16 m_port = 0;
    quint16 m_tlsPort = 0;
};

} // namespace lumora
