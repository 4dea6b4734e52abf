#include "common/ListOutput.h"

#include "common/AnsiCodePage.h"
#include "common/FixedText.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

const QDate zeroDay(1899, 12, 30);
const QString dayAndTime = u"yyyy-MM-dd hh:mm:ss"_s;
const QString dayAlone = u"yyyy-MM-dd"_s;

} // namespace

void ListOutput::separate() {
    if (!m_atLineStart)
        m_bytes.append(',');
    m_atLineStart = false;
}

ListOutput& ListOutput::text(const QString& value) {
    separate();
    m_bytes.append('"').append(AnsiCodePage::encode(value)).append('"');
    return *this;
}

ListOutput& ListOutput::number(long long value) {
    separate();
    m_bytes.append(QByteArray::number(value));
    return *this;
}

ListOutput& ListOutput::date(const std::optional<QDateTime>& value) {
    separate();
    const QDateTime when = value.value_or(QDateTime(zeroDay, QTime(0, 0)));
    const bool midnight = when.time().msecsSinceStartOfDay() < 1000;
    const bool zeroDate = when.date() == zeroDay;
    QString form = dayAndTime;
    if (midnight)
        form = dayAlone;
    else if (zeroDate)
        form = u"hh:mm:ss"_s;
    m_bytes.append('#').append(when.toString(form).toLatin1()).append('#');
    return *this;
}

ListOutput& ListOutput::single(float value) {
    separate();
    m_bytes.append(PlainNumber(value).toLatin1());
    return *this;
}

ListOutput& ListOutput::endLine() {
    m_bytes.append("\r\n");
    m_atLineStart = true;
    return *this;
}

namespace {

// The line that is being read. An item that was opened by a quote is closed by a quote before a line end; a line whose
// last item is still open goes on behind the break: the customer's note may hold one. Each part is looked at once, so
// that a long text with a quote that never closes takes no longer than another.
class GrowingLine {
public:
    // part: without its line end, which was CR LF or LF alone. A break inside an item stays as it was: the edit record
    // of a caption with two lines has a fixed width.
    void append(const QString& part, bool endsInCrLf) {
        if (m_open)
            m_text += m_break;
        m_break = endsInCrLf ? u"\r\n"_s : u"\n"_s;
        const qsizetype from = m_text.size();
        m_text += part;
        if (m_valueAt < 0 && m_text.startsWith(u'"')) {
            const qsizetype keyEnd = m_text.indexOf(QLatin1String("\","), from);
            m_valueAt = keyEnd < 0 ? -1 : keyEnd + 2;
        }
        const QStringView last = QStringView(m_text).mid(m_valueAt < 0 ? 0 : m_valueAt);
        m_open = last.startsWith(u'"') && (last.size() < 2 || !last.endsWith(u'"'));
    }

    bool open() const { return m_open; }

    QString take() {
        m_open = false;
        m_valueAt = -1;
        return std::exchange(m_text, QString());
    }

private:
    QString m_text;
    QString m_break;
    qsizetype m_valueAt = -1; // where the item behind the key begins
    bool m_open = false;
};

} // namespace

QStringList ListOutputLines(const QByteArray& bytes) {
    const QString all = AnsiCodePage::decode(bytes);
    QStringList lines;
    GrowingLine line;
    const auto physical = all.split(u'\n');
    for (qsizetype i = 0; i < physical.size(); ++i) {
        const bool terminated = i + 1 < physical.size();
        QString part = physical[i];
        const bool endsInCrLf = part.endsWith(u'\r');
        if (endsInCrLf)
            part.chop(1);
        if (!terminated && part.isEmpty())
            break;
        line.append(part, endsInCrLf);
        if (!line.open())
            lines += line.take();
    }
    if (line.open())
        lines += line.take();
    return lines;
}

QList<ListOutputEntry> ReadListOutput(const QByteArray& bytes) {
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

std::optional<QDateTime> ListOutputDate(const QString& value) {
    for (const QString& form : {dayAndTime, dayAlone}) {
        const QDateTime date = QDateTime::fromString(WithoutEnds(value), form);
        if (date.isValid() && date.date() != zeroDay)
            return date;
    }
    return std::nullopt;
}

QString WithoutEnds(const QString& line) {
    return line.size() < 2 ? QString() : line.sliced(1, line.size() - 2);
}

} // namespace lumora
