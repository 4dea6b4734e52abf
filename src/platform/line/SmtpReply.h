#pragma once

#include "platform/line/Mail.h"

#include <QByteArray>

namespace lumora {

// What the client had asked for.
enum class SmtpStep { Greeting, Login, Sender, Recipient, Text };

// What a reply that is no consent means. text is the reply as the server wrote it; where it names an enhanced status
// code (RFC 3463), that one decides over the code of three digits. docs/formats.md has the table.
MailEnd EndOfRefusal(SmtpStep step, int code, const QByteArray& text);

} // namespace lumora
