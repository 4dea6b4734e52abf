#include "station/StationCheck.h"

#include "common/HostFile.h"
#include "editing/render/FrameLists.h"
#include "imaging/drawing/Drawing.h"
#include "platform/QueuePrinter.h"
#include "platform/line/HostReach.h"
#include "platform/line/SmtpMail.h"
#include "session/Workspace.h"
#include "session/lab/ClientProfile.h"

#include <QDateTime>
#include <QDir>
#include <QFontDatabase>
#include <QTemporaryDir>

#include <sys/timex.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

using enum CheckLine::State;

// Bytes. An order of 300 pictures takes about one and a half gigabytes while it is prepared.
constexpr qint64 littleSpace = 5'000'000'000;
constexpr qint64 noSpace = 500'000'000;

QString gigabytes(qint64 bytes) {
    return u"%1 GB"_s.arg(static_cast<double>(bytes) / 1e9, 0, 'f', 1);
}

// The line ends of the probe grow or shrink on a server that changes what it takes.
const QByteArray probe = "a line\nanother\r\nthe last\r";

QString tlsAdvice(TlsFault fault) {
    switch (fault) {
    case TlsFault::WrongHost:
        return u"write the host as the certificate names it, or ask the lab for a certificate with this name; if "
               "neither is wrong, somebody else answers in the lab's place"_s;
    case TlsFault::Expired:
        return u"ask the lab for a new certificate; is this machine's clock right?"_s;
    case TlsFault::NotYetValid:
        return u"this machine's clock may be wrong: timedatectl set-ntp true"_s;
    case TlsFault::SelfSigned:
    case TlsFault::UnknownAuthority:
        return u"if the certificate is the lab's own, ask the lab for its file and name that with [Server] Ca; else "
               "install the package ca-certificates, or ask the lab for the whole chain"_s;
    case TlsFault::NoAuthorities:
        return u"[Server] Ca has to name a PEM file that the program's user may read"_s;
    case TlsFault::NotOffered:
    case TlsFault::DataNotEncrypted:
        return u"ask the lab whether this server encrypts, and at which port; nothing is sent in plain text instead"_s;
    case TlsFault::TooOld:
        return u"ask the lab for TLS 1.2 or newer"_s;
    case TlsFault::NotTrusted:
        return u"show this line to the lab"_s;
    }
    return {};
}

QString connectAdvice(const Failure& failure) {
    if (failure.tls)
        return tlsAdvice(*failure.tls);
    switch (failure.kind) {
    case Failure::Kind::Unsupported:
        return u"set [Server] Tls = explicit, or implicit where the lab says so"_s;
    case Failure::Kind::Refused:
        return u"compare [Server] User and Password with what the lab has given out"_s;
    default:
        return u"is this machine on line, and is [Server] Host right? A firewall may hold port 21"_s;
    }
}

} // namespace

StationCheck::StationCheck(const LabFileReading& lab, const HostPath& dataFolder, const HostPath& doorProgram,
                           Internet& line, Tell tell)
    : m_lab(lab)
    , m_dataFolder(dataFolder)
    , m_doorProgram(doorProgram)
    , m_drives(dataFolder, lab.deployment.programLetter)
    , m_files(m_drives)
    , m_line(line)
    , m_tell(std::move(tell)) {
    m_state.DiskRoot = m_drives.programRoot();
    LoadDefaultProfile(m_state, lab.deployment);
}

void StationCheck::tell(CheckLine::State state, const QString& subject, const QString& text, const QString& advice) {
    m_good = m_good && state != Fault;
    m_tell({state, subject, text, advice});
}

bool StationCheck::run(const HostPath& labFile, Server server) {
    checkLabFile(labFile);
    checkDisk();
    checkFrames();
    checkFonts();
    checkTexts();
    checkDoor();
    checkPrinter();
    checkClock();
    if (!m_lab.errors.isEmpty()) {
        tell(Look, u"server"_s, u"not tried, since the lab's file can't be used"_s);
        return false;
    }
    checkHosts();
    if (m_lab.deployment.TachanaMekomit)
        tell(Good, u"server"_s, u"none: a local station keeps its orders"_s);
    else if (m_lab.deployment.SugSheliach == Sender::Http)
        tellHttp(server);
    else
        checkServer(server);
    checkPlainText();
    return m_good;
}

void StationCheck::checkLabFile(const HostPath& labFile) {
    if (labFile.empty()) {
        tell(Look, u"lab.ini"_s, u"there is none, the built-in values hold"_s,
             u"\"lumora --help\" names where it may lie; /usr/share/lumora/lab.ini.example is an example"_s);
        return;
    }
    const bool locked = ::access(labFile.c_str(), R_OK) != 0 && errno == EACCES;
    for (const QString& error : m_lab.errors)
        tell(Fault, u"lab.ini"_s, error,
             !locked ? u"the program does not start before this line is right"_s
                     : u"try it as the user to whom the file belongs (sudo -u NAME lumora --check); if that is not the "
                       "one who runs the program: chown"_s);
    for (const QString& warning : m_lab.warnings)
        tell(Fault, u"lab.ini"_s, warning);
    if (m_lab.errors.isEmpty() && m_lab.warnings.isEmpty())
        tell(Good, u"lab.ini"_s, toText(labFile));
    if (m_lab.errors.isEmpty() && !m_lab.deployment.Careful)
        tell(Look, u"guards"_s, u"[Guards] Careful is no: an order can be lost where the built-in behaviour loses it"_s,
             u"set [Guards] Careful = yes"_s);
}

void StationCheck::checkDisk() {
    std::error_code error;
    std::filesystem::create_directories(m_dataFolder, error);
    const QTemporaryDir written(toText(m_dataFolder) + u"/.check-XXXXXX"_s);
    const QString folder = toText(m_dataFolder);
    if (!written.isValid()) {
        tell(Fault, u"data folder"_s, u"%1: nothing can be written there: %2"_s.arg(folder, written.errorString()),
             u"give the program's user the right to write there, or name another folder with [Drives] DataFolder"_s);
        return;
    }
    const Result<qint64> free = m_files.freeBytes(m_state.DiskRoot);
    if (!free) {
        tell(Fault, u"data folder"_s, free.failure().message,
             u"is the disk with this folder there and mounted? df tells"_s);
        return;
    }
    const QString text = u"%1, %2 are free"_s.arg(folder, gigabytes(*free));
    if (*free >= littleSpace)
        tell(Good, u"data folder"_s, text);
    else
        tell(*free < noSpace ? Fault : Look, u"data folder"_s, text,
             u"a large order takes 1.5 GB: remove what is not needed on this disk"_s);
}

void StationCheck::checkFrames() {
    const DrivePath folder = WorkspacePaths::misgarot(m_state);
    const FrameLists frames(m_files, folder);
    int count = 0;
    for (const QString& category : frames.categories())
        count += static_cast<int>(frames.names(category, FrameLists::ListFile::Bmp).size());
    if (count > 0)
        tell(Good, u"frames"_s, u"%1"_s.arg(count));
    else
        tell(Look, u"frames"_s, u"none: the editor offers no frame"_s,
             u"put the lab's frames into %1, a folder for each category"_s.arg(
                 toText(m_files.host(folder).ok() ? *m_files.host(folder) : m_dataFolder)));
}

void StationCheck::checkTexts() {
    const LabTexts& texts = m_lab.deployment.texts;
    for (const QString& file : {texts.terms, texts.priceList, texts.help}) {
        if (!file.isEmpty() && !QFile(file).open(QIODevice::ReadOnly))
            tell(
                Look, u"texts"_s, u"%1 can't be read: customers are told to ask the staff"_s.arg(file),
                u"compare the keys of [Texts] with where the files lie; the program's user must be able to read them"_s);
    }
}

void StationCheck::checkFonts() {
    if (installedFamily(u"David"_s).isEmpty())
        tell(Fault, u"fonts"_s, u"David is missing: captions and the order sheet are drawn without their text"_s,
             u"install the package culmus"_s);
    else if (!QFontDatabase::hasFamily(u"Noto Sans Hebrew"_s))
        tell(Look, u"fonts"_s, u"Noto Sans Hebrew is missing: the pages take another Hebrew face"_s,
             u"install the package fonts-noto-core"_s);
    else
        tell(Good, u"fonts"_s, u"those of the pages and of the prints are there"_s);
}

void StationCheck::checkDoor() {
    if (!m_lab.deployment.door.everyFormat)
        return;
    std::error_code error;
    if (std::filesystem::exists(m_doorProgram, error))
        tell(Good, u"formats"_s, toText(m_doorProgram));
    else
        tell(Fault, u"formats"_s, u"%1 is missing: pictures of phones can't be ordered"_s.arg(toText(m_doorProgram)),
             u"install the program anew, or set [Door] Formats = jpg"_s);
}

void StationCheck::checkPrinter() {
    const QString& wanted = m_lab.deployment.kiosk.printer;
    if (wanted.isEmpty())
        return;
    const QString subject = u"slips"_s;
    const Result<QStringList> queues = QueuePrinter::queues();
    if (!queues)
        tell(Look, subject, queues.failure().message,
             queues.failure().kind == Failure::Kind::NoProgram
                 ? u"install the package cups-client"_s
                 : u"no slip is printed: is the print service on? systemctl status cups"_s);
    else if (!queues->contains(wanted))
        tell(Look, subject, u"there is no print queue %1, and no slip is printed"_s.arg(wanted),
             queues->isEmpty() ? u"set the printer up; the system knows no queue"_s
                               : u"set [Kiosk] Printer to one of these: %1"_s.arg(queues->join(u", "_s)));
    else
        tell(Good, subject, u"the print queue %1 is there"_s.arg(wanted));
}

void StationCheck::checkClock() {
    const QString now = QDateTime::currentDateTime().toString(u"yyyy-MM-dd HH:mm"_s);
    timex answer{};
    // adjtimex(2): without a time server the kernel tells TIME_ERROR.
    if (::adjtimex(&answer) == TIME_ERROR)
        tell(Look, u"clock"_s, u"%1, and no time server sets it; orders bear its day and hour"_s.arg(now),
             u"compare it, and let it be set: timedatectl set-ntp true"_s);
    else
        tell(Good, u"clock"_s, now);
}

void StationCheck::checkHosts() {
    const ClientProfile& lab = m_state.profile;
    struct Host {
        const char* key;
        QString address;
        quint16 port = 0; // of an address without a scheme
    };
    QList<Host> hosts;
    const bool byHttp = m_lab.deployment.SugSheliach == Sender::Http;
    if (lab.ReportOn > 0) {
        hosts += {"[Addresses] Report", lab.ReportUrl};
        hosts += byHttp ? Host{"[Addresses] HttpDone", lab.HttpDoneUrl} : Host{"[Addresses] Done", lab.DoneUrl};
    }
    if (byHttp)
        hosts += {"[Addresses] HttpHost", lab.HttpHost};
    if (lab.mail.setUp())
        hosts += {"[Mail] Server", lab.mail.host, SmtpPort(lab.mail)};
    for (const Host& host : hosts) {
        const QString key = QString::fromLatin1(host.key);
        const Result<void> reached = ReachHost(host.address, host.port, m_lab.deployment.encryption);
        if (reached) {
            tell(Good, key, u"answers at its port"_s);
            continue;
        }
        tell(Fault, key, reached.failure().message,
             reached.failure().tls ? tlsAdvice(*reached.failure().tls)
                                   : u"is this machine on line, and is the address right?"_s);
    }
}

// What anybody on the way to the lab can read.
void StationCheck::checkPlainText() {
    const ClientProfile& lab = m_state.profile;
    const bool byHttp = m_lab.deployment.SugSheliach == Sender::Http;
    const auto isPlain = [](const QString& address) { return address.startsWith(u"http://"_s, Qt::CaseInsensitive); };
    const bool sends = !m_lab.deployment.TachanaMekomit;
    QStringList plain;
    if (sends && (byHttp ? isPlain(lab.HttpHost) : m_lab.deployment.encryption.ftp == FtpTls::None))
        plain += byHttp ? u"orders"_s : u"user, password and orders"_s;
    if (sends && lab.ReportOn > 0 && (isPlain(lab.ReportUrl) || isPlain(byHttp ? lab.HttpDoneUrl : lab.DoneUrl)))
        plain += u"reports with the customer's name and telephone"_s;
    if (lab.mail.setUp() && lab.mail.encryption == MailEncryption::None)
        plain += u"mail with the customer's files"_s;
    if (!plain.isEmpty())
        tell(Look, u"encryption"_s, u"in plain text go %1"_s.arg(plain.join(u", "_s)),
             u"set [Server] Tls, [Mail] Tls and https:// addresses where the lab has them, or take a VPN"_s);
    else if (sends)
        tell(Good, u"encryption"_s, u"what goes to the lab is encrypted"_s);
}

// What HTTP takes are whole orders, so that no probe can be put there.
void StationCheck::tellHttp(Server server) {
    const QString text = u"orders go by HTTP, to the host that was tried above; the FTP server is not tried"_s;
    if (server == Server::IsRead)
        tell(Good, u"server"_s, text);
    else
        tell(Look, u"server"_s, text + u", and nothing was written"_s,
             u"make one order by hand, and look at what the lab got of it"_s);
}

void StationCheck::checkServer(Server server) {
    const QString subject = u"server"_s;
    const ClientProfile& lab = m_state.profile;
    const auto connection =
        m_line.connectFtp(lab.FtpServer, lab.FtpUser, lab.FtpPassword, Internet::DataChannel::Passive);
    if (!connection) {
        tell(Fault, subject, connection.failure().message, connectAdvice(connection.failure()));
        return;
    }
    tell(Good, subject, u"%1 answers, and takes user and password"_s.arg(lab.FtpServer));
    for (const QString& folder : {lab.FtpFolder1, lab.FtpFolder2}) {
        if (folder.isEmpty())
            continue;
        if (const auto entered = (*connection)->setCurrentDirectory(folder); !entered) {
            tell(Fault, u"folder"_s, u"%1 can't be entered: %2"_s.arg(folder, entered.failure().message),
                 u"compare [Server] Folder1 and Folder2 with what the lab has given out"_s);
            return;
        }
    }
    const auto listing = (*connection)->list(u"*.*"_s, EmptyFolder::MayBeRefused);
    const QString typeAndList = u"TYPE %1 and LIST"_s.arg(m_lab.deployment.ftpType == FtpType::Ascii ? u"A"_s : u"I"_s);
    if (!listing) {
        tell(Fault, u"folder"_s, u"%1: %2"_s.arg(typeAndList, listing.failure().message),
             u"without a listing no order is proven to have arrived: ask the lab"_s);
        return;
    }
    if (!listing->unread.isEmpty()) {
        tell(Fault, u"folder"_s, u"the server lists in a form that can't be read"_s,
             u"without a listing no order is proven to have arrived: ask the lab for another form"_s);
        return;
    }
    tell(Good, u"folder"_s,
         u"%1 are taken; %2 names in the folder of the orders"_s.arg(typeAndList).arg(listing->entries.size()));
    if (server == Server::IsWritten)
        checkProbe(**connection);
}

void StationCheck::checkProbe(FtpConnection& connection) {
    const QString subject = u"writing"_s;
    const QTemporaryDir folder;
    const HostPath file = toHostPath(folder.filePath(u"probe"_s));
    if (const auto made = writeWholeFile(file, probe); !made) {
        tell(Fault, subject, made.failure().message,
             u"the probe is written here first: is the disk of %1 full?"_s.arg(QDir::tempPath()));
        return;
    }
    const QString name = u"lumora-check-%1.txt"_s.arg(QDateTime::currentMSecsSinceEpoch());
    if (const auto put = connection.put(file, name); !put) {
        tell(Fault, subject, put.failure().message, u"the account must be allowed to make files and folders there"_s);
        return;
    }
    std::optional<qint64> length;
    if (const auto listing = connection.list(u"*.*"_s)) {
        for (const FtpEntry& entry : listing->entries) {
            if (entry.name == name)
                length = entry.length;
        }
    }
    const auto removed = connection.remove(name);
    if (!length)
        tell(Fault, subject, u"%1 was taken, and the listing does not show it with its length"_s.arg(name),
             u"without it no order is proven to have arrived: ask the lab"_s);
    else if (*length != probe.size())
        tell(Fault, subject, u"the server has changed the file's line ends: each print arrives damaged"_s,
             u"set [Server] Type = I"_s);
    else
        tell(Good, subject, u"a probe file arrived as it is"_s);
    if (!removed)
        tell(Look, subject, u"%1 can't be deleted: %2"_s.arg(name, removed.failure().message),
             u"delete it by hand; a broken file of an order can't be deleted either"_s);
}

} // namespace lumora
