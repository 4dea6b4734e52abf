#include "finished/orders/UnreadableFolders.h"

#include "platform/Dialogs.h"
#include "session/SessionState.h"

namespace lumora {

void TellUnreadableFolders(const SessionState& state, Dialogs& dialogs, const QStringList& unreadable) {
    if (!unreadable.isEmpty())
        dialogs.message(
            state.wording(QStringLiteral("אין אפשרות לקרוא תיקייה זו:"), QStringLiteral("This folder can't be read:")) +
            u'\n' + unreadable.join(u'\n'));
}

} // namespace lumora
