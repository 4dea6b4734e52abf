#pragma once

#include "platform/line/Mail.h"

#include <QString>

namespace lumora {

// What the customer reads after a mail step. code is one of the simple mail interface, 0 for success; an unknown code
// gives the last text of the table, and a few codes give an empty text.
QString MailResultText(int code, bool english);

// The code for the end of an SMTP exchange; docs/formats.md has the table by the server's reply.
int MailResultCode(MailEnd end);

} // namespace lumora
