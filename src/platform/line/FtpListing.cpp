#include "platform/line/FtpListing.h"

#include "common/AnsiCodePage.h"

#include <algorithm>
#include <array>
#include <optional>

namespace lumora {
namespace {

struct Field {
    qsizetype begin = 0;
    qsizetype end = 0;
};

// No style needs more fields in front of the name.
constexpr std::size_t mostFields = 12;

std::vector<Field> fieldsOf(const QByteArray& line) {
    std::vector<Field> fields;
    qsizetype at = 0;
    while (fields.size() < mostFields) {
        while (at < line.size() && (line[at] == ' ' || line[at] == '\t'))
            ++at;
        if (at >= line.size())
            break;
        const qsizetype begin = at;
        while (at < line.size() && line[at] != ' ' && line[at] != '\t')
            ++at;
        fields.push_back({begin, at});
    }
    return fields;
}

QByteArray textOf(const QByteArray& line, const Field& field) {
    return line.mid(field.begin, field.end - field.begin);
}

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool isNumber(const QByteArray& text) {
    return !text.isEmpty() && std::all_of(text.begin(), text.end(), isDigit);
}

bool isMonth(const QByteArray& text) {
    static constexpr std::array names = {"jan", "feb", "mar", "apr", "may", "jun",
                                         "jul", "aug", "sep", "oct", "nov", "dec"};
    return std::find(names.begin(), names.end(), text.toLower()) != names.end();
}

bool isDay(const QByteArray& text) {
    return isNumber(text) && text.size() <= 2 && text.toInt() >= 1 && text.toInt() <= 31;
}

bool isTimeOrYear(const QByteArray& text) {
    if (isNumber(text))
        return text.size() == 4;
    const qsizetype colon = text.indexOf(':');
    return colon > 0 && colon <= 2 && isNumber(text.left(colon)) && text.size() > colon + 1 && isDigit(text[colon + 1]);
}

// drwxr-xr-x    2 owner    group        4096 Nov 21 03:47 name. The group may be missing; owner and group may be
// anything.
std::optional<FtpEntry> unixEntry(const QByteArray& line) {
    const auto fields = fieldsOf(line);
    if (fields.size() < 6 || fields[0].begin != 0 || fields[0].end < 10 || !QByteArray("-dlbcps").contains(line[0]))
        return std::nullopt;
    for (std::size_t month = 3; month + 2 < fields.size(); ++month) {
        const QByteArray first = textOf(line, fields[month]);
        const QByteArray second = textOf(line, fields[month + 1]);
        const bool date = (isMonth(first) && isDay(second)) || (isDay(first) && isMonth(second));
        if (!date || !isNumber(textOf(line, fields[month - 1])) || !isTimeOrYear(textOf(line, fields[month + 2])))
            continue;
        QByteArray name = line.mid(fields[month + 2].end + 1);
        if (line[0] == 'l') {
            if (const qsizetype arrow = name.indexOf(" -> "); arrow > 0)
                name.truncate(arrow);
        }
        if (name.isEmpty())
            return std::nullopt;
        return FtpEntry{AnsiCodePage::decode(name), line[0] == 'd'};
    }
    // A name of blanks only leaves fewer fields behind the date than the loop asks for.
    return std::nullopt;
}

bool isDosDate(const QByteArray& text) {
    return text.size() >= 8 && isDigit(text[0]) && (text.count('-') == 2 || text.count('/') == 2);
}

// 11-21-26  03:47AM       <DIR>          name, or a size in place of <DIR>.
std::optional<FtpEntry> dosEntry(const QByteArray& line) {
    const auto fields = fieldsOf(line);
    if (fields.size() < 4 || fields[0].begin != 0 || !isDosDate(textOf(line, fields[0])) ||
        !isTimeOrYear(textOf(line, fields[1])))
        return std::nullopt;
    std::size_t kind = 2;
    const QByteArray half = textOf(line, fields[2]).toUpper();
    if (half == "AM" || half == "PM")
        ++kind;
    if (kind >= fields.size())
        return std::nullopt;
    const QByteArray kindText = textOf(line, fields[kind]);
    if (kindText.startsWith('<')) {
        // The name of a folder stands in the column where that of a file stands: 22 behind the time.
        qsizetype at = fields[kind - 1].end + 22;
        if (at >= line.size() || !line.mid(fields[kind].end, at - fields[kind].end).trimmed().isEmpty()) {
            at = fields[kind].end;
            while (at < line.size() && line[at] == ' ')
                ++at;
        }
        const QByteArray name = line.mid(at);
        if (name.isEmpty())
            return std::nullopt;
        return FtpEntry{AnsiCodePage::decode(name), kindText.toUpper() == "<DIR>"};
    }
    const QByteArray name = line.mid(fields[kind].end + 1);
    if (!isNumber(QByteArray(kindText).replace(',', "")) || name.isEmpty())
        return std::nullopt;
    return FtpEntry{AnsiCodePage::decode(name), false};
}

} // namespace

std::vector<FtpEntry> ParseFtpListing(const QByteArray& listing) {
    std::vector<FtpEntry> entries;
    qsizetype begin = 0;
    while (begin < listing.size()) {
        qsizetype end = listing.indexOf('\n', begin);
        if (end < 0)
            end = listing.size();
        QByteArray line = listing.mid(begin, end - begin);
        if (line.endsWith('\r'))
            line.chop(1);
        begin = end + 1;
        auto entry = unixEntry(line);
        if (!entry)
            entry = dosEntry(line);
        if (entry)
            entries.push_back(std::move(*entry));
    }
    return entries;
}

} // namespace lumora
