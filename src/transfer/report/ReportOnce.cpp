#include "transfer/report/ReportOnce.h"

#include "order/OrderDetailsReader.h"
#include "order/OrderJournal.h"
#include "order/OrderReport.h"

namespace lumora {

using Report = OrderState::Report;
using Phase = OrderState::Phase;

bool ReportOnce::isWanted(Sender by) const {
    const Sending sending = m_state.transfer.SugMishloah;
    if (by == Sender::Ftp)
        return m_state.profile.ReportOn > 0;
    return sending == Sending::NewOrder || (m_state.Careful && sending == Sending::Resend);
}

bool ReportOnce::keep(const Result<void>& written) {
    if (m_kept)
        m_kept = written;
    return written.ok();
}

std::optional<ReportOnce::Told> ReportOnce::toldOrUnwanted() const {
    const OrderState& order = m_journal.state();
    if (!m_state.Careful)
        return std::nullopt;
    if (order.phase == Phase::Reported || order.report == Report::Done)
        return Told::Before;
    if (order.report == Report::Begun)
        return Told::NotKnown;
    if (order.phase < Phase::Arrived || m_state.transfer.SugMishloah == Sending::Chain)
        return Told::NotWanted;
    return std::nullopt;
}

ReportOnce::Told ReportOnce::tell(Sender by, ReportCalls& calls) {
    m_kept = {};
    if (const std::optional<Told> before = toldOrUnwanted())
        return *before;
    if (!isWanted(by)) {
        keep(m_journal.needsNoReport());
        return Told::NotWanted;
    }
    return request(calls);
}

bool ReportOnce::isDueWhereFound(Sender by) {
    m_kept = {};
    if (m_state.Careful)
        return !toldOrUnwanted() && isWanted(by);
    keep(m_journal.needsNoReport());
    return false;
}

ReportOnce::Told ReportOnce::tellAgain(ReportCalls& calls) {
    m_kept = {};
    return request(calls);
}

ReportOnce::Told ReportOnce::request(ReportCalls& calls) {
    if (!keep(m_journal.reportBegun()) && m_state.Careful)
        return Told::NotKept;
    calls.reportOrder(orderQuery());
    calls.reportDone(
        DoneQuery(m_state.profile, m_state.transfer, m_state.Careful ? ReportForm::Encoded : ReportForm::AsItStands));
    keep(m_journal.reportDone());
    return Told::Now;
}

QString ReportOnce::orderQuery() const {
    if (!m_state.Careful)
        return OrderReportQuery(m_state.profile, m_state.transfer, m_state.shemot);
    OrderDetails details = m_state.shemot;
    if (m_state.transfer.SugMishloah == Sending::Resend)
        ReadReportDetails(m_files, m_journal.folder().logPath(), details);
    return OrderReportQuery(m_state.profile, m_state.transfer, details, ReportForm::Encoded);
}

} // namespace lumora
