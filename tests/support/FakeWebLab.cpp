#include "support/FakeWebLab.h"

#include "common/AnsiCodePage.h"

#include <fstream>

namespace lumora {

namespace {

Failure down() {
    return {Failure::Kind::Disconnected, u"nobody answers"_s};
}

// The text between two marks.
QString between(const QString& text, const QString& from, const QString& to) {
    const qsizetype at = text.indexOf(from) + from.size();
    return text.mid(at, text.indexOf(to, at) - at);
}

} // namespace

QByteArray FakeWebLab::listOf(const QString& folder) const {
    if (listInstead)
        return *listInstead;
    QStringList entries{folder};
    for (const auto& [name, bytes] : uploads.at(folder))
        entries += name;
    entries += u"total:%1"_s.arg(entries.size() - 1);
    return AnsiCodePage::encode(entries.join(u"~~"_s));
}

Result<WebAnswer> FakeWebLab::fetch(const QString& url) {
    urls += url;
    if (onFetch)
        onFetch();
    if (strikes(deadCalls))
        return down();
    for (const auto& [part, page] : pages) {
        if (url.contains(part))
            return page;
    }
    if (const QByteArray* file = fileAt(url))
        return WebAnswer{*file};
    if (!url.contains(u"listfileb.php"_s)) {
        reports += url;
        return WebAnswer{"OK"};
    }
    const QString folder = url.mid(url.indexOf(u"tik="_s) + 4);
    if (!uploads.contains(folder))
        return WebAnswer{"folder not found"};
    m_listed.insert(folder);
    return WebAnswer{"ok"};
}

const QByteArray* FakeWebLab::fileAt(const QString& url) const {
    const auto folder = uploads.find(between(url, u"/uploads/"_s, u"/"_s));
    if (folder == uploads.end())
        return nullptr;
    const auto file = folder->second.find(url.mid(url.lastIndexOf(u'/') + 1));
    return file == folder->second.end() ? nullptr : &file->second;
}

Result<WebAnswer> FakeWebLab::post(const QString& url, const PostRequest& request) {
    urls += url;
    posts.push_back(request);
    const QString head = AnsiCodePage::decode(request.body.left(400));
    const QString name = between(head, u"filename=\""_s, u"\";"_s);
    posted += name;
    const int before = aborts;
    if (onPost)
        onPost(name);
    if (strikes(deadPosts))
        return Failure{deadConnectKind, u"nobody answers"_s};
    const bool isRefused = strikes(refusals[name]);
    const WebAnswer refusal{"no room", 500};
    if (isRefused && halves[name] == 0)
        return refusal;
    const QString folder = between(url, u"folder="_s, u"&"_s);
    const qsizetype from = request.body.indexOf("\r\n\r\n") + 4;
    const qsizetype end = request.body.lastIndexOf("\r\n--OLA_GRAIN--");
    const bool isCut = aborts != before || strikes(cuts[name]);
    uploads[folder];
    if (!strikes(losses[name]))
        uploads[folder][name] = request.body.mid(from, isCut || strikes(halves[name]) ? (end - from) / 2 : end - from);
    if (isCut || strikes(lostAnswers[name]))
        return down();
    return isRefused ? refusal : WebAnswer{"stored"};
}

Result<std::optional<qint64>> FakeWebLab::contentLength(const QString& url) {
    urls += url;
    if (strikes(deadCalls))
        return down();
    if (tellsNoLength || (!knowsNoHead && url.contains(u"/filelist"_s)))
        return std::optional<qint64>();
    const QByteArray* file = knowsNoHead ? nullptr : fileAt(url);
    if (!file)
        return Failure{Failure::Kind::NotFound, u"404"_s};
    return std::optional<qint64>(file->size());
}

Result<void> FakeWebLab::download(const QString& url, const HostPath& target) {
    urls += url;
    if (strikes(deadCalls))
        return down();
    const QString folder = between(url, u"/uploads/"_s, u"/filelist"_s);
    if (refusesLists || !m_listed.contains(folder))
        return Failure{Failure::Kind::Refused, u"404"_s};
    const QByteArray list = listOf(folder);
    if (!std::ofstream(target, std::ios::binary).write(list.constData(), list.size()))
        return Failure{Failure::Kind::Other, toText(target)};
    return {};
}

} // namespace lumora
