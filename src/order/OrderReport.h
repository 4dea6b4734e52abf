#pragma once

#include <QString>

namespace lumora {

struct ClientProfile;
struct OrderDetails;
struct TransferState;

// The query of the order report, behind the address of the report script: who ordered what. Values go as they stand,
// unescaped; the lab's script takes the raw bytes of the ANSI code page. Empty unless the order is new or sent again.
QString OrderReportQuery(const ClientProfile& profile, const TransferState& transfer, const OrderDetails& shemot);

// The query of the done call. Empty likewise.
QString DoneQuery(const ClientProfile& profile, const TransferState& transfer);

// The letter of the paper kind: "M" matte, "G" glossy, empty for another word. Letter case does not count.
QString PaperKindLetter(const QString& maat);

} // namespace lumora
