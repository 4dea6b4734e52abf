#include "platform/line/FtpListing.h"

#include "common/AnsiCodePage.h"

#include <QByteArrayList>

#include <algorithm>
#include <array>
#include <optional>
#include <vector>

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

// A letter beyond ASCII, in whichever code.
bool isForeign(char c) {
    return static_cast<unsigned char>(c) >= 0x80;
}

bool isLetter(char c) {
    return isForeign(c) || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

bool isNumber(const QByteArray& text) {
    return !text.isEmpty() && std::all_of(text.begin(), text.end(), isDigit);
}

// A number, with a point, a comma or a letter of another alphabet behind it or without: "21", "21.".
bool isMarkedNumber(const QByteArray& text, qsizetype fewest, qsizetype most) {
    const auto end = std::find_if_not(text.begin(), text.end(), isDigit);
    const qsizetype digits = end - text.begin();
    return digits >= fewest && digits <= most &&
           std::all_of(end, text.end(), [](char c) { return c == '.' || c == ',' || isForeign(c); });
}

bool isEnglishMonth(const QByteArray& text) {
    static constexpr std::array names = {"jan", "feb", "mar", "apr", "may", "jun",
                                         "jul", "aug", "sep", "oct", "nov", "dec"};
    return std::find(names.begin(), names.end(), text.toLower()) != names.end();
}

// In whichever language: a word of letters, or a number with a foreign letter.
bool isMonthWord(const QByteArray& text) {
    return text.size() >= 2 && text.size() <= 24 && std::any_of(text.begin(), text.end(), isLetter) &&
           std::all_of(text.begin(), text.end(),
                       [](char c) { return isLetter(c) || isDigit(c) || c == '.' || c == ',' || c == '\''; });
}

bool isDay(const QByteArray& text) {
    const int day = QByteArray(text).replace(',', '.').split('.').value(0).left(2).toInt();
    return isMarkedNumber(text, 1, 2) && (day >= 1 || isForeign(text.back())) && day <= 31;
}

bool isTimeOrYear(const QByteArray& text) {
    if (isMarkedNumber(text, 4, 4))
        return true;
    const qsizetype colon = text.indexOf(':');
    return colon > 0 && colon <= 2 && isNumber(text.left(colon)) && text.size() > colon + 1 && isDigit(text[colon + 1]);
}

// 2026-11-22
bool isIsoDate(const QByteArray& text) {
    const QByteArrayList parts = text.split('-');
    return parts.size() == 3 && parts[0].size() == 4 && parts[1].size() == 2 && parts[2].size() == 2 &&
           std::all_of(parts.begin(), parts.end(), isNumber);
}

// +0200
bool isZone(const QByteArray& text) {
    return text.size() == 5 && (text[0] == '+' || text[0] == '-') && isNumber(text.mid(1));
}

std::optional<qint64> lengthOf(const QByteArray& text) {
    bool known = false;
    const qint64 length = QByteArray(text).replace(',', "").toLongLong(&known);
    return known && length >= 0 ? std::optional(length) : std::nullopt;
}

// The index of the field behind which the name stands, by a date at first; no value where there is none.
std::optional<std::size_t> dateEnd(const QByteArray& line, const std::vector<Field>& fields, std::size_t first,
                                   bool (*isMonth)(const QByteArray&)) {
    const auto text = [&](std::size_t index) {
        return index < fields.size() ? textOf(line, fields[index]) : QByteArray();
    };
    if (isIsoDate(text(first)) && text(first + 1).contains(':') && isTimeOrYear(text(first + 1)))
        return first + (isZone(text(first + 2)) ? 2 : 1);
    const bool date =
        (isMonth(text(first)) && isDay(text(first + 1))) || (isDay(text(first)) && isMonth(text(first + 1)));
    return date && isTimeOrYear(text(first + 2)) ? std::optional(first + 2) : std::nullopt;
}

// drwxr-xr-x    2 owner    group        4096 Nov 21 03:47 name. The group may be missing; owner and group may be
// anything. NetWare has the rights as a field of their own behind the first sign: d [R----F--] owner 512 Nov 21 03:47
// name
std::optional<FtpEntry> unixEntry(const QByteArray& line) {
    const auto fields = fieldsOf(line);
    if (fields.size() < 6 || fields[0].begin != 0 || !QByteArray("-dlbcps").contains(line[0]))
        return std::nullopt;
    const bool netWare = fields[0].end == 1 && line[fields[1].begin] == '[';
    if (!netWare && fields[0].end < 10)
        return std::nullopt;
    for (const auto isMonth : {isEnglishMonth, isMonthWord}) {
        for (std::size_t first = 3; first < fields.size(); ++first) {
            const QByteArray length = textOf(line, fields[first - 1]);
            const auto last = isNumber(length) ? dateEnd(line, fields, first, isMonth) : std::nullopt;
            if (!last)
                continue;
            QByteArray name = line.mid(fields[*last].end + 1);
            if (line[0] == 'l') {
                if (const qsizetype arrow = name.indexOf(" -> "); arrow > 0)
                    name.truncate(arrow);
            }
            if (name.isEmpty())
                return std::nullopt;
            return FtpEntry{AnsiCodePage::decode(name), line[0] == 'd',
                            line[0] == '-' ? lengthOf(length) : std::nullopt};
        }
    }
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
        return FtpEntry{AnsiCodePage::decode(name), kindText.toUpper() == "<DIR>", std::nullopt};
    }
    const QByteArray name = line.mid(fields[kind].end + 1);
    if (!isNumber(QByteArray(kindText).replace(',', "")) || name.isEmpty())
        return std::nullopt;
    return FtpEntry{AnsiCodePage::decode(name), false, lengthOf(kindText)};
}

// type=file;size=1234;modify=20261121034700; name
std::optional<FtpEntry> mlsdEntry(const QByteArray& line) {
    const qsizetype blank = line.indexOf(' ');
    if (blank < 2 || line[blank - 1] != ';' || blank + 1 >= line.size())
        return std::nullopt;
    FtpEntry entry{AnsiCodePage::decode(line.mid(blank + 1)), false, std::nullopt};
    for (const QByteArray& fact : line.left(blank - 1).split(';')) {
        const qsizetype sign = fact.indexOf('=');
        if (sign < 1)
            return std::nullopt;
        const QByteArray value = fact.mid(sign + 1);
        if (fact.left(sign).toLower() == "type")
            entry.folder = value.toLower().endsWith("dir");
        else if (fact.left(sign).toLower() == "size")
            entry.length = lengthOf(value);
    }
    return entry;
}

// +i8388621.48594,m825718503,r,s280,<tab>name
std::optional<FtpEntry> eplfEntry(const QByteArray& line) {
    const qsizetype tab = line.indexOf('\t');
    if (!line.startsWith('+') || tab < 0 || tab + 1 >= line.size())
        return std::nullopt;
    FtpEntry entry{AnsiCodePage::decode(line.mid(tab + 1)), false, std::nullopt};
    for (const QByteArray& fact : line.mid(1, tab - 1).split(',')) {
        entry.folder = entry.folder || fact == "/";
        if (fact.startsWith('s'))
            entry.length = lengthOf(fact.mid(1));
    }
    return entry;
}

std::optional<FtpEntry> entryOf(const QByteArray& line) {
    for (const auto read : {unixEntry, dosEntry, mlsdEntry, eplfEntry}) {
        if (auto entry = read(line))
            return entry;
    }
    return std::nullopt;
}

// A name as a file of any system may have it; what a server complains of has a colon or a slash.
bool isLeafName(const QByteArray& line) {
    return line.size() <= 255 && !line.startsWith(' ') && !line.endsWith(' ') &&
           std::none_of(line.begin(), line.end(), [](char c) {
               return (!isForeign(c) && c < ' ') || c == 0x7F || QByteArray("/\\:*?\"<>|").contains(c);
           });
}

// A name of at most four letters or digits behind a point, as ".jpp".
bool hasEnding(const QByteArray& line) {
    const QByteArray ending = line.mid(line.lastIndexOf('.') + 1);
    return ending.size() < line.size() && !ending.isEmpty() && ending.size() <= 4 &&
           std::all_of(ending.begin(), ending.end(), [](char c) { return isLetter(c) || isDigit(c); });
}

// Words, as "No files found"; the names of orders and their files have signs or endings that words lack.
bool isSentence(const QByteArray& line) {
    return line.contains(' ') && !hasEnding(line) && std::all_of(line.begin(), line.end(), [](char c) {
               return isLetter(c) || isDigit(c) || QByteArray(" .,'!()-").contains(c);
           });
}

bool isSum(const QByteArray& line) {
    const QByteArrayList words = line.simplified().split(' ');
    return words.size() == 2 && !isNumber(words[0]) && isNumber(words[1]);
}

} // namespace

FtpListing ParseFtpListing(const QByteArray& listing) {
    QByteArrayList lines = listing.split('\n');
    for (QByteArray& line : lines) {
        if (line.endsWith('\r'))
            line.chop(1);
    }
    lines.removeIf([](const QByteArray& line) { return line.trimmed().isEmpty(); });
    FtpListing read;
    QByteArrayList others;
    for (const QByteArray& line : std::as_const(lines)) {
        if (auto entry = entryOf(line))
            read.entries.push_back(std::move(*entry));
        else
            others.append(line);
    }
    const bool namesOnly = read.entries.empty();
    if (!others.isEmpty() && others.first() == lines.first() && isSum(lines.first()) &&
        (!namesOnly || lines.first().toLower().startsWith("total ")))
        others.removeFirst();
    const bool serversWords = others.size() == 1 && isSentence(others.first());
    if (!namesOnly || serversWords || !std::all_of(others.begin(), others.end(), isLeafName)) {
        read.unread = others.isEmpty() ? QString() : AnsiCodePage::decode(others.first());
        return read;
    }
    for (const QByteArray& name : std::as_const(others))
        read.entries.push_back({AnsiCodePage::decode(name), false, std::nullopt});
    return read;
}

} // namespace lumora
