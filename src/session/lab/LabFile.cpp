#include "session/lab/LabFile.h"

#include "common/AnsiCodePage.h"
#include "platform/files/UserFolders.h"
#include "session/lab/IniReader.h"
#include "session/lab/LabKeys.h"

#include <QFile>
#include <QFileInfo>
#include <QRegularExpression>
#include <QStringDecoder>

#include <algorithm>

// Qt's own file class reads the lab's file: all other files are read through the drives, and the drives depend on what
// this file says.

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 largestFile = 1 << 20; // bytes

bool printable(const LabKey& key, const QString& value) {
    const bool control = std::any_of(value.begin(), value.end(),
                                     [](QChar letter) { return letter.unicode() < 0x20 || letter.unicode() == 0x7F; });
    return !control && (key.ofMachine || AnsiCodePage::squeeze(value) == value);
}

// Sets the value in the deployment. Returns what is wrong with the value, or an empty text. No message repeats a
// password or an address of a mail server, nor a long text.
QString take(Deployment& deployment, const LabKey& key, const QString& value) {
    const QString name = IniReader::fullName(key.section, key.name);
    if (!printable(key, value))
        return u"%1 holds a character that the lab's code page (Windows-1255) lacks, or a control character; allowed: %2"_s
            .arg(name, key.allowed);
    if (key.set(deployment, value))
        return {};
    if (key.section == u"Server" || key.section == u"Mail" || value.size() > 80)
        return u"%1 has a wrong value; allowed: %2"_s.arg(name, key.allowed);
    return u"%1 has the wrong value \"%2\"; allowed: %3"_s.arg(name, value, key.allowed);
}

// Keys that may be empty in general, but need a value when another key has a certain value.
struct Needed {
    QString chosen; // full name of the key that needs the others
    QString as;
    QString section;
    std::vector<std::pair<QString, QString>> filled; // name and value
};

void checkFilled(IniReader& reader, const Needed& needed) {
    for (const auto& filled : needed.filled) {
        const auto& [name, value] = filled;
        const QString fullName = IniReader::fullName(needed.section, name);
        if (!value.isEmpty() || !reader.errors().filter(fullName).isEmpty()) // a wrong value has its own message
            continue;
        const auto key = std::find_if(labKeys().begin(), labKeys().end(), [&](const LabKey& known) {
            return known.section == needed.section && known.name == filled.first;
        });
        reader.fail(reader.lineOf(needed.chosen),
                    u"%1 is %2, and %3 is empty; allowed with it: %4"_s.arg(
                        needed.chosen, needed.as, fullName, QString(key->allowed).remove(u", or empty"_s)));
    }
}

// The limit of a coupon belongs to these two sizes, and only a size placed in front sets it.
void checkCouponSizes(IniReader& reader, const Deployment& deployment) {
    if (!deployment.Careful || deployment.HaKoopon != 1 || !reader.errors().filter(u"Paper.QuickSizes"_s).isEmpty())
        return;
    const auto& sizes = deployment.profile.QuickSizes;
    for (const QString& size : {u"10/15"_s, u"20/30"_s}) {
        if (std::find(sizes.begin(), sizes.end(), size) == sizes.end())
            reader.fail(reader.lineOf(u"Switches.Coupon"_s),
                        u"Switches.Coupon is yes, and Paper.QuickSizes lacks %1; allowed with it: sizes with 10/15 and "
                        "20/30 among them"_s.arg(size));
    }
}

void checkTogether(IniReader& reader, const Deployment& deployment) {
    const ClientProfile& profile = deployment.profile;
    if (deployment.SugSheliach == Sender::Http)
        checkFilled(reader, {u"Switches.Sender"_s,
                             u"http"_s,
                             u"Addresses"_s,
                             {{u"HttpHost"_s, profile.HttpHost},
                              {u"HttpTikiya"_s, profile.HttpTikiya},
                              {u"HttpScriptPath"_s, profile.HttpScriptPath}}});
    checkCouponSizes(reader, deployment);
    if (profile.mail.setUp())
        checkFilled(
            reader,
            {u"Mail.Server"_s, u"given"_s, u"Mail"_s, {{u"From"_s, profile.mail.from}, {u"To"_s, profile.mail.to}}});
}

LabFileReading failed(const QString& error) {
    LabFileReading reading;
    reading.errors += error;
    return reading;
}

bool holdsPassword(const QByteArray& bytes) {
    static const QRegularExpression line(u"^\\s*password\\s*=\\s*\\S"_s, QRegularExpression::CaseInsensitiveOption |
                                                                             QRegularExpression::MultilineOption);
    return line.match(QString::fromUtf8(bytes)).hasMatch();
}

} // namespace

LabFileReading ParseLabFile(const QByteArray& bytes, const QString& fileName) {
    if (bytes.size() > largestFile)
        return failed(u"%1: the file is larger than 1 MiB"_s.arg(fileName));
    QStringDecoder decoder(QStringDecoder::Utf8);
    const QString text = decoder(bytes);
    if (decoder.hasError())
        return failed(u"%1: the file is not UTF-8 text; save it as UTF-8"_s.arg(fileName));
    std::vector<IniReader::Key> known;
    for (const LabKey& key : labKeys())
        known.push_back({key.section, key.name});
    LabFileReading reading;
    IniReader reader(fileName, std::move(known));
    reader.read(text,
                [&](std::size_t key, const QString& value) { return take(reading.deployment, labKeys()[key], value); });
    checkTogether(reader, reading.deployment);
    reading.errors = reader.errors();
    return reading;
}

LabFileReading ReadLabFile(const HostPath& file) {
    const QString name = toText(file);
    QFile opened(name);
    const bool folder = QFileInfo(name).isDir();
    if (folder || !opened.open(QIODevice::ReadOnly))
        return failed(u"%1: can't be read: %2"_s.arg(name, folder ? u"it is a folder"_s : opened.errorString()));
    const QByteArray bytes = opened.read(largestFile + 1);
    LabFileReading reading = ParseLabFile(bytes, name);
    if (holdsPassword(bytes) && (opened.permissions() & (QFile::ReadGroup | QFile::ReadOther)) != QFile::Permissions())
        reading.warnings +=
            u"%1: others on this machine can read the password of a server; set the rights with: chmod 600 %1"_s.arg(
                name);
    return reading;
}

std::vector<HostPath> labFilePlaces(const HostPath& programFolder) {
    const HostPath configFolder = userFolder("XDG_CONFIG_HOME", ".config");
    return {programFolder / "lab.ini", "/etc/lumora/lab.ini", configFolder / "lumora" / "lab.ini"};
}

std::optional<HostPath> FindLabFile(const std::vector<HostPath>& places) {
    for (const HostPath& place : places) {
        std::error_code unimportant;
        if (std::filesystem::exists(place, unimportant))
            return place;
    }
    return std::nullopt;
}

} // namespace lumora
