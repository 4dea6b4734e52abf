#pragma once

#include <QString>

namespace lumora {

struct ClientProfile;
struct OrderDetails;
struct TransferState;

// The query of the order report, appended to the address of the report script. Values are not escaped: the lab's script
// takes the raw bytes of the ANSI code page. Empty unless the order is new or sent again.
QString OrderReportQuery(const ClientProfile& profile, const TransferState& transfer, const OrderDetails& shemot);

// The query of the done call; empty in the same cases.
QString DoneQuery(const ClientProfile& profile, const TransferState& transfer);

// "M" for a word for matte paper, "G" for glossy, empty for any other word. Letter case does not count.
QString PaperKindLetter(const QString& maat);

} // namespace lumora
