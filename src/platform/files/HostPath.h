#pragma once

#include <QString>

#include <filesystem>

namespace lumora {

// A path of this machine. Only Drives converts between it and a drive path ("C:\pictures\a.jpg").
using HostPath = std::filesystem::path;

// The path as text and back. Bytes that are not UTF-8 become lone surrogates and return unchanged; the code page has
// "?" for each.
QString toText(const HostPath& path);
HostPath toHostPath(const QString& text);

// One name of a path as it stands in a drive path: a backslash in it is converted like a byte that is not UTF-8.
QString toDriveName(const HostPath& name);

} // namespace lumora
