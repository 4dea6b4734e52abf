#pragma once

#include "platform/files/HostPath.h"

#include <QByteArrayList>
#include <QProcess>
#include <QString>
#include <QTemporaryDir>

#include <functional>
#include <initializer_list>
#include <map>

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

    quint16 httpPort() const { return m_httpPort; }
    // "http://127.0.0.1:PORT", without a slash at its end.
    QString site() const { return u"http://127.0.0.1:%1"_s.arg(m_httpPort); }

    // What the account sees as "/", and the folder that orders arrive in.
    HostPath account() const { return folder() / "ftp"; }
    HostPath ordersFolder() const { return account() / "zalamim234"; }
    // The folder that orders arrive in which come by HTTP.
    HostPath uploads() const { return folder() / "uploads"; }
    HostPath folder() const { return toHostPath(m_folder.path()); }
    HostPath labFile() const { return folder() / "lab.ini"; }

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

// The plain files of a folder by name; none if the folder isn't there.
std::map<QString, QByteArray> FilesIn(const HostPath& folder);

// A port of 127.0.0.1 on which nothing listens at the moment.
quint16 FreePort();

// A server program on free ports of 127.0.0.1 over a temporary folder, ended with this object. A test asserts running()
// and so fails, and never skips, where it could not start.
class ServerProcess {
public:
    ServerProcess(const ServerProcess&) = delete;
    ServerProcess& operator=(const ServerProcess&) = delete;

    bool running() const { return m_failure.isEmpty(); }
    QString failure() const { return m_failure; }

protected:
    ServerProcess() = default;
    ~ServerProcess();
    // Starts the program and its arguments, which are asked for once the ports are known; again on other ports when one
    // was taken meanwhile.
    void start(std::initializer_list<quint16*> ports, const std::function<QStringList()>& command);

    QTemporaryDir m_folder;
    QProcess m_server;
    QString m_failure;
};

// A second kind of web server over the same scripts: lighttpd, which runs php-cgi anew for each request.
class SecondWebServer : public ServerProcess {
public:
    SecondWebServer();

    QString site() const { return u"http://127.0.0.1:%1"_s.arg(m_port); }
    HostPath uploads() const { return toHostPath(m_folder.path()) / "uploads"; }

private:
    quint16 m_port = 0;
};

// A second kind of FTP server: pyftpdlib.
class SecondFtpServer : public ServerProcess {
public:
    SecondFtpServer();
    ~SecondFtpServer();

    QString ftpHost() const { return u"127.0.0.1:%1"_s.arg(m_port); }
    static QString user() { return u"lumora"_s; }
    static QString password() { return u"second-lab"_s; }
    HostPath account() const { return toHostPath(m_folder.filePath(u"account"_s)); }

private:
    quint16 m_port = 0;
};

} // namespace lumora
