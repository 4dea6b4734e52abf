#include "platform/media/MediaFolders.h"

#include <sys/stat.h>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;

namespace {

constexpr int betweenLooks = 1000; // milliseconds
constexpr int mostFolders = 64;    // of one folder: more is no folder of media

} // namespace

MediaFolders::MediaFolders(std::vector<HostPath> roots, IsMounted isMounted)
    : m_roots(std::move(roots))
    , m_isMounted(std::move(isMounted))
    , m_poll(this)
    , m_watcher(this) {
    m_poll.setInterval(betweenLooks);
    connect(&m_poll, &QTimer::timeout, this, &MediaFolders::look);
    connect(&m_watcher, &QFileSystemWatcher::directoryChanged, this, &MediaFolders::look);
}

bool MediaFolders::isMountPoint(const HostPath& folder) {
    struct stat here {};
    struct stat above {};
    return ::lstat(folder.c_str(), &here) == 0 && S_ISDIR(here.st_mode) &&
           ::stat((folder / "..").c_str(), &above) == 0 && here.st_dev != above.st_dev;
}

void MediaFolders::begin() {
    m_poll.start();
    look();
}

void MediaFolders::look() {
    std::vector<Medium> media;
    for (const HostPath& root : m_roots)
        lookIn(root, 1, media);
    if (m_told && media == m_last)
        return;
    m_told = true;
    m_last = media;
    Q_EMIT found(media);
}

void MediaFolders::lookIn(const HostPath& root, int deeper, std::vector<Medium>& media) {
    std::error_code error;
    fs::directory_iterator at(root, error);
    if (error)
        return;
    // A folder that was removed and made again is watched no longer, and is added again.
    if (!m_watcher.directories().contains(toText(root)))
        m_watcher.addPath(toText(root));
    int seen = 0;
    for (; !error && at != fs::directory_iterator() && seen < mostFolders; at.increment(error), ++seen) {
        const HostPath& folder = at->path();
        std::error_code kind;
        if (fs::symlink_status(folder, kind).type() != fs::file_type::directory)
            continue;
        if (m_isMounted(folder))
            media.push_back({toText(folder), Medium::Kind::Other, toText(folder.filename()), folder});
        else if (deeper > 0)
            lookIn(folder, deeper - 1, media);
    }
}

} // namespace lumora
