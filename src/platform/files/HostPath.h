#pragma once

#include <QString>

#include <filesystem>

namespace lumora {

// A path of this machine. A drive path ("C:\pictures\a.jpg") is a QString; the two types do not mix, and only Drives
// turns one into the other.
using HostPath = std::filesystem::path;

// The path as text, and back. Bytes that are no UTF-8 survive the way there and back as lone surrogates; in the code
// page each of them becomes a "?".
QString toText(const HostPath& path);
HostPath toHostPath(const QString& text);

// One name of a path as it stands in a drive path: a backslash inside the name, which would part it in two there, is
// carried like a byte that is no UTF-8.
QString toDriveName(const HostPath& name);

} // namespace lumora
