#include "finished/orders/UnreadableFolders.h"

#include "platform/Dialogs.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

void TellUnreadableFolders(const SessionState& state, Dialogs& dialogs, const QStringList& unreadable) {
    if (!unreadable.isEmpty())
        dialogs.message(state.wording(u"אין אפשרות לקרוא תיקייה זו:"_s, u"This folder can't be read:"_s) + u'\n' +
                        unreadable.join(u'\n'));
}

} // namespace lumora
