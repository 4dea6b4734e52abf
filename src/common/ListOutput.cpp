#include "common/ListOutput.h"

#include "common/AnsiCodePage.h"

namespace lumora {

void ListOutput::separate()
{
    if (!m_atLineStart)
        m_bytes.append(',');
    m_atLineStart = false;
}

ListOutput& ListOutput::text(const QString& value)
{
    separate();
    m_bytes.append('"').append(AnsiCodePage::encode(value)).append('"');
    return *this;
}

ListOutput& ListOutput::number(long long value)
{
    separate();
    m_bytes.append(QByteArray::number(value));
    return *this;
}

ListOutput& ListOutput::date(const std::optional<QDateTime>& value)
{
    separate();
    const QDateTime when = value.value_or(QDateTime(QDate(1899, 12, 30), QTime(0, 0)));
    const bool midnight = when.time().msecsSinceStartOfDay() < 1000;
    const bool zeroDate = when.date() == QDate(1899, 12, 30);
    QString form = QStringLiteral("yyyy-MM-dd hh:mm:ss");
    if (midnight)
        form = QStringLiteral("yyyy-MM-dd");
    else if (zeroDate)
        form = QStringLiteral("hh:mm:ss");
    m_bytes.append('#').append(when.toString(form).toLatin1()).append('#');
    return *this;
}

ListOutput& ListOutput::endLine()
{
    m_bytes.append("\r\n");
    m_atLineStart = true;
    return *this;
}

namespace {

// An item that was opened by a quote is closed by a quote before a comma or a line end. A line whose last item is still open
// goes on behind the break: the customer's note may hold one.
bool lastItemIsOpen(const QString& line)
{
    if (!line.contains(u'"'))
        return false;
    const qsizetype valueStart = line.startsWith(u'"') ? line.indexOf(QLatin1String("\",")) : -1;
    const QString last = valueStart < 0 ? line : line.mid(valueStart + 2);
    return last.startsWith(u'"') && (last.size() < 2 || !last.endsWith(u'"'));
}

} // namespace

QStringList ListOutputLines(const QByteArray& bytes)
{
    const QString all = AnsiCodePage::decode(bytes);
    QStringList lines;
    QString line;
    bool open = false;
    const auto physical = all.split(u'\n');
    for (qsizetype i = 0; i < physical.size(); ++i) {
        const bool terminated = i + 1 < physical.size();
        QString part = physical[i];
        if (part.endsWith(u'\r'))
            part.chop(1);
        if (!terminated && part.isEmpty() && !open)
            break;
        line = open ? line + u'\n' + part : part;
        open = lastItemIsOpen(line);
        if (!open)
            lines += line;
    }
    if (open)
        lines += line;
    return lines;
}

QList<ListOutputEntry> ReadListOutput(const QByteArray& bytes)
{
    QList<ListOutputEntry> entries;
    for (const QString& line : ListOutputLines(bytes)) {
        const qsizetype keyEnd = line.indexOf(QLatin1String("\","));
        if (!line.startsWith(u'"') || keyEnd < 1)
            continue;
        const QString value = line.mid(keyEnd + 2);
        const bool quoted = value.size() >= 2 && value.startsWith(u'"') && value.endsWith(u'"');
        entries += {line.mid(1, keyEnd - 1), quoted ? value.sliced(1, value.size() - 2) : value};
    }
    return entries;
}

QString WithoutEnds(const QString& line)
{
    return line.size() < 2 ? QString() : line.sliced(1, line.size() - 2);
}

} // namespace lumora
