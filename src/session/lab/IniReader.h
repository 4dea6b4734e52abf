#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

namespace lumora {

// The form of an INI file: sections in brackets, "key = value" lines, comments from "#" or ";" at the start of a line.
// Only the given keys are allowed, each once. A message names the file and the line and quotes only a plain name, since
// a wrong line may hold a password.
class IniReader {
public:
    struct Key {
        QString section;
        QString name; // the file may write it in capitals or small letters
    };
    // Takes the value of the key with this index. Returns what is wrong with the value, or an empty text.
    using Taker = std::function<QString(std::size_t key, const QString& value)>;

    IniReader(const QString& fileName, std::vector<Key> keys)
        : m_fileName(fileName)
        , m_keys(std::move(keys)) {}

    void read(const QString& text, const Taker& take);
    // The number of the key's line, from 1; 0 when the file does not give the key.
    int lineOf(const QString& fullName) const { return m_lines.value(fullName); }
    void fail(int line, const QString& what);
    const QStringList& errors() const { return m_errors; }

    // "Section.Name", as messages name a key.
    static QString fullName(const QString& section, const QString& name) { return section + u'.' + name; }

private:
    // Returns what is wrong with the line, or an empty text.
    QString takeLine(const QString& line, const Taker& take);
    QString takeSection(const QString& line);
    QString takeValue(const QString& name, QString value, const Taker& take);

    QString m_fileName;
    std::vector<Key> m_keys;
    QStringList m_errors;
    QString m_section;
    bool m_sectionFailed = false;
    int m_line = 0;
    QHash<QString, int> m_lines; // by full name
};

} // namespace lumora
