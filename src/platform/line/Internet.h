#pragma once

#include "common/Result.h"
#include "platform/files/HostPath.h"

#include <QByteArray>
#include <QString>

#include <memory>
#include <optional>
#include <vector>

// The calls that the transfer makes over the line, in the manner of a session: open, connect, walk, put, list. Each
// call blocks; meanwhile the page may repaint but takes no clicks. Time limits: 30 s to connect, 60 s without a byte or
// a reply; both end in the failure that a refused call gives. Texts go over the wire in the ANSI code page. A name that
// holds CR, LF or NUL is refused before anything is sent.
namespace lumora {

class EventPump;

struct FtpEntry {
    QString name;
    bool folder = false;
    std::optional<qint64> length = {}; // bytes; of a file, where the listing tells it
};

// The answer to a listing.
struct FtpListing {
    std::vector<FtpEntry> entries; // in the server's order, "." and ".." as they come
    bool refused = false;          // LIST was refused with 450 or 550: empty, or not to be read
    QString unread; // the first line that could not be read; with one, a name that is missing proves nothing
};

// The type of a transfer on the wire. The bytes that are written are the same under both.
enum class FtpType { Ascii, Image };

// How a server may tell that a folder is empty: by a listing that ends without an entry, or by refusing LIST with 450
// or 550 as well, which is also the answer for a folder that can't be read.
enum class EmptyFolder { IsListed, MayBeRefused };

// One connection to an FTP server, open until it is destroyed.
class FtpConnection {
public:
    virtual ~FtpConnection() = default;

    // The transfer type of the line.
    virtual FtpType type() const { return FtpType::Ascii; }

    // Relative to the current directory unless it begins at the root, which is the folder that the login leads to.
    virtual Result<void> setCurrentDirectory(const QString& directory) = 0;
    // From the login folder on, with a slash in front.
    virtual Result<QString> currentDirectory() = 0;
    virtual Result<void> makeDirectory(const QString& name) = 0;

    // Under the transfer type of the line, bytes as they are.
    virtual Result<void> put(const HostPath& local, const QString& remoteName) = 0;
    virtual Result<void> get(const QString& remoteName, const HostPath& local) = 0;
    // The file's own bytes, under type image.
    virtual Result<void> getExact(const QString& remoteName, const HostPath& local) = 0;
    virtual Result<void> remove(const QString& remoteName) = 0;

    // What the current directory holds. The pattern "*.*" means every name and is sent as a plain LIST, since a server
    // would otherwise hide the names without a dot.
    virtual Result<FtpListing> list(const QString& pattern, EmptyFolder empty = EmptyFolder::IsListed) = 0;

    // The length of a file in bytes, asked by SIZE under type image; no value where the server has no such file or does
    // not tell.
    virtual Result<std::optional<qint64>> length(const QString& remoteName) = 0;

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

// A web server's answer. Outside 200 to 299 the body is a page about the fault and not what was asked for.
struct WebAnswer {
    QByteArray body;
    int status = 200;
    bool good() const { return status >= 200 && status <= 299; }
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

    // Cuts every connection that stands; each call under way fails at once, and a put that was cut is a broken put.
    // From any thread. Later calls are not concerned.
    virtual void abort() {}
    // While a pump is given, a call that waits on its thread pumps, so that a click may abort it. Gives the pump that
    // was given before.
    virtual EventPump* pumpWhileWaiting(EventPump*) { return nullptr; }
    // A running count of the bytes of files, listings and bodies in both directions.
    virtual qint64 bytesMoved() const { return 0; }

    // GET, past every cache. A redirect to the same host is followed, at most five in a row. The URL goes out as it
    // stands, in the ANSI code page, only a blank as %20; CR, LF and NUL count as blanks and "#" does not cut. An
    // answer of any status is a success.
    virtual Result<WebAnswer> fetch(const QString& url) = 0;

    // POST to an address that goes out as that of fetch does. An answer of any status is a success, but for a redirect:
    // 307 and 308 to the same host repeat the POST, any other is a failure.
    virtual Result<WebAnswer> post(const QString& url, const PostRequest& request) = 0;

    // The length in bytes that the server tells of an address, asked by HEAD; no value where it does not answer 200 to
    // 299 or tells none. 404 and 410 are the failure NotFound.
    virtual Result<std::optional<qint64>> contentLength(const QString& url) = 0;

    // GET into a file, written whole or not at all; an answer of another status than 200 to 299, and one
    // without end, is a failure and leaves no file.
    virtual Result<void> download(const QString& url, const HostPath& target) = 0;
};

} // namespace lumora
