#pragma once

#include "platform/files/HostPath.h"

#include <QProcess>
#include <QString>
#include <QTemporaryDir>

namespace lumora {

using namespace Qt::StringLiterals;

// A server of another make than the lab's own, over a temporary folder. Two of them can't be installed beside vsftpd:
// their packages, unpacked below LUMORA_FTP_SERVERS ("dpkg -x PACKAGE FOLDER"), serve as well, and pure-ftpd runs for
// root only.
class OtherFtpServer {
public:
    enum class Make { PyFtpd, ProFtpd, PureFtpd };

    explicit OtherFtpServer(Make make);
    ~OtherFtpServer();
    OtherFtpServer(const OtherFtpServer&) = delete;
    OtherFtpServer& operator=(const OtherFtpServer&) = delete;

    // True when the server is not installed or does not run for this user.
    bool absent() const { return m_program.isEmpty(); }
    bool running() const { return m_failure.isEmpty(); }
    QString failure() const { return m_failure; }
    QString ftpHost() const { return u"127.0.0.1:%1"_s.arg(m_port); }
    static QString user() { return u"lumora"_s; }
    static QString password() { return u"second-lab"_s; }
    HostPath account() const { return toHostPath(m_folder.filePath(u"account"_s)); }

private:
    QStringList prepare(Make make);
    QStringList prepareProFtpd();
    QStringList preparePureFtpd();
    QString run(const QString& program, const QStringList& arguments) const;
    void write(const QString& name, const QString& text) const;

    QTemporaryDir m_folder;
    QProcess m_server;
    QString m_program;
    QString m_failure;
    quint16 m_port = 0;
};

} // namespace lumora
