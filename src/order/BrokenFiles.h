#pragma once

#include "common/Result.h"

#include <QString>
#include <QStringList>

namespace lumora {

class Files;
class OrderFolder;
class TextList;

// Writes kashloo.txt into the local order folder: the files whose put failed, one full local path a line. A later run
// of the program reads it when the order is sent again, so that the incomplete file on the server does not count as
// sent.
Result<void> WriteBrokenFiles(const Files& files, const OrderFolder& folder, const TextList& broken);
// The paths of kashloo.txt; empty when there is no such file or it can't be read.
QStringList ReadBrokenFiles(const Files& files, const OrderFolder& folder);

bool IsBroken(const TextList& broken, const QString& leafName);

} // namespace lumora
