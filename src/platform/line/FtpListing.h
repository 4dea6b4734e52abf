#pragma once

#include "platform/line/Internet.h"

#include <QByteArray>

#include <vector>

namespace lumora {

// The entries of a LIST answer, in the server's order, "." and ".." as they come. Two styles are known, that of ls and
// that of DOS. A line is read by its fields and the name is all that stands behind the last of them and one blank, so
// that a name keeps its blanks wherever they stand. A link counts as a file, without its target. Lines of neither style
// ("total 12") are passed over.
std::vector<FtpEntry> ParseFtpListing(const QByteArray& listing);

} // namespace lumora
