#pragma once

#include "common/Result.h"

#include <QString>

namespace lumora {

struct SessionState;

// The step of the transfer that failed. File: a file of the order can't be read or its name can't be sent. Confirm: the
// connection held, but the server's list does not confirm that all files arrived. KeepList: the server's list could not
// be written on this machine. KeepState: how far the sending has come could not be, and so it has ended. PrintCut: a
// print has another length than it was prepared with. ServerChanges: the server stores other bytes than were sent.
// ForeignFolder: the server has another order under this one's name, and nothing of this one was sent. FolderLost: it
// has come since. Silence: the line stood still or went too slowly for too long.
enum class LineStep {
    Open,
    Connect,
    OrderFolder,
    File,
    Put,
    List,
    Confirm,
    KeepList,
    KeepState,
    PrintCut,
    ServerChanges,
    ForeignFolder,
    FolderLost,
    Silence
};

// What a failure of the transfer means for the customer. subject is the file's name, if the step is about a file.
QString LineTroubleText(const SessionState& state, LineStep step, const Failure& failure, const QString& subject = {});

// The error number shown for a failure of the transfer; 12003: the server itself refused.
int LineErrorNumber(Failure::Kind kind);

} // namespace lumora
