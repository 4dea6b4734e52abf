#pragma once

#include "common/Result.h"

#include <QString>

#include <filesystem>

namespace lumora {

// A text that changes when a file of the folder comes, goes or is written to. It reads no file, only names, lengths and
// times; also the time of the last change of a file's own entry, which no program that uploads can set.
Result<QString> folderTrace(const std::filesystem::path& folder);

} // namespace lumora
