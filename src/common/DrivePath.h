#pragma once

#include <QString>
#include <QStringView>

#include <utility>

namespace lumora {

// A path as the lab writes it ("C:\pictures\a.jpg"). Lists, basket lines, logs and captions hold its text; only
// platform/ turns it into a path of this machine.
class DrivePath {
public:
    DrivePath() = default;
    explicit DrivePath(QString text)
        : m_text(std::move(text)) {}

    const QString& text() const { return m_text; }
    bool isEmpty() const { return m_text.isEmpty(); }

    // The text behind the last backslash; "***" when there is none.
    QString leaf() const;
    // The leaf less its last four characters: the base name of a print file.
    QString stem() const;
    // What stands before the last backslash; "***" when there is none and for a path of under 3 characters.
    DrivePath folder() const;

    // Folder and name with exactly one backslash between them.
    DrivePath operator/(QStringView name) const;

    // Letter for letter: the lab tells paths apart by case.
    bool operator==(const DrivePath&) const = default;

private:
    QString m_text;
};

// The leaf of a path that stands in a list.
inline QString LeafName(const QString& path) {
    return DrivePath(path).leaf();
}

// The flat file name under which a picture's stored view and its red-eye copy are kept: "\" becomes "]", ":" becomes
// ";".
QString MangleFileName(const DrivePath& path);

} // namespace lumora
