#pragma once

#include "platform/line/Mail.h"

#include <QByteArray>

#include <string>

namespace lumora {

// The message as it goes over the wire, lines ended by CR LF, nothing but ASCII in it: RFC 5322 with two parts of
// MIME, the body as text and the file, both in base64. A subject that is no plain ASCII goes in encoded words
// (RFC 2047), such a file name as an extended parameter (RFC 2231).
std::string MailText(const MailAccount& account, const MailMessage& message, const QByteArray& attachment);

} // namespace lumora
