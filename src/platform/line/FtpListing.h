#pragma once

#include "platform/line/Internet.h"

#include <QByteArray>

namespace lumora {

// The entries of a LIST answer. A line is read by its fields, and the name is all that stands behind the last of them
// and one blank, so that a name keeps its blanks wherever they stand. Known are the lines of ls (with the month's name
// in any language or a date such as 2026-11-22), DOS, NetWare, MLSD and EPLF. Where no line has one of these forms and
// each is a leaf name, the lines are names; a single line of words is none. A link counts as a file, without its target
// and length. Empty lines and a sum in the first line ("total 12") are passed over.
FtpListing ParseFtpListing(const QByteArray& listing);

} // namespace lumora
