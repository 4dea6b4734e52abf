#include "transfer/report/InetForm.h"

#include "common/AnsiCodePage.h"
#include "order/OrderReport.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

InetForm::InetForm(const SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::InetForm)
    , m_state(state)
    , m_platform(platform) {
    Q_UNUSED(chain);
}

std::optional<QString> InetForm::answerOf(const QString& url) {
    if (!m_platform.internet.open())
        m_platform.dialogs.message(m_state.wording(u"אין תקשורת"_s, u"No communication"_s));
    const auto answer = m_platform.internet.fetch(url);
    return answer ? std::optional(AnsiCodePage::decode(answer->body)) : std::nullopt;
}

QString InetForm::FetchUrlSmall(const QString& url) {
    return answerOf(url).value_or(QString());
}

// A lab without such an address wants no such call.
bool InetForm::call(const QString& address, const QString& query) {
    const std::optional<QString> answer = answerOf(address + query);
    TeshuvatSharat = answer.value_or(QString());
    Q_EMIT changed();
    return answer || address.isEmpty();
}

void InetForm::report() {
    announceReport();
    reportOrder(OrderReportQuery(m_state.profile, m_state.transfer, m_state.shemot));
}

QString InetForm::doneQuery() const {
    return DoneQuery(m_state.profile, m_state.transfer);
}

// The lab's site expects a call of this address before each report.
void InetForm::announceReport() {
    m_platform.pump.pump();
    TeshuvatSharat = FetchUrlSmall(m_state.profile.ReportUrl + u"c.txt"_s);
}

bool InetForm::reportOrder(const QString& query) {
    return call(m_state.profile.ReportUrl, query);
}

bool InetForm::reportDone(const QString& query) {
    return call(m_state.profile.DoneUrl, query);
}

bool clsDownload::download(const QString& url, const DrivePath& path) {
    m_failure = {};
    const auto target = m_platform.files.host(path);
    if (!target) {
        m_failure = target.failure();
        return false;
    }
    (void)m_platform.internet.open();
    if (const auto done = m_platform.internet.download(url, *target); !done)
        m_failure = done.failure();
    return true;
}

} // namespace lumora
