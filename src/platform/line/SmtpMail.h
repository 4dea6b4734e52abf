#pragma once

#include "platform/line/Mail.h"
#include "platform/line/TimeLimits.h"

namespace lumora {

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
