#pragma once

#include "common/Result.h"
#include "platform/line/Internet.h"
#include "platform/line/LineSocket.h"

#include <QString>

#include <functional>
#include <optional>

namespace lumora {

// An answer that is kept in memory is a few words of a script.
constexpr qsizetype largestFetchedBody = 16 * 1024 * 1024;
// One that becomes a file is a list or a picture of the start page; a server that never ends must not fill the disk.
constexpr qint64 largestDownload = 64 * 1024 * 1024;

// Takes the next bytes of the body; false gives the answer up.
using BodySink = std::function<bool(const char* bytes, std::size_t count)>;

struct HttpAnswer {
    int status = 0;
    std::optional<qint64> length; // as the server announced it, in bytes
    bool good() const { return status >= 200 && status <= 299; }
};

// http only. A body that ends before its announced length is a failure. A redirect to the same host and port is
// followed, at most five in a row.

// GET past every cache.
Result<HttpAnswer> HttpGet(const QString& url, const LineCall& line, const BodySink& sink);
Result<HttpAnswer> HttpHead(const QString& url, const LineCall& line);

// The body goes out from where it lies, in pieces, and is never copied whole. Only 307 and 308 repeat the POST; any
// other redirect is a failure.
Result<HttpAnswer> HttpPost(const QString& url, const PostRequest& post, const LineCall& line, const BodySink& sink);

// The request target as it goes over the wire: the ANSI bytes of the text from behind the host on, CR, LF and NUL made
// blanks, a blank made %20, since a raw one would end the target in the request line. Nothing else is touched.
QByteArray HttpTarget(const QString& pathAndQuery);

} // namespace lumora
