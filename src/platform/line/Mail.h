#pragma once

#include "platform/files/HostPath.h"

#include <QString>

namespace lumora {

enum class MailEncryption {
    None,
    StartTls, // the exchange begins in the open and goes on encrypted, or ends
    Tls,      // encrypted from the first byte
};

// Through which server, as whom and to whom messages go.
struct MailAccount {
    QString host;
    quint16 port = 0; // 0: the usual one of the encryption, 25, 587 or 465
    QString user;     // empty: no login
    QString password;
    MailEncryption encryption = MailEncryption::StartTls;
    QString from; // bare addresses, as in orders@lab.example
    QString to;

    // Without a server there is no mail step.
    bool setUp() const { return !host.isEmpty(); }
    bool operator==(const MailAccount&) const = default;
};

// One message with one file.
struct MailMessage {
    QString subject;
    QString body;
    HostPath attachment;
};

// How an exchange ended.
enum class MailEnd {
    Sent,
    AttachmentMissing,
    AttachmentUnreadable,
    NoMemory,
    NoContact,     // no server, a silent one, one that left in the middle, or none that is proved to be the right one
    AccessRefused, // the login, or what this account may do
    RecipientRefused,
    TooLarge,
    ServerFull,
    ServerBusy,
    Refused, // any other no of the server
};

struct MailOutcome {
    MailEnd end = MailEnd::Sent;
    // For a log: what the server said, or what the machine did. Never a password.
    QString words;
};

class Mail {
public:
    virtual ~Mail() = default;

    // Blocks until the server has taken or refused the message; meanwhile the page may repaint but takes no clicks.
    // Time limits: 30 s to connect, 60 s without a byte or a reply. The attachment is only read.
    virtual MailOutcome send(const MailAccount& account, const MailMessage& message) = 0;
};

} // namespace lumora
