#pragma once

#include <QString>

#include <filesystem>

namespace lumora {

// A path of this machine. A drive path ("C:\pictures\a.jpg") is a QString; the two types do not mix, and only Drives
// turns one into the other.
using HostPath = std::filesystem::path;

// For messages and for Qt's own file classes.
QString toText(const HostPath& path);
HostPath toHostPath(const QString& text);

} // namespace lumora
