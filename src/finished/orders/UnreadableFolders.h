#pragma once

#include <QStringList>

namespace lumora {

class Dialogs;
struct SessionState;

// Shows one box with a line for each folder that Files::collect could not read; none for an empty list.
void TellUnreadableFolders(const SessionState& state, Dialogs& dialogs, const QStringList& unreadable);

} // namespace lumora
