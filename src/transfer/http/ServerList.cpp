#include "transfer/http/ServerList.h"

#include "common/AnsiCodePage.h"
#include "common/DrivePath.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qsizetype longestAnswer = 35;
const QString total = u"total:"_s;
const QString separator = u"~~"_s;
const QByteArray byteOrderMark = "\xEF\xBB\xBF"_ba;

bool namesTotal(const QString& entry) {
    return entry.contains(total, Qt::CaseInsensitive);
}

bool hasNot(const QString& answer) {
    return answer.contains(u"not"_s, Qt::CaseInsensitive);
}

bool isServersList(const QString& name) {
    bool isList = name == SecondListName();
    for (int number = 0; !isList && !ListFileName(number).isEmpty(); ++number)
        isList = name == ListFileName(number);
    return isList;
}

// Not trimmed; no blank ones.
QStringList splitList(const QString& text) {
    QStringList entries = text.split(separator);
    entries.removeIf([](const QString& entry) { return entry.trimmed().isEmpty(); });
    return entries;
}

std::optional<QStringList> filesIn(const QString& answer, const QString& folderName) {
    QStringList names;
    bool hasFolder = false;
    bool hasTotal = false;
    for (const QString& entry : splitList(answer)) {
        const QString name = entry.trimmed();
        if (name == folderName)
            hasFolder = true;
        else if (namesTotal(name))
            hasTotal = true;
        else if (!isServersList(name.toLower()))
            names += name;
    }
    return hasFolder && (hasTotal || !names.isEmpty()) ? std::optional(names) : std::nullopt;
}

} // namespace

QString ServerText(const QByteArray& bytes) {
    return AnsiCodePage::decode(bytes.startsWith(byteOrderMark) ? bytes.mid(byteOrderMark.size()) : bytes);
}

QStringList ParseServerList(const QString& text) {
    const QString whole = text.trimmed();
    if (whole.size() <= longestAnswer)
        return {};
    return splitList(whole);
}

QStringList MarkHossarim(const QStringList& files, const QStringList& entries, const QString& folderName,
                         ListMatch match) {
    QStringList missing = files;
    for (const QString& given : entries) {
        const QString entry = given.trimmed().toLower();
        if (namesTotal(entry) || entry == folderName.toLower())
            continue;
        const auto arrived = std::find_if(missing.begin(), missing.end(), [&](const QString& path) {
            const QString name = LeafName(path).trimmed().toLower();
            return match == ListMatch::Whole ? name == entry : name.contains(entry);
        });
        if (arrived != missing.end())
            missing.erase(arrived);
    }
    return missing;
}

bool TellsUnknownFolder(const QString& answer) {
    const QString text = answer.trimmed();
    return hasNot(text) && text.size() <= longestAnswer && !text.contains(u'<') && !text.contains(separator);
}

ServerAnswer ReadServerAnswer(const QString& answer, const QString& folderName) {
    ServerAnswer read;
    read.files = TellsUnknownFolder(answer) ? QStringList() : filesIn(answer, folderName);
    if (hasNot(answer))
        return read;
    read.entries = ParseServerList(answer);
    read.namesFolder = std::any_of(read.entries.begin(), read.entries.end(),
                                   [&](const QString& entry) { return entry.trimmed() == folderName; });
    if (read.namesFolder && std::any_of(read.entries.begin(), read.entries.end(), namesTotal))
        read.verdict = ServerVerdict::Listed;
    return read;
}

QString ListFileName(int number) {
    if (number < 0 || number > 3)
        return {};
    return number == 0 ? u"filelisthom.txt"_s : u"filelisthom%1.txt"_s.arg(number);
}

QString SecondListName() {
    return u"filelist1.txt"_s;
}

QStringList NamesAsListed(const QString& name, const QStringList& entries) {
    QStringList names{name};
    for (const QString& entry : entries) {
        const QString listed = entry.trimmed();
        if (listed != name && listed.compare(name, Qt::CaseInsensitive) == 0)
            names += listed;
    }
    return names;
}

QString NameInAddress(const QString& name) {
    QString encoded = name;
    return encoded.replace(u"%"_s, u"%25"_s).replace(u"#"_s, u"%23"_s).replace(u"?"_s, u"%3F"_s);
}

} // namespace lumora
