#include "support/LabServers.h"

#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>
#include <Poco/Timespan.h>

#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QThread>

#include <algorithm>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

QString script(const char* name) {
    return QStringLiteral(LUMORA_LAB_SCRIPTS "/") + QLatin1String(name);
}

QByteArray contentOf(const HostPath& path) {
    QFile file(toText(path));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

QByteArrayList linesOf(const HostPath& path) {
    QByteArrayList lines = contentOf(path).split('\n');
    if (!lines.isEmpty() && lines.last().isEmpty())
        lines.removeLast();
    return lines;
}

bool answers(quint16 port) {
    try {
        Poco::Net::StreamSocket socket;
        socket.connect(Poco::Net::SocketAddress("127.0.0.1", port), Poco::Timespan(1, 0));
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

// Waits until the server answers on its port; false when it ended, as on a port that another took meanwhile, or never
// answered.
bool comesUp(QProcess& server, quint16 port) {
    QElapsedTimer waiting;
    waiting.start();
    while (server.state() != QProcess::NotRunning && waiting.elapsed() < 60'000) {
        if (answers(port))
            return true;
        server.waitForFinished(20);
    }
    return false;
}

} // namespace

std::map<QString, QByteArray> FilesIn(const HostPath& folder) {
    std::map<QString, QByteArray> bytes;
    const QDir listed(toText(folder));
    for (const QString& name : listed.entryList(QDir::Files))
        bytes[name] = contentOf(toHostPath(listed.filePath(name)));
    return bytes;
}

quint16 FreePort() {
    const Poco::Net::ServerSocket socket(Poco::Net::SocketAddress("127.0.0.1", 0));
    return socket.address().port();
}

void ServerProcess::start(std::initializer_list<quint16*> ports, const std::function<QStringList()>& command) {
    m_server.setProcessChannelMode(QProcess::MergedChannels);
    for (int attempt = 0; attempt < 3; ++attempt) {
        for (quint16* port : ports)
            *port = FreePort();
        QStringList words = command();
        const QString program = words.takeFirst();
        m_server.start(program, words);
        if (std::all_of(ports.begin(), ports.end(), [&](const quint16* port) { return comesUp(m_server, *port); }))
            return;
    }
    m_failure = u"%1 did not start: %2"_s.arg(m_server.program(), QString::fromUtf8(m_server.readAll()));
}

ServerProcess::~ServerProcess() {
    if (m_server.state() == QProcess::NotRunning)
        return;
    m_server.terminate();
    if (!m_server.waitForFinished(5'000))
        m_server.kill();
    m_server.waitForFinished(5'000);
}

LabServers::LabServers() {
    QProcess start;
    start.setProcessChannelMode(QProcess::MergedChannels);
    start.start(script("start"), {m_folder.path()});
    if (!start.waitForFinished(60'000) || start.exitStatus() != QProcess::NormalExit || start.exitCode() != 0) {
        m_failure = u"the lab did not start: %1 %2"_s.arg(start.errorString(), QString::fromUtf8(start.readAll()));
        return;
    }
    for (const QByteArray& line : linesOf(folder() / "ports")) {
        const qsizetype sign = line.indexOf('=');
        (line.startsWith("FTP") ? m_ftpPort : m_httpPort) = line.mid(sign + 1).toUShort();
    }
    if (m_ftpPort == 0 || m_httpPort == 0)
        m_failure = u"the lab told no ports"_s;
}

LabServers::~LabServers() {
    QProcess stop;
    stop.start(script("stop"), {m_folder.path()});
    stop.waitForFinished(60'000);
    // QTemporaryDir does not remove names whose bytes are no text.
    std::error_code error;
    std::filesystem::remove_all(folder(), error);
}

QByteArrayList LabServers::requests(int atLeast) const {
    QElapsedTimer waiting;
    waiting.start();
    QByteArrayList lines = linesOf(folder() / "requests.log");
    while (lines.size() < atLeast && waiting.elapsed() < 60'000) {
        QThread::msleep(10);
        lines = linesOf(folder() / "requests.log");
    }
    return lines;
}

QByteArrayList LabServers::reports() const {
    return linesOf(folder() / "reports.log");
}

QByteArray LabServers::ftpLog() const {
    return contentOf(folder() / "log" / "ftp.log");
}

SecondWebServer::SecondWebServer() {
    std::filesystem::create_directory(uploads());
    start({&m_port}, [this] {
        QFile file(m_folder.filePath(u"lighttpd.conf"_s));
        if (file.open(QIODevice::WriteOnly))
            file.write(u"server.modules = ( \"mod_alias\", \"mod_cgi\", \"mod_setenv\" )\n"
                       "server.bind = \"127.0.0.1\"\n"
                       "server.port = %1\n"
                       "server.document-root = \"%2\"\n"
                       "server.upload-dirs = ( \"%3\" )\n"
                       "setenv.set-environment = ( \"LAB_FOLDER\" => \"%3\", \"REDIRECT_STATUS\" => \"200\" )\n"
                       "alias.url = ( \"/hazmanot/uploads/\" => \"%3/uploads/\" )\n"
                       "$HTTP[\"url\"] !~ \"^/hazmanot/uploads/\" {\n"
                       "  cgi.assign = ( \".php\" => \"/usr/bin/php-cgi\", \".asp\" => \"/usr/bin/php-cgi\" )\n"
                       "}\n"_s.arg(QString::number(m_port), QStringLiteral(LUMORA_LAB_SCRIPTS "/www"), m_folder.path())
                           .toUtf8());
        return QStringList{u"/usr/sbin/lighttpd"_s, u"-D"_s, u"-f"_s, file.fileName()};
    });
}

SecondFtpServer::SecondFtpServer() {
    std::filesystem::create_directory(account());
    // Debian's own interpreter: another python in the path would not have the module.
    start({&m_port}, [this] {
        return u"/usr/bin/python3 -m pyftpdlib -i 127.0.0.1 -w -u %1 -P %2 -p %3 -d %4"_s
            .arg(user(), password(), QString::number(m_port), toText(account()))
            .split(u' ');
    });
}

SecondFtpServer::~SecondFtpServer() {
    // Names of bytes that are no text are beyond the temporary folder's own removal.
    std::error_code error;
    std::filesystem::remove_all(account(), error);
}

} // namespace lumora
