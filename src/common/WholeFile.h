#pragma once

#include "common/Result.h"

#include <QByteArray>

#include <filesystem>

namespace lumora {

// To a temporary file in the same folder, synced, then renamed: a crash or a full disk leaves the old file or the new
// one and never half a file. The failure's message names the path and the reason.
Result<void> writeWholeFile(const std::filesystem::path& path, const QByteArray& bytes);

// The kind that an error number of the system stands for.
Failure::Kind failureKind(int errorNumber);

// "PATH: what happened: reason of the error number".
Failure fileFailure(const std::filesystem::path& path, const QString& what, int errorNumber);

} // namespace lumora
