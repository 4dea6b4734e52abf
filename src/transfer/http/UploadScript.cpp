#include "transfer/http/UploadScript.h"

#include "common/AnsiCodePage.h"
#include "common/DrivePath.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr char boundary[] = "OLA_GRAIN";
constexpr char newLine[] = "\r\n";

QString address(const QString& url, const QString& folderName, const QString& extra) {
    return url + u"?folder="_s + folderName + u'&' + extra;
}

// LeafName needs a path; a bare name is already a leaf.
QString leafOf(const QString& path) {
    return path.contains(u'\\') ? LeafName(path) : path;
}

bool breaksHeader(const QString& name) {
    for (const QChar letter : name) {
        if (letter < u' ' || letter == u'"')
            return true;
    }
    return name.isEmpty();
}

} // namespace

QByteArray MultipartBody(const std::vector<UploadPart>& parts) {
    constexpr qsizetype roomForHeader = 256;
    qsizetype size = 64;
    for (const UploadPart& part : parts)
        size += part.bytes.size() + part.name.size() + roomForHeader;
    QByteArray body;
    body.reserve(size);
    body.append("--").append(boundary);
    for (std::size_t i = 0; i < parts.size(); ++i) {
        body.append(newLine).append("Content-Disposition: form-data; name=\"uploadedFile\"; filename=\"");
        body.append(AnsiCodePage::encode(parts[i].name)).append("\";").append(newLine);
        body.append("Content-type: file").append(newLine).append(newLine);
        body.append(parts[i].bytes).append(newLine);
        if (i + 1 < parts.size())
            body.append(boundary);
    }
    return body.append("--").append(boundary).append("--");
}

Result<QByteArray> UploadScript::bodyOf(const QStringList& files, const DrivePath& localFolder) {
    auto body = readParts(files, localFolder);
    m_failure = body ? Failure{} : body.failure();
    m_fileFault = !body;
    m_refused = false;
    return body;
}

Result<QByteArray> UploadScript::readParts(const QStringList& files, const DrivePath& localFolder) const {
    std::vector<UploadPart> parts;
    for (const QString& file : files) {
        const QString name = leafOf(file);
        if (breaksHeader(name))
            return Failure{Failure::Kind::Unsupported, u"%1: the name can't be sent"_s.arg(name)};
        auto bytes = m_platform.files.read(localFolder / name);
        if (!bytes)
            return bytes.failure();
        parts.push_back({name, std::move(*bytes)});
    }
    return MultipartBody(parts);
}

QString UploadScript::MultipartPost(const QString& folderName, const QStringList& files, const QString& url,
                                    const DrivePath& localFolder, const QString& extra, const QString& user,
                                    const QString& password) {
    auto body = bodyOf(files, localFolder);
    if (!body)
        return {};
    PostRequest request;
    request.contentType = QByteArray("multipart/form-data; boundary=") + boundary;
    request.body = std::move(*body);
    request.user = user;
    request.password = password;
    const auto answer = m_platform.internet.post(address(url, folderName, extra), request);
    if (!answer) {
        m_failure = answer.failure();
        return {};
    }
    m_refused = !answer->good();
    return AnsiCodePage::decode(answer->body);
}

QString UploadScript::MultipartPostInet(const QString& folderName, const QStringList& files, const QString& server,
                                        const QString& url, const DrivePath& localFolder, const QString& extra) {
    auto body = bodyOf(files, localFolder);
    if (body) {
        PostRequest request;
        request.version = PostRequest::Version::Http10;
        request.contentType = QByteArray("multipart/form-data, boundary=") + boundary;
        request.body = std::move(*body);
        request.announcedLength = 2 * request.body.size() - 1;
        const auto answer = m_platform.internet.post(
            (server.contains(u"://"_s) ? server : u"http://"_s + server) + address(url, folderName, extra), request);
        m_refused = answer && !answer->good();
        if (answer)
            return AnsiCodePage::decode(answer->body);
        m_failure = answer.failure();
    }
    return u"Error: "_s + m_failure.message;
}

} // namespace lumora
