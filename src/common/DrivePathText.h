#pragma once

#include <QString>

// Drive paths ("C:\pictures\a.jpg") as text: what lists, basket lines, logs and file names carry. Only platform/ turns
// a drive path into a path of this machine.
namespace lumora {

// What the functions below answer for "nothing", and the text of a field that was not chosen yet.
inline const QString notChosen = QStringLiteral("***");

// The text behind the last backslash; "***" when there is none.
QString LeafName(const QString& path);

// The folder of a path, also of one that ends in a backslash; "***" when there is none.
QString ParentFolder(const QString& path);

// The folder of a path; "***" for "***", for an empty path and for a path of under 3 characters.
QString FolderOfPath(const QString& path);

// The flat file name under which a picture's stored view and its red-eye copy are kept: "\" becomes "]", ":" becomes
// ";".
QString MangleFileName(const QString& path);

// The base name of a print file: the leaf name less its last four characters.
QString NameWithoutEnding(const QString& path);

// folder and name with exactly one backslash between them.
QString JoinDrivePath(const QString& folder, const QString& name);

} // namespace lumora
