#include "support/MailServer.h"

#include <QElapsedTimer>
#include <QFile>
#include <QThread>

#include <unistd.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

// A mail server is started by root and then runs as a user of its own.
QStringList asRoot(const QStringList& command) {
    return ::geteuid() == 0 ? command : QStringList{u"sudo"_s, u"-n"_s} + command;
}

QByteArray outputOf(QStringList command) {
    QProcess process;
    process.start(command.takeFirst(), command);
    return process.waitForFinished(60'000) ? process.readAllStandardOutput() : QByteArray();
}

// Unencrypted the server offers challenge and response besides the password; encrypted it takes the password alone, by
// another command on each port. So a test can use each way of logging in.
const char* const configuration = R"(primary_hostname = mail.lab.example
spool_directory = %1/spool
log_file_path = %1/log/%slog
pid_file_path = %1/spool/pid
local_interfaces = 127.0.0.1
daemon_smtp_ports = %2 : %3
tls_on_connect_ports = %3
tls_certificate = %1/authority.pem
tls_privatekey = %1/key.pem
tls_advertise_hosts = %4
message_size_limit = %5
check_spool_space = %6
check_spool_inodes = 0
deliver_drop_privilege = true
host_lookup =
rfc1413_query_timeout = 0s
keep_environment =
acl_smtp_rcpt = recipient
begin acl
recipient:
  deny !authenticated = *
       message = log in first
  require verify = recipient
  accept
begin routers
box:
  driver = accept
  domains = lab.example
  local_parts = orders
  transport = box
begin transports
box:
  driver = appendfile
  file = %1/box/orders
begin authenticators
proof:
  driver = cram_md5
  public_name = CRAM-MD5
  server_advertise_condition = ${if eq{$tls_in_cipher}{}}
  server_secret = ${if eq{$auth1}{%7}{%8}fail}
  server_set_id = $auth1
plain:
  driver = plaintext
  public_name = PLAIN
  server_advertise_condition = ${if eq{$received_port}{%2}}
  server_condition = ${if and{{eq{$auth2}{%7}}{eq{$auth3}{%8}}}}
  server_set_id = $auth2
login:
  driver = plaintext
  public_name = LOGIN
  server_prompts = Username:: : Password::
  server_advertise_condition = ${if eq{$received_port}{%3}}
  server_condition = ${if and{{eq{$auth1}{%7}}{eq{$auth2}{%8}}}}
  server_set_id = $auth1
)";

} // namespace

MailServer::MailServer(Disk disk, Encryption encryption) {
    // The server's own user works in here.
    const auto open = static_cast<QFile::Permissions>(0x7777);
    QFile::setPermissions(m_folder.path(), static_cast<QFile::Permissions>(0x7711));
    for (const char* name : {"spool", "log", "box"}) {
        const QString path = m_folder.filePath(QLatin1String(name));
        std::filesystem::create_directory(toHostPath(path));
        QFile::setPermissions(path, open);
    }
    if (makeCertificate())
        start({&m_port, &m_tlsPort}, [&] {
            return asRoot({u"/usr/sbin/exim4"_s, u"-C"_s, configure(disk, encryption), u"-bdf"_s});
        });
}

MailServer::~MailServer() {
    m_server.terminate();
    m_server.waitForFinished(5'000);
    // QTemporaryDir does not remove the files of the server's user.
    outputOf(asRoot({u"rm"_s, u"-rf"_s, m_folder.path()}));
}

QString MailServer::configure(Disk disk, Encryption encryption) const {
    const QString path = m_folder.filePath(u"exim.conf"_s);
    const MailAccount known = account();
    QString text = QLatin1String(configuration);
    const QString values[] = {m_folder.path(), QString::number(m_port), QString::number(m_tlsPort),
                              encryption == Encryption::Offered ? u"*"_s : QString(), QString::number(largestMessage),
                              // The full server asks for more free space than any disk has.
                              disk == Disk::Full ? u"1000000G"_s : u"0"_s, known.user, known.password};
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
