#include "transfer/http/HttpFolderOwner.h"

#include "order/OrderJournal.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "transfer/http/ServerList.h"

#include <algorithm>

namespace lumora {

bool HttpFolderOwner::claims() const {
    return m_state.Careful;
}

HttpFolderOwner::Owner HttpFolderOwner::of(const OrderJournal& order, const ServerAnswer& answer,
                                           const QString& uploads) const {
    if (!m_state.Careful || order.ownsFolder(Sender::Http))
        return Owner::Ours;
    if (!answer.files)
        return Owner::NotKnown;
    if (answer.files->isEmpty())
        return Owner::Ours;
    const QString log = order.folder().logPath().leaf();
    const auto found = std::find_if(answer.files->begin(), answer.files->end(),
                                    [&](const QString& name) { return name.compare(log, Qt::CaseInsensitive) == 0; });
    const Result<QByteArray> ours = m_platform.files.read(order.folder().logPath());
    if (found == answer.files->end() || !ours)
        return Owner::Foreign;
    const Result<WebAnswer> theirs = m_platform.internet.fetch(uploads + NameInAddress(*found));
    if (!theirs || !theirs->good())
        return Owner::NotKnown;
    return theirs->body == *ours ? Owner::Ours : Owner::Foreign;
}

} // namespace lumora
