#pragma once

#include "common/Result.h"
#include "platform/line/Internet.h"
#include "platform/line/LineSocket.h"

#include <QString>

#include <functional>
#include <optional>

namespace lumora {

// In bytes. An answer that is kept in memory is a few words of a script.
constexpr qsizetype largestFetchedBody = 16 * 1024 * 1024;
// In bytes. An answer that becomes a file is a list or a picture of the start page; an endless one must not fill the
// disk.
constexpr qint64 largestDownload = 64 * 1024 * 1024;

// Takes the next bytes of the body; false gives the answer up.
using BodySink = std::function<bool(const char* bytes, std::size_t count)>;

struct HttpAnswer {
    int status = 0;
    std::optional<qint64> length; // as the server announced it, in bytes
    bool good() const { return status >= 200 && status <= 299; }
};

// http and https. A body that ends before its announced length is a failure. A redirect to the same host and port is
// followed, at most five in a row.

// GET past every cache.
Result<HttpAnswer> HttpGet(const QString& url, const LineCall& line, const BodySink& sink);
Result<HttpAnswer> HttpHead(const QString& url, const LineCall& line);

// The body is sent in pieces and never copied as a whole. Only 307 and 308 repeat the POST; any other redirect is a
// failure.
Result<HttpAnswer> HttpPost(const QString& url, const PostRequest& post, const LineCall& line, const BodySink& sink);

// The request target in bytes: the text after the host in the ANSI code page, with a blank for each CR, LF and NUL and
// %20 for each blank, since a raw blank would end the target.
QByteArray HttpTarget(const QString& pathAndQuery);

} // namespace lumora
