#include "platform/line/SmtpReply.h"

#include <QRegularExpression>

#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The middle and the last number of "5.3.4" behind the code of the reply; the first one is the first digit of the code.
struct EnhancedStatus {
    int subject = 0;
    int detail = 0;
};

EnhancedStatus enhancedStatus(const QByteArray& text) {
    static const QRegularExpression form(u"\\b[245][0-9]{2}[ -][245]\\.([0-9]{1,3})\\.([0-9]{1,3})(?:\\s|$)"_s);
    const auto match = form.match(QString::fromLatin1(text));
    return {match.captured(1).toInt(), match.captured(2).toInt()};
}

std::optional<MailEnd> endOf(EnhancedStatus status, bool forGood) {
    const int number = status.subject * 1000 + status.detail;
    switch (number) {
    case 2'002: // mailbox full
    case 3'001: // mail system full
        return MailEnd::ServerFull;
    case 2'003: // longer than the administration of the mailbox allows
    case 3'004: // too big for the system
        return MailEnd::TooLarge;
    default:
        // Subject 7 is security or policy (RFC 3463). A server that greylists an unknown client uses it too, as 4.7.x.
        if (status.subject == 7 && forGood)
            return MailEnd::AccessRefused;
        return std::nullopt;
    }
}

} // namespace

MailEnd EndOfRefusal(SmtpStep step, int code, const QByteArray& text) {
    const bool forGood = code >= 500;
    if (const auto end = endOf(enhancedStatus(text), forGood))
        return *end;
    if (code == 452)
        return MailEnd::ServerFull;
    if (code == 552)
        return MailEnd::TooLarge;
    if (code >= 400 && !forGood)
        return MailEnd::ServerBusy;
    if (code == 530 || step == SmtpStep::Login)
        return MailEnd::AccessRefused;
    return step == SmtpStep::Recipient ? MailEnd::RecipientRefused : MailEnd::Refused;
}

} // namespace lumora
