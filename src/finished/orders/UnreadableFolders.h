#pragma once

#include <QStringList>

namespace lumora {

class Dialogs;
struct SessionState;

// Says which folders could not be read, one line each with its reason, as Files::collect gives them; nothing for none.
void TellUnreadableFolders(const SessionState& state, Dialogs& dialogs, const QStringList& unreadable);

} // namespace lumora
