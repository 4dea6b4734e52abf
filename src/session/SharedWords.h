#pragma once

#include "common/Result.h"

#include <QStringList>

// Words that several pages say.
namespace lumora {

struct SessionState;

// Why a file could not be used, as a customer reads it. The machine's own words go to standard error.
QString failureWords(const SessionState& state, const Failure& failure);

// The first most of the items, and how many more there are.
QString shortList(const SessionState& state, const QStringList& items, qsizetype most, const QString& between);

} // namespace lumora
