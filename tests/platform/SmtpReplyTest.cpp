#include "platform/line/SmtpReply.h"

#include <gtest/gtest.h>

#include <tuple>

namespace lumora {
namespace {

TEST(SmtpReplyTest, TheEnhancedStatusDecidesAndElseTheCodeAndTheStep) {
    const std::tuple<SmtpStep, const char*, MailEnd> cases[] = {
        {SmtpStep::Greeting, "421 4.3.2 closing", MailEnd::ServerBusy},
        {SmtpStep::Greeting, "554 no mail here", MailEnd::Refused},
        {SmtpStep::Login, "535 5.7.8 no", MailEnd::AccessRefused},
        {SmtpStep::Login, "504 no such way", MailEnd::AccessRefused},
        {SmtpStep::Login, "454 4.7.0 later", MailEnd::ServerBusy},
        {SmtpStep::Sender, "530 log in first", MailEnd::AccessRefused},
        {SmtpStep::Sender, "553 not yours", MailEnd::Refused},
        {SmtpStep::Sender, "452 no room", MailEnd::ServerFull},
        {SmtpStep::Sender, "552 too large", MailEnd::TooLarge},
        {SmtpStep::Sender, "552 5.3.4 too large", MailEnd::TooLarge},
        {SmtpStep::Recipient, "550 5.1.1 unknown", MailEnd::RecipientRefused},
        {SmtpStep::Recipient, "501 5.1.3 malformed", MailEnd::RecipientRefused},
        {SmtpStep::Recipient, "552 5.2.2 mailbox full", MailEnd::ServerFull},
        {SmtpStep::Recipient, "450 4.7.1 greylisted", MailEnd::ServerBusy},
        {SmtpStep::Recipient, "550 5.7.1 relaying denied", MailEnd::AccessRefused},
        {SmtpStep::Text, "431 4.3.1 system full", MailEnd::ServerFull},
        {SmtpStep::Text, "550-5.2.3 first line\n550 5.2.3 too long", MailEnd::TooLarge},
        {SmtpStep::Text, "554 5.6.0 no virus, please", MailEnd::Refused},
        {SmtpStep::Text, "554 version 5.3.4.1 says no", MailEnd::Refused},
    };
    for (const auto& [step, reply, end] : cases)
        EXPECT_EQ(EndOfRefusal(step, QByteArray(reply).left(3).toInt(), reply), end) << reply;
}

} // namespace
} // namespace lumora
