#include "kiosk/OrderKeeping.h"

#include "common/FirstFailure.h"
#include "common/ListOutput.h"
#include "order/FinishedOrder.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/OrderState.h"
#include "platform/Instances.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

const QString livedKey = u"Lived"_s;
const QString reachedKey = u"Reached"_s;
const QString doubtedKey = u"Doubted"_s;
const QString doubtsKey = u"Doubts"_s;

} // namespace

OrderKeeping::OrderKeeping(const SessionState& state, const Platform& platform)
    : m_state(state)
    , m_platform(platform) {}

DrivePath OrderKeeping::path() const {
    return WorkspacePaths::counter(m_state).folder() / u"keeping.txt";
}

void OrderKeeping::read() {
    m_days = {};
    m_arrived.clear();
    const Result<QByteArray> bytes = m_platform.files.read(path());
    if (!bytes)
        return;
    for (const auto& [key, value] : ReadListOutput(*bytes)) {
        if (key == livedKey)
            m_days.lived = std::max(value.toInt(), 0);
        else if (key == reachedKey)
            m_days.reached = QDate::fromString(value, Qt::ISODate);
        else if (key == doubtedKey)
            m_days.doubted = QDate::fromString(value, Qt::ISODate);
        else if (key == doubtsKey)
            m_days.doubts = std::clamp(value.toInt(), 0, KioskDays::daysUntilBelieved - 1);
        else
            m_arrived[key] = value.toInt();
    }
    // What was written by nobody must not age an order.
    for (int& day : m_arrived)
        day = day < 0 || day > m_days.lived ? m_days.lived : day;
}

Result<void> OrderKeeping::write() const {
    ListOutput output;
    output.text(livedKey).number(m_days.lived).endLine();
    output.pair(reachedKey, m_days.reached.toString(Qt::ISODate));
    if (m_days.doubted.isValid()) {
        output.pair(doubtedKey, m_days.doubted.toString(Qt::ISODate));
        output.text(doubtsKey).number(m_days.doubts).endLine();
    }
    for (auto order = m_arrived.cbegin(); order != m_arrived.cend(); ++order)
        output.text(order.key()).number(order.value()).endLine();
    if (const Result<void> made = m_platform.files.makeFolder(path().folder()); !made)
        return made;
    return m_platform.files.writeWhole(path(), output.bytes());
}

// An order of which the lab was not told yet is still to be told of.
bool OrderKeeping::mayGo(const OrderState& order) const {
    return order.proven && order.phase >= OrderState::Phase::Arrived && !order.onlyReportIsLeft() &&
           order.filesInHand.isEmpty();
}

Result<void> OrderKeeping::removePrints(const OrderFolder& folder) const {
    for (const QString& name : m_platform.files.names(folder.path(), u"*.jpp;*.prk"_s)) {
        if (IsSheet(name))
            continue;
        if (Result<void> removed = m_platform.files.removeFile(folder.filePath(name)); !removed)
            return removed;
    }
    return {};
}

Result<void> OrderKeeping::look() {
    if (!m_state.kiosk.on || m_platform.instances.another())
        return {};
    const QDate today = m_platform.clock.now().date();
    if (std::exchange(m_lookedAt, today) == today)
        return {};
    read();
    const bool believed = m_days.see(today);
    const Files& files = m_platform.files;
    const DrivePath orders = WorkspacePaths::orders(m_state);
    const int keepPrints = m_state.kiosk.keepDays;
    const int keepFolder = std::max(m_state.kiosk.keepLogDays, keepPrints);
    QMap<QString, int> arrived;
    FirstFailure steps;
    for (const QString& name : files.folders(orders)) {
        const OrderFolder folder(orders / name);
        const Result<OrderState> order = ReadOrderState(files, folder);
        if (!order || !FinishedOrderOf(name) || !mayGo(*order))
            continue;
        const int since = m_arrived.value(name, m_days.lived);
        arrived[name] = since;
        const int days = believed && m_state.Careful ? m_days.lived - since : 0;
        if (days >= keepFolder)
            steps.note(files.removeTree(folder.path()));
        else if (days >= keepPrints)
            steps.note(removePrints(folder));
    }
    m_arrived = arrived;
    steps.note(write());
    return steps.outcome();
}

} // namespace lumora
