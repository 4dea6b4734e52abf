#include "support/LabServers.h"

#include "common/HostFile.h"

#include <Poco/Net/ServerSocket.h>

#include <QElapsedTimer>
#include <QThread>

namespace lumora {
namespace {

QString script(const char* name) {
    return QStringLiteral(LUMORA_LAB_SCRIPTS "/") + QLatin1String(name);
}

QByteArrayList linesOf(const HostPath& path) {
    QByteArrayList lines = std::filesystem::exists(path) ? contentOf(path).split('\n') : QByteArrayList();
    if (!lines.isEmpty() && lines.last().isEmpty())
        lines.removeLast();
    return lines;
}

} // namespace

QByteArray contentOf(const HostPath& path) {
    const Result<QByteArray> read = readWholeFile(path, toText(path), 1 << 30);
    return read ? *read : QByteArray("<absent>");
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

} // namespace lumora
