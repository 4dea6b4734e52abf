#include "order/HistoryState.h"

#include "order/FinishedOrder.h"
#include "order/OrderJournal.h"
#include "order/OrderNames.h"
#include "platform/files/Files.h"
#include "session/Workspace.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

Completion CompletionOf(const Files& files, const OrderFolder& folder) {
    if (const Result<OrderState> order = ReadOrderState(files, folder))
        return order->phase == OrderState::Phase::Preparing ? Completion::CanGoOn : Completion::Finished;
    // The pieces of an order have no state and need no log of their own.
    if (!FinishedOrderOf(folder.name()) || TravelsInPieces(folder.name()) || !files.folderExists(folder.path()) ||
        files.fileExists(folder.logPath()))
        return Completion::Finished;
    return Completion::OnlyFiles;
}

HistoryState HistoryState::of(const SessionState& state, const Files& files) {
    const DrivePath orders = WorkspacePaths::orders(state);
    HistoryState history;
    for (const QString& name : files.folders(orders)) {
        const OrderFolder folder(orders / name);
        const QStringList prints = files.names(folder.path(), u"*.jpp"_s);
        if (std::all_of(prints.begin(), prints.end(), IsSheet))
            continue;
        const Result<OrderState> order = ReadOrderState(files, folder);
        if (order && order->phase >= OrderState::Phase::Arrived)
            continue;
        if (order && order->way == OrderState::Way::Station)
            history.station += folder;
        else if (order && order->way == OrderState::Way::Mail)
            history.mail += folder;
        else
            history.notProven += folder;
        if (!order && order.failure().kind == Failure::Kind::NotFound && files.fileExists(folder.logPath()))
            history.legacy += folder;
    }
    return history;
}

bool HistoryState::contains(const DrivePath& folder) const {
    const QList<OrderFolder> orders = notProven + station + mail;
    return std::any_of(orders.begin(), orders.end(), [&](const OrderFolder& order) { return order.path() == folder; });
}

bool HistoryState::areGuarded(const SessionState& state) const {
    return state.Careful && count() > 0;
}

Result<void> HistoryState::markLegacyArrived(const Files& files) const {
    for (const OrderFolder& folder : legacy) {
        OrderJournal journal(files, folder);
        journal.markSentAgain();
        if (Result<void> marked = journal.needsNoReport(); !marked)
            return marked;
    }
    return {};
}

} // namespace lumora
