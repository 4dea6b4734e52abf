#include "session/lab/IniReader.h"

#include <QRegularExpression>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QString shown(const QString& name) {
    static const QRegularExpression plain(u"^[A-Za-z][A-Za-z0-9]{0,30}\\z"_s);
    return plain.match(name).hasMatch() ? u"\"%1\""_s.arg(name) : u"a name that is none"_s;
}

} // namespace

void IniReader::read(const QString& text, const Taker& take) {
    QString content = text;
    content.replace(u"\r\n"_s, u"\n"_s);
    for (const QString& line : content.split(u'\n')) {
        ++m_line;
        if (const QString wrong = takeLine(line.trimmed(), take); !wrong.isEmpty())
            fail(m_line, wrong);
    }
}

void IniReader::fail(int line, const QString& what) {
    m_errors += u"%1:%2: %3"_s.arg(m_fileName).arg(line).arg(what);
}

QString IniReader::takeLine(const QString& line, const Taker& take) {
    if (line.isEmpty() || line.startsWith(u'#') || line.startsWith(u';'))
        return {};
    if (line.startsWith(u'['))
        return takeSection(line);
    const qsizetype equals = line.indexOf(u'=');
    if (equals < 0)
        return u"neither a [section] nor \"key = value\" nor a comment that begins with #"_s;
    return takeValue(line.left(equals).trimmed(), line.mid(equals + 1).trimmed(), take);
}

QString IniReader::takeSection(const QString& line) {
    const qsizetype bracket = line.indexOf(u']');
    const QString name = line.mid(1, bracket < 0 ? -1 : bracket - 1).trimmed();
    QStringList sections;
    for (const Key& key : m_keys) {
        if (!sections.contains(key.section))
            sections += key.section;
    }
    const bool whole = bracket == line.size() - 1;
    m_sectionFailed = !whole || !sections.contains(name);
    m_section = m_sectionFailed ? QString() : name;
    if (bracket < 0)
        return u"the section %1 lacks its closing bracket; allowed: a section's name in brackets, as in [Server]"_s.arg(
            shown(name));
    if (!whole)
        return u"more stands behind the closing bracket of the section %1; allowed: nothing, a comment takes a line of its own"_s
            .arg(shown(name));
    return m_sectionFailed ? u"the section %1 is not known; allowed: [%2]"_s.arg(shown(name), sections.join(u"], ["_s))
                           : QString();
}

QString IniReader::takeValue(const QString& name, QString value, const Taker& take) {
    // One message is enough for a section that is not known.
    if (m_sectionFailed)
        return {};
    if (m_section.isEmpty())
        return u"the key %1 stands before the first [section]"_s.arg(shown(name));
    const auto key = std::find_if(m_keys.begin(), m_keys.end(), [&](const Key& known) {
        return known.section == m_section && known.name.compare(name, Qt::CaseInsensitive) == 0;
    });
    if (key == m_keys.end()) {
        QStringList names;
        for (const Key& known : m_keys) {
            if (known.section == m_section)
                names += known.name;
        }
        return u"the key %1 is not known in [%2]; allowed: %3"_s.arg(shown(name), m_section, names.join(u", "_s));
    }
    int& line = m_lines[fullName(key->section, key->name)];
    if (line > 0)
        return u"%1 is given twice, first in line %2; allowed: once"_s.arg(fullName(key->section, key->name)).arg(line);
    line = m_line;
    if (value.size() >= 2 && value.startsWith(u'"') && value.endsWith(u'"'))
        value = value.mid(1, value.size() - 2);
    return take(static_cast<std::size_t>(key - m_keys.begin()), value);
}

} // namespace lumora
