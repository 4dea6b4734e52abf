#pragma once

#include <QByteArray>
#include <QDateTime>
#include <QList>
#include <QString>

#include <optional>

// The list-output form of the stored texts: items of a line separated by a comma, a text in double quotes (also when it
// is empty; a quote inside stays bare), numbers bare, CR LF behind each line, the ANSI code page. docs/formats.md has
// the table.
namespace lumora {

class ListOutput {
public:
    ListOutput& text(const QString& value);
    ListOutput& number(long long value);
    ListOutput& single(float value);

    // #yyyy-mm-dd hh:mm:ss#; at midnight the date alone; the zero date of the format, 1899-12-30, when there is none.
    ListOutput& date(const std::optional<QDateTime>& value);

    ListOutput& endLine();

    // One line of two texts, the form of most lines of the order log.
    ListOutput& pair(const QString& key, const QString& value) { return text(key).text(value).endLine(); }

    const QByteArray& bytes() const { return m_bytes; }

private:
    void separate();

    QByteArray m_bytes;
    bool m_atLineStart = true;
};

// One entry of an order log: the key, and the rest of the line less its outer quotes.
struct ListOutputEntry {
    bool operator==(const ListOutputEntry&) const = default;

    QString key;
    QString value;
};

// The lines of a stored text, in order, without their CR LF or LF. A break inside an open quoted item does not end the
// line.
QStringList ListOutputLines(const QByteArray& bytes);

// The entries of all lines that begin with a quoted key. The key runs up to the first `",`, so that quotes and commas
// in a value, which the format leaves bare, do no harm. Lines without a key are passed over.
QList<ListOutputEntry> ReadListOutput(const QByteArray& bytes);

// A date as ListOutput writes it. No value for the zero date and for what is no date.
std::optional<QDateTime> ListOutputDate(const QString& value);

// A line without its first and its last character: how the detail stores take a quoted text back.
QString WithoutEnds(const QString& line);

} // namespace lumora
