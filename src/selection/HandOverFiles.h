#pragma once

#include "common/Result.h"

#include <QStringList>

namespace lumora {

class Files;
struct SessionState;

// Writes the texts that record the basket outside the page's memory, in 2000lumora\Tik4txt, which is made when it is
// missing: all lines in "all_list.txt", and the line of the picture that was stored last in a file with its index in
// front, of at least two digits ("07onepic.txt"). Nothing in the program reads them.
Result<void> writeHandOverFiles(const SessionState& state, const Files& files, const QStringList& lines, int index);

} // namespace lumora
