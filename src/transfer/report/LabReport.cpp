#include "transfer/report/LabReport.h"

#include "order/OrderJournal.h"
#include "platform/Platform.h"
#include "platform/line/Internet.h"
#include "transfer/delivery/Attempts.h"
#include "transfer/delivery/StoppableLine.h"
#include "transfer/report/ReportOnce.h"

#include <utility>

namespace lumora {

using Phase = OrderState::Phase;
using Report = OrderState::Report;

namespace {

constexpr int longestTelling = 120; // seconds

} // namespace

LabReport::LabReport(const SessionState& state, const Platform& platform, SendingStop& stop, Sender by, Keep keep)
    : m_state(state)
    , m_platform(platform)
    , m_stop(stop)
    , m_by(by)
    , m_keep(std::move(keep)) {}

void LabReport::keepArrival(Arrival arrival, SendingPhase end, bool byNameOnly) {
    if (!m_order || !hasArrived(end))
        return;
    if (arrival == Arrival::Part)
        return;
    if (m_state.kiosk.on && m_state.Careful && arrival == Arrival::Whole && !byNameOnly)
        m_order->markProven();
    m_keep(arrival == Arrival::Agreed ? m_order->arrivedAsAgreed() : m_order->arrived(byNameOnly));
    if (end == SendingPhase::AllThere)
        endUntold();
}

void LabReport::endUntold() {
    if (!m_order)
        return;
    ReportOnce reports(m_state, m_platform.files, *m_order, m_stop);
    reports.endsUntold(m_by);
    m_keep(reports.kept());
}

bool LabReport::isDueWhereFound() const {
    return m_order && ReportOnce(m_state, m_platform.files, *m_order, m_stop).isDueWhereFound(m_by);
}

bool LabReport::isAsAgreed() const {
    return m_order && m_order->state().fewerAgreed;
}

bool LabReport::isDueAsAgreed() const {
    return isAsAgreed() && ReportOnce(m_state, m_platform.files, *m_order, m_stop).isDue(m_by);
}

SendingPhase LabReport::endWhereLeft() const {
    return isAsAgreed() && m_state.Careful ? SendingPhase::AllThere : SendingPhase::Success;
}

void LabReport::tell(ReportCalls& calls) {
    run([&](ReportOnce& reports) { reports.tell(m_by, calls); });
}

void LabReport::tellAgain(ReportCalls& calls) {
    m_stop.StopFlag = false;
    run([&](ReportOnce& reports) { reports.tellAgain(calls); });
}

void LabReport::run(const std::function<void(ReportOnce&)>& telling) {
    if (!m_order || m_seconds)
        return;
    m_seconds = 0;
    ReportOnce reports(m_state, m_platform.files, *m_order, m_stop);
    {
        const StoppableLine line(m_platform);
        telling(reports);
    }
    m_keep(reports.kept());
    m_seconds.reset();
    m_stop.StopFlag = false;
}

void LabReport::watch() {
    if (!m_seconds || ++*m_seconds < longestTelling)
        return;
    m_stop.StopFlag = true;
    m_platform.internet.abort();
}

bool LabReport::mayTellAgain() const {
    if (!m_order)
        return false;
    const OrderState& order = m_order->state();
    return order.report != Report::NotYet || order.onlyReportIsLeft();
}

bool LabReport::wasTold() const {
    return m_order && m_order->state().report == Report::Done;
}

bool LabReport::isUnwanted() const {
    return m_order && m_order->state().phase == Phase::Reported && m_order->state().report == Report::NotYet;
}

bool LabReport::isEndUnknown() const {
    return m_order && m_order->state().report == Report::Begun;
}

bool LabReport::provenByNameOnly() const {
    return m_state.Careful && m_order && m_order->state().phase >= Phase::Arrived && m_order->state().provenByNameOnly;
}

} // namespace lumora
