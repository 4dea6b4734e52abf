#include "support/MailServer.h"

#include <QElapsedTimer>
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

} // namespace

MailServer::MailServer() {
    const MailAccount known = account();
    QStringList words = asRoot({QStringLiteral(LUMORA_MAIL_SERVER), m_folder.path(), QString::number(largestMessage),
                                known.user, known.password});
    const QString program = words.takeFirst();
    m_server.start(program, words);
    while (!m_server.canReadLine() && m_server.waitForReadyRead(120'000)) {
    }
    const QByteArrayList ports = m_server.readLine().trimmed().split(' ');
    m_port = ports.value(0).toUShort();
    m_tlsPort = ports.value(1).toUShort();
    if (m_tlsPort == 0)
        m_failure = u"exim did not start: "_s + QString::fromUtf8(m_server.readAllStandardError());
}

MailServer::~MailServer() {
    m_server.closeWriteChannel();
    m_server.waitForFinished(5'000);
    // QTemporaryDir does not remove the files of the server's user.
    outputOf(asRoot({u"rm"_s, u"-rf"_s, m_folder.path()}));
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
