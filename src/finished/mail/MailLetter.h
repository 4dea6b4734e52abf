#pragma once

#include <QString>

namespace lumora {

struct OrderDetails;
struct SessionState;

// The words that go along with one file of an order by mail, in the language of the page: whose order it is, what is to
// be printed, and which file and package this is. A line for each detail that the order's text gives.
QString MailLetter(const SessionState& state, const OrderDetails& details, const QString& fileName,
                   const QString& package);

} // namespace lumora
