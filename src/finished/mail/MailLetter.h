#pragma once

#include <QString>

namespace lumora {

struct OrderDetails;
struct SessionState;

// The text of the message for one mail package: whose order it is, what is to be printed, which file and package this
// is. A detail that the order's log lacks has no line.
QString MailLetter(const SessionState& state, const OrderDetails& details, const QString& fileName,
                   const QString& package);

} // namespace lumora
