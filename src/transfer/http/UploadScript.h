#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <vector>

namespace lumora {

struct Platform;

// One file of a multipart body.
struct UploadPart {
    QString name; // leaf name; the header holds its ANSI bytes
    QByteArray bytes;
};

// The multipart body, byte for byte as the lab's script expects it: a semicolon after the name, "type" in lower case,
// no dashes between two parts, no line end after the last delimiter.
QByteArray MultipartBody(const std::vector<UploadPart>& parts);

// The request that uploads files to the lab's web server, in two forms. The address is url, "?folder=", the folder's
// name, "&" and extra, unescaped. If a file can't be read or its name would break its header (a quote, a line break,
// NUL), nothing is sent.
class UploadScript {
public:
    explicit UploadScript(const Platform& platform)
        : m_platform(platform) {}

    // The form that orders are sent by. Gives the answer's text, empty on failure. Of files only the leaf names count,
    // below localFolder.
    QString MultipartPost(const QString& folderName, const QStringList& files, const QString& url,
                          const DrivePath& localFolder, const QString& extra, const QString& user,
                          const QString& password);

    // The form of the page's test button: HTTP/1.0, a comma in the content type, and an announced length of twice the
    // body's less one, filled with zeros. server is a host, with its scheme where that is not http; url is the path on
    // it. Gives the answer's text, or "Error: " and the reason.
    QString MultipartPostInet(const QString& folderName, const QStringList& files, const QString& server,
                              const QString& url, const DrivePath& localFolder, const QString& extra);

    // Of the last call; the message is empty after success.
    const Failure& lastFailure() const { return m_failure; }
    bool failed() const { return !m_failure.message.isEmpty(); }
    // True when the last call was answered outside 200 to 299; whether the files are stored is not known.
    bool refused() const { return m_refused; }
    // True when a file on this machine failed and nothing was sent.
    bool failedBeforeSending() const { return m_fileFault; }

private:
    // Begins a call: resets the failure.
    Result<QByteArray> bodyOf(const QStringList& files, const DrivePath& localFolder);
    Result<QByteArray> readParts(const QStringList& files, const DrivePath& localFolder) const;

    const Platform& m_platform;
    Failure m_failure;
    bool m_fileFault = false;
    bool m_refused = false;
};

} // namespace lumora
