#pragma once

#include "common/Result.h"

#include <QByteArray>

#include <filesystem>

namespace lumora {

// To a temporary file in the same folder, synced, then renamed: a crash or a full disk leaves the old file or the new
// one and never half a file. The failure's message names the path and the reason.
Result<void> writeWholeFile(const std::filesystem::path& path, const QByteArray& bytes);

// "PATH: what happened: reason of the error number", with the kind that the number stands for.
Failure fileFailure(const std::filesystem::path& path, const QString& what, int errorNumber);

} // namespace lumora
