#pragma once

#include "common/HostFile.h"
#include "door/PictureHeader.h"

namespace lumora {

// The bytes of an open file from a place on, fewer at its end or at an error, which is kept.
QByteArray readPart(const Descriptor& file, qint64 at, qint64 count, int& error);

// What the header of an open file says; a failure where it can't be read. shown appears in the message.
Result<PictureHeader> headerOf(const Descriptor& file, const std::filesystem::path& shown);
Result<PictureHeader> headerOf(const std::filesystem::path& path);

} // namespace lumora
