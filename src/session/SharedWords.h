#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"

#include <QStringList>

// Words that several pages say.
namespace lumora {

struct SessionState;

// Why this file could not be used, as a customer reads it.
QString failureWords(const SessionState& state, const Failure& failure, const DrivePath& file);

// The first most of the items, and how many more there are.
QString shortList(const SessionState& state, const QStringList& items, qsizetype most, const QString& between);

} // namespace lumora
