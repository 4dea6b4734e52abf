#pragma once

#include "platform/line/Mail.h"

#include <QString>

namespace lumora {

// The result of a mail step in words for the customer. code is one of the simple mail interface, 0 for success; a code
// without a meaning of its own gives the last text, and a few give none.
QString MailResultText(int code, bool english);

// The code for the end of an exchange; docs/formats.md has the table, from the server's reply onwards.
int MailResultCode(MailEnd end);

} // namespace lumora
