#include "support/FakeWebLab.h"

#include "common/AnsiCodePage.h"

#include <fstream>

namespace lumora {

using namespace Qt::StringLiterals;

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

Result<QByteArray> FakeWebLab::fetch(const QString& url) {
    urls += url;
    if (strikes(deadCalls))
        return down();
    if (!url.contains(u"listfileb.php"_s)) {
        reports += url;
        if (strikes(deadReports))
            return down();
        return QByteArray("OK");
    }
    const QString folder = url.mid(url.indexOf(u"tik="_s) + 4);
    if (!uploads.contains(folder))
        return QByteArray("folder not found");
    m_listed.insert(folder);
    return QByteArray("ok");
}

Result<QByteArray> FakeWebLab::post(const QString& url, const PostRequest& request) {
    urls += url;
    posts.push_back(request);
    const QString head = AnsiCodePage::decode(request.body.left(400));
    const QString name = between(head, u"filename=\""_s, u"\";"_s);
    posted += name;
    if (onPost)
        onPost(name);
    if (strikes(deadPosts))
        return down();
    const QString folder = between(url, u"folder="_s, u"&"_s);
    const qsizetype from = request.body.indexOf("\r\n\r\n") + 4;
    const qsizetype end = request.body.lastIndexOf("\r\n--OLA_GRAIN--");
    uploads[folder];
    if (!strikes(losses[name]))
        uploads[folder][name] = request.body.mid(from, strikes(halves[name]) ? (end - from) / 2 : end - from);
    return QByteArray("stored");
}

Result<std::optional<qint64>> FakeWebLab::contentLength(const QString& url) {
    urls += url;
    if (strikes(deadCalls))
        return down();
    const QString folder = between(url, u"/uploads/"_s, u"/"_s);
    const QString name = url.mid(url.lastIndexOf(u'/') + 1);
    if (tellsNoLength || !uploads.contains(folder) || !uploads[folder].contains(name))
        return std::optional<qint64>();
    return std::optional<qint64>(uploads[folder][name].size());
}

Result<void> FakeWebLab::download(const QString& url, const HostPath& target) {
    urls += url;
    if (strikes(deadCalls))
        return down();
    const QString folder = between(url, u"/uploads/"_s, u"/filelist"_s);
    if (refusesLists || !m_listed.contains(folder))
        return Failure{Failure::Kind::Refused, u"404"_s};
    const QByteArray list = listOf(folder);
    std::ofstream(target, std::ios::binary).write(list.constData(), list.size());
    return {};
}

} // namespace lumora
