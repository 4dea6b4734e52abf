#pragma once

#include "platform/line/Mail.h"
#include "platform/line/TimeLimits.h"

namespace lumora {

// The account's port, or the usual one of its encryption: 25, 587 or 465.
quint16 SmtpPort(const MailAccount& account);

// Sends over SMTP. Encryption takes a certificate that one of this machine's authorities has signed for the server's
// name; without it nothing is sent, least of all a password.
class SmtpMail : public Mail {
public:
    explicit SmtpMail(TimeLimits limits = {})
        : m_limits(limits) {}

    MailOutcome send(const MailAccount& account, const MailMessage& message) override;

private:
    TimeLimits m_limits;
};

} // namespace lumora
