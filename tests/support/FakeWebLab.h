#pragma once

#include "support/FakeLab.h"

#include <set>

namespace lumora {

// The lab's web site in memory: takes files, writes lists, and hears reports. The faults are those of a line and of a
// script that answers with something else.
class FakeWebLab : public FakeLab {
public:
    std::map<QString, Folder> uploads; // by order folder
    std::vector<PostRequest> posts;    // as they came
    QStringList posted;                // names, also of posts that failed
    QStringList reports;               // addresses of calls that are no upload and no list

    int deadPosts = 0;                     // posts that reach nobody; always is for good
    int deadCalls = 0;                     // the same of fetches and downloads
    std::map<QString, int> losses;         // how often a file is accepted and not stored
    std::map<QString, int> halves;         // how often half of a file is stored after a good answer
    std::map<QString, int> cuts;           // how often the line is cut in the middle of a file, which is stored
    std::map<QString, int> lostAnswers;    // how often the line is cut after the last byte of a file
    bool tellsNoLength = false;            // to HEAD
    bool knowsNoHead = false;              // and answers it with 404
    std::optional<QByteArray> listInstead; // what each list file says
    std::map<QString, int> refusals;       // how often a file is answered with 500, and stored only as one of halves
    std::map<QString, WebAnswer> pages;    // what an address that holds the key is answered with instead
    bool refusesLists = false;             // no list file is given out
    std::function<void(const QString& name)> onPost;

    Result<WebAnswer> fetch(const QString& url) override;
    Result<WebAnswer> post(const QString& url, const PostRequest& request) override;
    Result<std::optional<qint64>> contentLength(const QString& url) override;
    Result<void> download(const QString& url, const HostPath& target) override;

    QByteArray listOf(const QString& folder) const;

private:
    const QByteArray* fileAt(const QString& url) const;

    std::set<QString> m_listed; // folders whose list was asked for
};

} // namespace lumora
