#include "support/OtherFtpServer.h"

#include "support/LabServers.h"

#include <QFile>

#include <unistd.h>

namespace lumora {
namespace {

QString unpacked() {
    return qEnvironmentVariable("LUMORA_FTP_SERVERS");
}

QString find(const QString& program) {
    for (const QString& root : {unpacked(), QString()}) {
        if (QFile::exists(root + program))
            return root + program;
    }
    return {};
}

} // namespace

OtherFtpServer::OtherFtpServer(Make make) {
    std::filesystem::create_directory(account());
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    if (!unpacked().isEmpty())
        environment.insert(u"LD_LIBRARY_PATH"_s, unpacked() + u"/usr/lib/x86_64-linux-gnu"_s);
    m_server.setProcessEnvironment(environment);
    m_server.setProcessChannelMode(QProcess::MergedChannels);
    for (int attempt = 0; attempt < 3; ++attempt) {
        m_port = FreePort();
        const QStringList arguments = prepare(make);
        if (absent())
            return;
        m_server.start(m_program, arguments);
        if (ComesUp(m_server, m_port))
            return;
    }
    m_failure = u"%1 did not start: %2"_s.arg(m_program, QString::fromUtf8(m_server.readAll()));
}

OtherFtpServer::~OtherFtpServer() {
    if (m_server.state() != QProcess::NotRunning) {
        m_server.kill();
        m_server.waitForFinished(5'000);
    }
    // QTemporaryDir does not remove names whose bytes are no text.
    std::error_code error;
    std::filesystem::remove_all(account(), error);
}

QStringList OtherFtpServer::prepare(Make make) {
    switch (make) {
    case Make::ProFtpd:
        return prepareProFtpd();
    case Make::PureFtpd:
        return preparePureFtpd();
    case Make::PyFtpd:
        break;
    }
    // Debian's own interpreter: another python in the path would not have the module.
    m_program = u"/usr/bin/python3"_s;
    return {u"-m"_s,   u"pyftpdlib"_s, u"-i"_s,           u"127.0.0.1"_s, u"-p"_s, QString::number(m_port),
            u"-w"_s,   u"-d"_s,        toText(account()), u"-u"_s,        user(),  u"-P"_s,
            password()};
}

QString OtherFtpServer::run(const QString& program, const QStringList& arguments) const {
    QProcess process;
    process.setProcessEnvironment(m_server.processEnvironment());
    process.start(program, arguments);
    process.waitForFinished();
    return QString::fromUtf8(process.readAllStandardOutput()).trimmed();
}

void OtherFtpServer::write(const QString& name, const QString& text) const {
    QFile file(m_folder.filePath(name));
    if (file.open(QIODevice::WriteOnly))
        file.write(text.toUtf8());
    file.setPermissions(QFile::ReadOwner | QFile::WriteOwner);
}

// Without chroot, so that PWD tells the whole path.
QStringList OtherFtpServer::prepareProFtpd() {
    m_program = find(u"/usr/sbin/proftpd"_s);
    const QString hash = run(u"openssl"_s, {u"passwd"_s, u"-6"_s, password()});
    write(u"passwd"_s,
          u"%1:%2:%3:%4::%5:/bin/false\n"_s.arg(user(), hash).arg(::getuid()).arg(::getgid()).arg(toText(account())));
    write(u"group"_s, u"%1:x:%2:\n"_s.arg(user()).arg(::getgid()));
    QString text =
        u"ServerName lab\nServerType standalone\nDefaultAddress 127.0.0.1\nSocketBindTight on\nPort %1\n"
        "UseIPv6 off\nUseReverseDNS off\nUser nobody\nGroup nogroup\nRootLogin on\nRequireValidShell off\n"
        "AuthOrder mod_auth_file.c\nAuthUserFile %2/passwd\nAuthGroupFile %2/group\nAllowOverwrite on\n"
        "TimeoutLinger 60\nWtmpLog off\nDelayEngine off\nPidFile %2/pid\nSystemLog %2/log\nScoreboardFile %2/score\n"
        "<IfModule mod_ctrls.c>\nControlsEngine off\n</IfModule>\n"_s.arg(QString::number(m_port), m_folder.path());
    if (::getuid() != 0)
        text.replace(u"User nobody\nGroup nogroup\n"_s,
                     u"User %1\nGroup %2\n"_s.arg(run(u"id"_s, {u"-un"_s}), run(u"id"_s, {u"-gn"_s})));
    write(u"conf"_s, text);
    return {u"-n"_s, u"-c"_s, m_folder.filePath(u"conf"_s)};
}

QStringList OtherFtpServer::preparePureFtpd() {
    if (::getuid() != 0)
        return {};
    m_program = find(u"/usr/sbin/pure-ftpd"_s);
    const QString hash = run(u"openssl"_s, {u"passwd"_s, u"-6"_s, password()});
    // It refuses the account of root.
    write(u"passwd"_s, u"%1:%2:65534:65534::%3/./::::::::::::\n"_s.arg(user(), hash, toText(account())));
    std::filesystem::permissions(account(), std::filesystem::perms::all);
    run(find(u"/usr/bin/pure-pw"_s), {u"mkdb"_s, m_folder.filePath(u"db"_s), u"-f"_s, m_folder.filePath(u"passwd"_s)});
    return {u"-S"_s, u"127.0.0.1,%1"_s.arg(m_port),
            u"-l"_s, u"puredb:"_s + m_folder.filePath(u"db"_s),
            u"-H"_s, u"-E"_s,
            u"-u"_s, u"100"_s,
            u"-g"_s, m_folder.filePath(u"pid"_s)};
}

} // namespace lumora
