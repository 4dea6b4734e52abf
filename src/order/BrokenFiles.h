#pragma once

#include "common/Result.h"

#include <QString>
#include <QStringList>

namespace lumora {

class Files;
class OrderFolder;
class TextList;

// kashloo.txt in the local order folder: the files whose put failed, one full local path a line. It outlives the
// program, so that what a broken put left on the server is not taken for a sent file when the order is sent again.
Result<void> WriteBrokenFiles(const Files& files, const OrderFolder& folder, const TextList& broken);
// Empty when there is no such file.
QStringList ReadBrokenFiles(const Files& files, const OrderFolder& folder);

// True if one of the paths has this leaf name.
bool IsBroken(const TextList& broken, const QString& leafName);

} // namespace lumora
