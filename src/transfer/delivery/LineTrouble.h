#pragma once

#include "common/Result.h"

#include <QString>

namespace lumora {

struct SessionState;

// Which step of the transfer failed.
// File: a file of the order can't be read or named, so that it never came to the line. Confirm: the line held, and yet
// the server's list does not say that all has arrived. KeepList: that list could not be stored on this machine.
enum class LineStep { Open, Connect, OrderFolder, File, Put, List, Confirm, KeepList };

// What a failure of the line means for the customer, in the language of the session. subject is the file's name where a
// file is concerned.
QString LineTroubleText(const SessionState& state, LineStep step, const Failure& failure, const QString& subject = {});

// The number under which the makers know a failure of the line; 12003 stands for an answer of the server itself.
int LineErrorNumber(Failure::Kind kind);

} // namespace lumora
