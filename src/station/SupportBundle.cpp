#include "station/SupportBundle.h"

#include "common/HostFile.h"
#include "common/StationLog.h"
#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "session/lab/IniReader.h"
#include "session/lab/LabKeys.h"
#include "station/LogFile.h"

#include <QDateTime>
#include <QProcess>
#include <QSysInfo>

#include <Poco/DateTime.h>
#include <Poco/Exception.h>
#include <Poco/Zip/Compress.h>

#include <array>
#include <fstream>
#include <sstream>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 largestLabFile = 1024 * 1024;
constexpr qint64 largestLog = 8 * 1024 * 1024;
constexpr int longestReading = 60000; // milliseconds, of the journal

bool isSecret(const LabKey& key) {
    return key.name == u"Password"_s || (key.section == u"Kiosk"_s && key.name == u"Code"_s);
}

// An address may bear a user and a password in front of its host (RFC 3986, section 3.2.1).
QString withoutUser(const QString& value) {
    const qsizetype host = value.lastIndexOf(u'@');
    if (host < 0 || !value.first(host).contains(u':'))
        return value;
    const qsizetype scheme = value.indexOf(u"://"_s);
    return (scheme >= 0 && scheme < host ? value.first(scheme + 3) : QString()) + u"(set)"_s + value.sliced(host);
}

QString phaseWord(OrderState::Phase phase) {
    static constexpr std::array<const char*, 5> words = {"preparing", "prepared", "sending", "arrived", "reported"};
    return QString::fromLatin1(words[static_cast<std::size_t>(phase)]);
}

} // namespace

SupportBundle::SupportBundle(HostPath labFile, HostPath dataFolder, HostPath log)
    : m_labFile(std::move(labFile))
    , m_dataFolder(std::move(dataFolder))
    , m_log(std::move(log)) {}

QByteArray SupportBundle::versions() const {
    QString text = u"lumora %1\nQt %2\n%3, %4\n%5\n"_s.arg(
        QStringLiteral(LUMORA_VERSION), QString::fromLatin1(qVersion()), QSysInfo::prettyProductName(),
        QSysInfo::kernelVersion(), QDateTime::currentDateTime().toString(Qt::ISODate));
    std::error_code error;
    const auto space = std::filesystem::space(m_dataFolder, error);
    text += error ? u"data folder: %1\n"_s.arg(QString::fromStdString(error.message()))
                  : u"data folder: %1 bytes free of %2\n"_s.arg(space.available).arg(space.capacity);
    return text.toUtf8();
}

QByteArray SupportBundle::labText(const QByteArray& labFile) {
    std::vector<IniReader::Key> known;
    for (const LabKey& key : labKeys())
        known.push_back({key.section, key.name});
    QString text;
    IniReader reader(u"lab.ini"_s, std::move(known));
    reader.read(QString::fromUtf8(labFile), [&](std::size_t index, const QString& value) {
        const LabKey& key = labKeys()[index];
        const QString hidden = value.isEmpty() ? u"(empty)"_s : u"(set)"_s;
        text +=
            u"%1 = %2\n"_s.arg(IniReader::fullName(key.section, key.name), isSecret(key) ? hidden : withoutUser(value));
        return QString();
    });
    for (const QString& error : reader.errors())
        text += error + u'\n';
    return text.toUtf8();
}

QByteArray SupportBundle::lab() const {
    if (m_labFile.empty())
        return "there is no lab.ini, the built-in values hold\n";
    const auto read = readWholeFile(m_labFile, toText(m_labFile), largestLabFile);
    return read ? labText(*read) : read.failure().message.toUtf8() + '\n';
}

QByteArray SupportBundle::journalText(const QByteArray& lines) {
    QByteArray text;
    for (const QByteArray& line : lines.split('\n')) {
        // "TIME PROGRAM[NUMBER]: WORDS"
        const qsizetype words = line.indexOf(": ") + 2;
        if (words > 1)
            text += line.first(words) + withoutCustomer(QString::fromUtf8(line.sliced(words))).toUtf8() + '\n';
    }
    return text;
}

QByteArray SupportBundle::journal() {
    QProcess reader;
    reader.start(u"journalctl"_s, {u"--quiet"_s, u"--no-pager"_s, u"--no-hostname"_s, u"--output=short-iso"_s,
                                   u"--lines=50000"_s, u"--since=-30days"_s, u"--unit=lumora-kiosk"_s});
    if (!reader.waitForFinished(longestReading)) {
        reader.kill();
        reader.waitForFinished();
        return {};
    }
    return journalText(reader.readAllStandardOutput());
}

QByteArray SupportBundle::orders() const {
    const LabFileReading lab = m_labFile.empty() ? LabFileReading() : ReadLabFile(m_labFile);
    const Drives drives(m_dataFolder, lab.deployment.programLetter);
    const Files files(drives);
    SessionState state;
    state.DiskRoot = drives.programRoot();
    const DrivePath all = WorkspacePaths::orders(state);
    QString text = u"order, phase, files, bytes\n"_s;
    for (const QString& name : files.folders(all)) {
        const OrderFolder folder(all / name);
        qint64 bytes = 0;
        const QStringList names = files.storedNames(folder.path(), u"*.*"_s);
        for (const QString& file : names)
            bytes += files.size(folder.filePath(file)).ok() ? *files.size(folder.filePath(file)) : 0;
        const Result<OrderState> order = ReadOrderState(files, folder);
        text += u"%1, %2, %3, %4\n"_s.arg(name, order ? phaseWord(order->phase) : u"not known"_s)
                    .arg(names.size())
                    .arg(bytes);
    }
    return text.toUtf8();
}

Result<SupportBundle::Log> SupportBundle::write(const HostPath& target) const {
    std::error_code error;
    if (std::filesystem::exists(target, error))
        return Failure{Failure::Kind::Refused,
                       u"%1: there is a file of this name, and it stays as it is"_s.arg(toText(target))};
    try {
        std::ostringstream bytes;
        Poco::Zip::Compress zip(bytes, true);
        const auto add = [&zip](const std::string& name, const QByteArray& content) {
            std::istringstream source(content.toStdString());
            zip.addFile(source, Poco::DateTime(), Poco::Path(name));
        };
        add("versions.txt", versions());
        add("lab.txt", lab());
        add("orders.txt", orders());
        Log held = Log::Missing;
        for (const HostPath& log : LogFile::filesAt(m_log)) {
            if (const auto read = readWholeFile(log, toText(log), largestLog)) {
                add(log.filename().string(), *read);
                held = Log::Held;
            }
        }
        if (const QByteArray lines = journal(); !lines.isEmpty()) {
            add("journal.txt", lines);
            held = Log::Held;
        }
        zip.close();
        const auto written = writeWholeFile(target, QByteArray::fromStdString(bytes.str()));
        return written ? Result<Log>(held) : Result<Log>(written.failure());
    } catch (const Poco::Exception& exception) {
        return Failure{Failure::Kind::Other,
                       u"%1: %2"_s.arg(toText(target), QString::fromStdString(exception.displayText()))};
    }
}

} // namespace lumora
