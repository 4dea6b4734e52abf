#include "support/MailServer.h"

#include <Poco/Net/StreamSocket.h>
#include <Poco/Timespan.h>

#include <QElapsedTimer>
#include <QFile>
#include <QThread>

#include <unistd.h>

namespace lumora {
namespace {

// A mail server is started by root and then runs as a user of its own.
QStringList asRoot(const QStringList& command) {
    return ::geteuid() == 0 ? command : QStringList{u"sudo"_s, u"-n"_s} + command;
}

QByteArray outputOf(QStringList command) {
    QProcess process;
    process.start(command.takeFirst(), command);
    return process.waitForFinished(60'000) ? process.readAllStandardOutput() : QByteArray();
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

MailServer::MailServer() {
    // The server's own user works in here.
    const auto open = static_cast<QFile::Permissions>(0x7777);
    QFile::setPermissions(m_folder.path(), static_cast<QFile::Permissions>(0x7711));
    for (const char* name : {"spool", "log", "box"}) {
        const QString path = m_folder.filePath(QLatin1String(name));
        std::filesystem::create_directory(toHostPath(path));
        QFile::setPermissions(path, open);
    }
    if (makeCertificate())
        start();
}

void MailServer::start() {
    m_server.setProcessChannelMode(QProcess::MergedChannels);
    for (int attempt = 0; attempt < 3; ++attempt) {
        m_port = FreePort();
        m_tlsPort = FreePort();
        QStringList words = asRoot({u"/usr/sbin/exim4"_s, u"-C"_s, configure(), u"-bdf"_s});
        const QString program = words.takeFirst();
        m_server.start(program, words);
        if (comesUp(m_server, m_port) && comesUp(m_server, m_tlsPort))
            return;
    }
    m_failure = u"exim did not start: %1"_s.arg(QString::fromUtf8(m_server.readAll()));
}

MailServer::~MailServer() {
    m_server.terminate();
    if (!m_server.waitForFinished(5'000))
        m_server.kill();
    m_server.waitForFinished(5'000);
    // QTemporaryDir does not remove the files of the server's user.
    outputOf(asRoot({u"rm"_s, u"-rf"_s, m_folder.path()}));
}

QString MailServer::configure() const {
    const QString path = m_folder.filePath(u"exim.conf"_s);
    const MailAccount known = account();
    QFile form(QStringLiteral(LUMORA_EXIM_CONF));
    QString text = form.open(QIODevice::ReadOnly) ? QString::fromUtf8(form.readAll()) : QString();
    const QString values[] = {
        m_folder.path(), QString::number(m_port), QString::number(m_tlsPort), QString::number(largestMessage),
        known.user,      known.password};
    int number = 0;
    for (const QString& value : values)
        text.replace(u'%' + QString::number(++number), value);
    QFile file(path);
    if (file.open(QIODevice::WriteOnly | QIODevice::Truncate))
        file.write(text.toUtf8());
    file.close();
    // The server accepts only a file that belongs to the user who starts it and that no other user may write.
    file.setPermissions(static_cast<QFile::Permissions>(0x6644));
    outputOf(asRoot({u"chown"_s, u"root"_s, path}));
    return path;
}

bool MailServer::makeCertificate() {
    const QString key = m_folder.filePath(u"key.pem"_s);
    QProcess openssl;
    openssl.setProcessChannelMode(QProcess::MergedChannels);
    openssl.start(u"/usr/bin/openssl"_s,
                  {u"req"_s, u"-x509"_s, u"-newkey"_s, u"ec"_s, u"-pkeyopt"_s, u"ec_paramgen_curve:prime256v1"_s,
                   u"-nodes"_s, u"-days"_s, u"2"_s, u"-subj"_s, u"/CN=lab"_s, u"-addext"_s,
                   u"subjectAltName=IP:127.0.0.1"_s, u"-keyout"_s, key, u"-out"_s, authority()});
    if (!openssl.waitForFinished(60'000) || openssl.exitCode() != 0) {
        m_failure = u"openssl made no certificate: "_s + QString::fromUtf8(openssl.readAll());
        return false;
    }
    return QFile::setPermissions(key, static_cast<QFile::Permissions>(0x6644));
}

MailAccount MailServer::account(MailEncryption encryption) const {
    MailAccount account;
    account.host = u"127.0.0.1"_s;
    account.port = encryption == MailEncryption::Tls ? m_tlsPort : m_port;
    account.encryption = encryption;
    account.user = u"kiosk"_s;
    account.password = u"loopback lab"_s;
    account.from = u"kiosk@shop.example"_s;
    account.to = u"orders@lab.example"_s;
    return account;
}

QByteArray MailServer::mailbox() const {
    // The server delivers a message to the mailbox after it has accepted it.
    QElapsedTimer waiting;
    waiting.start();
    while (waiting.elapsed() < 60'000 && log().count(" <= ") > log().count(" Completed\n"))
        QThread::msleep(20);
    return outputOf(asRoot({u"cat"_s, m_folder.filePath(u"box/orders"_s)}));
}

QByteArray MailServer::log() const {
    return outputOf(asRoot({u"cat"_s, m_folder.filePath(u"log/mainlog"_s)}));
}

} // namespace lumora
