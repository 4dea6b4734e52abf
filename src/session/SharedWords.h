#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"

#include <QStringList>

// Words that several pages say.
namespace lumora {

struct SessionState;

// Why this file could not be used, as a customer reads it.
QString failureWords(const SessionState& state, const Failure& failure, const DrivePath& file);
// The same where it is told: the machine's own words go to standard error.
QString warnedWords(const SessionState& state, const Failure& failure, const DrivePath& file);

// Who helps here: "Please ask the staff." where there is one.
QString askForHelp(const SessionState& state);

// The first most of the items, and how many more there are.
QString shortList(const SessionState& state, const QStringList& items, qsizetype most, const QString& between);

} // namespace lumora
