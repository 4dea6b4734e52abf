#pragma once

#include "common/Result.h"
#include "platform/files/HostPath.h"

#include <QByteArray>
#include <QString>

#include <memory>
#include <vector>

// The calls that the transfer makes over the line, in the manner of a session: open, connect, walk, put, list. Each
// call blocks; meanwhile the page may repaint but takes no clicks. Time limits: 30 s to connect, 60 s without a byte or
// a reply; both end in the failure that a refused call gives. Texts go over the wire in the ANSI code page. A name that
// holds CR, LF or NUL is refused before anything is sent.
namespace lumora {

struct FtpEntry {
    QString name;
    bool folder = false;
};

// One connection to an FTP server, open until it is destroyed.
class FtpConnection {
public:
    virtual ~FtpConnection() = default;

    // Relative to the current directory unless it begins at the root.
    virtual Result<void> setCurrentDirectory(const QString& directory) = 0;
    virtual Result<QString> currentDirectory() = 0;
    virtual Result<void> makeDirectory(const QString& name) = 0;

    // Transfer type ASCII on the wire, bytes as they are: the lab's server takes them so, and pictures survive only
    // that way.
    virtual Result<void> put(const HostPath& local, const QString& remoteName) = 0;
    virtual Result<void> get(const QString& remoteName, const HostPath& local) = 0;
    virtual Result<void> remove(const QString& remoteName) = 0;

    // The entries of the current directory, "." and ".." as the server gives them. The pattern "*.*" means every name
    // and is sent as a plain LIST, since a server would otherwise hide the names without a dot.
    virtual Result<std::vector<FtpEntry>> list(const QString& pattern) = 0;

    // The server's last reply, all lines.
    virtual QString lastResponse() const = 0;
};

// What a POST carries besides its address.
struct PostRequest {
    enum class Version { Http10, Http11 };
    Version version = Version::Http11;
    QByteArray contentType;
    QByteArray body;
    // More than the body has: zeros follow it up to this length.
    qint64 announcedLength = 0;
    QString user; // with a password: sent along (Basic); else nothing is
    QString password;
};

class Internet {
public:
    virtual ~Internet() = default;

    // The first step before any call. False when the machine has no way out at all.
    virtual bool open() = 0;
    virtual bool connectedState() const = 0;

    enum class DataChannel { Active, Passive };
    // host may carry a port: "127.0.0.1:2121".
    virtual Result<std::unique_ptr<FtpConnection>> connectFtp(const QString& host, const QString& user,
                                                              const QString& password, DataChannel channel) = 0;

    // GET, past every cache. The URL goes out as it stands, in the ANSI code page, only a blank as %20; CR, LF and NUL
    // count as blanks and "#" does not cut. The answer's body whatever the status is.
    virtual Result<QByteArray> fetch(const QString& url) = 0;

    // POST to an address that goes out as that of fetch does. The answer's body whatever the status is.
    virtual Result<QByteArray> post(const QString& url, const PostRequest& request) = 0;

    // GET into a file, written whole or not at all; an answer of another status than 200 to 299, and one
    // without end, is a failure and leaves no file.
    virtual Result<void> download(const QString& url, const HostPath& target) = 0;
};

} // namespace lumora
