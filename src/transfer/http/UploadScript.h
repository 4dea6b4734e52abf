#pragma once

#include "common/Result.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <vector>

namespace lumora {

struct Platform;

// One file of a multipart body.
struct UploadPart {
    QString name; // leaf name; its ANSI bytes stand in the header
    QByteArray bytes;
};

// The body that the lab's script takes, byte for byte. The semicolon behind the name, the lower-case "type", the
// missing dashes between two parts and the missing line end behind the last delimiter are what the script is used to.
QByteArray MultipartBody(const std::vector<UploadPart>& parts);

// The one request that carries files to the lab's web server, in two forms. The address is url, "?folder=", the
// folder's name, "&" and extra, unescaped. A file that can't be read, or whose name would break its header (a quote, a
// line break, NUL), is never sent, nor is anything with it.
class UploadScript {
public:
    explicit UploadScript(const Platform& platform)
        : m_platform(platform) {}

    // What the order upload uses. The answer's text; empty when there is none, and lastFailure tells why. files are
    // paths of which the leaf names count, below localFolder.
    QString MultipartPost(const QString& folderName, const QStringList& files, const QString& url,
                          const QString& localFolder, const QString& extra, const QString& user,
                          const QString& password);

    // The form of the page's test button: HTTP/1.0, a comma in the type, and an announced length of one less than twice
    // the body's, filled up with zeros. server is the bare host, url the path on it. The answer's text, or "Error: "
    // and the reason.
    QString MultipartPostInet(const QString& folderName, const QStringList& files, const QString& server,
                              const QString& url, const QString& localFolder, const QString& extra);

    // Of the last call; the message is empty when it went well.
    const Failure& lastFailure() const { return m_failure; }
    bool failed() const { return !m_failure.message.isEmpty(); }
    // It lies in a file of this machine, and nothing went over the line.
    bool failedBeforeSending() const { return m_fileFault; }

private:
    // Begins a call: what the last one left is forgotten.
    Result<QByteArray> bodyOf(const QStringList& files, const QString& localFolder);
    Result<QByteArray> readParts(const QStringList& files, const QString& localFolder) const;

    const Platform& m_platform;
    Failure m_failure;
    bool m_fileFault = false;
};

} // namespace lumora
