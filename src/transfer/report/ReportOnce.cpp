#include "transfer/report/ReportOnce.h"

#include "order/OrderDetailsReader.h"
#include "order/OrderJournal.h"
#include "order/OrderReport.h"
#include "transfer/delivery/Attempts.h"

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
    if (!order.hasArrived() || m_state.transfer.SugMishloah == Sending::Chain)
        return Told::NotWanted;
    return std::nullopt;
}

ReportOnce::Told ReportOnce::tell(Sender by, ReportCalls& calls) {
    m_kept = {};
    if (const std::optional<Told> before = toldOrUnwanted())
        return *before;
    if (isWanted(by))
        return request(calls);
    if (m_journal.state().hasArrived())
        keep(m_journal.needsNoReport());
    return Told::NotWanted;
}

bool ReportOnce::isDue(Sender by) const {
    return m_state.Careful && !toldOrUnwanted() && isWanted(by);
}

bool ReportOnce::isDueWhereFound(Sender by) const {
    return isDue(by) && !m_journal.state().sentBefore;
}

void ReportOnce::endsUntold(Sender by) {
    m_kept = {};
    if (!m_state.Careful || !isWanted(by))
        keep(m_journal.needsNoReport());
}

ReportOnce::Told ReportOnce::tellAgain(ReportCalls& calls) {
    m_kept = {};
    return request(calls);
}

ReportOnce::Told ReportOnce::request(ReportCalls& calls) {
    if (isStopped())
        return Told::Cut;
    const bool ofAnArrival = m_journal.state().hasArrived() || m_journal.state().report != Report::NotYet;
    if (ofAnArrival && !keep(m_journal.reportBegun()) && m_state.Careful)
        return Told::NotKept;
    if (!makeCalls(calls))
        return Told::Cut;
    if (ofAnArrival)
        keep(m_journal.reportDone());
    return Told::Now;
}

bool ReportOnce::isStopped() const {
    return m_stop.StopFlag || m_stop.left;
}

// False where the last call may not have come through, or was not made at all.
bool ReportOnce::makeCalls(ReportCalls& calls) const {
    const ReportForm form = m_state.Careful ? ReportForm::Encoded : ReportForm::AsItStands;
    const QString order = OrderReportQuery(m_state.profile, m_state.transfer, details(), form);
    if (!isStopped())
        calls.announceReport();
    const bool heard = !isStopped() && calls.reportOrder(order);
    const bool done = !isStopped() && calls.reportDone(DoneQuery(m_state.profile, m_state.transfer, form));
    return !isStopped() && ((heard && done) || !m_state.Careful);
}

OrderDetails ReportOnce::details() const {
    OrderDetails details = m_state.shemot;
    if (m_state.Careful && m_state.transfer.SugMishloah == Sending::Resend)
        ReadReportDetails(m_files, m_journal.folder().logPath(), details);
    return details;
}

} // namespace lumora
