#pragma once

#include <QString>

namespace lumora {

struct ClientProfile;
struct OrderDetails;
struct TransferState;

enum class ReportForm {
    AsItStands, // the lab's script takes the raw bytes of the ANSI code page
    Encoded,    // "%", "&", "#" and "+" inside a value are percent-encoded, so that none of them cuts it
};

// The query of the order report, appended to the address of the report script. Empty unless the order is new or sent
// again.
QString OrderReportQuery(const ClientProfile& profile, const TransferState& transfer, const OrderDetails& shemot,
                         ReportForm form = ReportForm::AsItStands);

// The query of the done call; empty in the same cases.
QString DoneQuery(const ClientProfile& profile, const TransferState& transfer,
                  ReportForm form = ReportForm::AsItStands);

// "M" for a word for matte paper, "G" for glossy, empty for any other word. Letter case does not count.
QString PaperKindLetter(const QString& maat);

} // namespace lumora
