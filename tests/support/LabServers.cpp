#include "support/LabServers.h"

#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>
#include <Poco/Timespan.h>

#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QThread>

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

} // namespace

bool ComesUp(QProcess& server, quint16 port) {
    QElapsedTimer waiting;
    waiting.start();
    while (server.state() != QProcess::NotRunning && waiting.elapsed() < 60'000) {
        if (answers(port))
            return true;
        server.waitForFinished(20);
    }
    return false;
}

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
    m_server.setProcessChannelMode(QProcess::MergedChannels);
    const QString configuration = m_folder.filePath(u"lighttpd.conf"_s);
    for (int attempt = 0; attempt < 3; ++attempt) {
        m_port = FreePort();
        QFile file(configuration);
        if (!file.open(QIODevice::WriteOnly))
            break;
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
        file.close();
        m_server.start(u"/usr/sbin/lighttpd"_s, {u"-D"_s, u"-f"_s, configuration});
        if (ComesUp(m_server, m_port))
            return;
    }
    m_failure = u"lighttpd did not start: "_s + QString::fromUtf8(m_server.readAll());
}

SecondWebServer::~SecondWebServer() {
    if (m_server.state() != QProcess::NotRunning) {
        m_server.terminate();
        if (!m_server.waitForFinished(5'000))
            m_server.kill();
        m_server.waitForFinished(5'000);
    }
}

} // namespace lumora
