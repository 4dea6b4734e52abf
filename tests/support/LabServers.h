#pragma once

#include "platform/files/HostPath.h"

#include <QByteArrayList>
#include <QProcess>
#include <QString>
#include <QTemporaryDir>

namespace lumora {

using namespace Qt::StringLiterals;

// Real servers of a lab over a temporary folder, on free ports of 127.0.0.1, ended with this object. The ordinary kind
// is the demo's own lab: vsftpd and nginx with php-cgi. A test asserts running() and so fails, and never skips, where a
// server could not start.
class LabServers {
public:
    LabServers();
    ~LabServers();
    LabServers(const LabServers&) = delete;
    LabServers& operator=(const LabServers&) = delete;

    bool running() const { return m_failure.isEmpty(); }
    QString failure() const { return m_failure; }

    QString ftpHost() const { return u"127.0.0.1:%1"_s.arg(m_ftpPort); }
    quint16 ftpPort() const { return m_ftpPort; }
    static QString user() { return u"ftp"_s; }
    static QString password() { return u"loopback-lab"_s; }

    // "http://127.0.0.1:PORT", without a slash at its end.
    QString site() const { return u"http://127.0.0.1:%1"_s.arg(m_httpPort); }

    // What the account sees as "/", and the folder that orders arrive in.
    HostPath account() const { return folder() / "ftp"; }
    HostPath ordersFolder() const { return account() / "zalamim234"; }
    HostPath folder() const { return toHostPath(m_folder.path()); }

    // The request lines as the web server saw them, in order. The server writes a line when it has answered, so this
    // waits a little while for at least so many.
    QByteArrayList requests(int atLeast = 0) const;
    // The reports among them, as the lab's scripts wrote them down.
    QByteArrayList reports() const;
    // The FTP server's log of commands and replies.
    QByteArray ftpLog() const;

private:
    QTemporaryDir m_folder;
    QString m_failure;
    quint16 m_ftpPort = 0;
    quint16 m_httpPort = 0;
};

// "<absent>" for a file that can't be read.
QByteArray contentOf(const HostPath& path);

// A port of 127.0.0.1 on which nothing listens at the moment.
quint16 FreePort();

} // namespace lumora
