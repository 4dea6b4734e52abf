#include "platform/media/CardSummary.h"

#include "common/PictureName.h"

#include <QDateTime>
#include <QRegularExpression>

#include <sys/stat.h>

#include <algorithm>
#include <map>
#include <optional>
#include <tuple>
#include <utility>
#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;

namespace {

constexpr int deepest = 8;
constexpr int mostEntries = 50000;

// The newest picture of a folder.
struct Newest {
    time_t time = 0;
    HostPath picture;
    // Of two with one time the later name.
    bool operator<(const Newest& other) const { return std::tie(time, picture) < std::tie(other.time, other.picture); }
};

// "101CANON": the number counts up, the letters tell the camera.
struct CameraFolder {
    int number;
    QString camera;
};

bool isCameraTree(const HostPath& folder) {
    std::error_code error;
    return toText(folder.filename()).compare(u"DCIM", Qt::CaseInsensitive) == 0 &&
           fs::symlink_status(folder, error).type() == fs::file_type::directory;
}

std::optional<CameraFolder> cameraFolder(const HostPath& folder) {
    static const QRegularExpression form(u"^([1-9][0-9]{2})([A-Z0-9_]{5})$"_s,
                                         QRegularExpression::CaseInsensitiveOption);
    if (!isCameraTree(folder.parent_path()))
        return std::nullopt;
    const auto match = form.match(toText(folder.filename()));
    if (!match.hasMatch())
        return std::nullopt;
    return CameraFolder{match.captured(1).toInt(), match.captured(2).toUpper()};
}

class CardCount {
public:
    CardCount(const HostPath& root, const std::atomic_bool& stop, bool everyFormat)
        : m_stop(stop)
        , m_everyFormat(everyFormat) {
        std::error_code error;
        std::vector<HostPath> cameras;
        fs::directory_iterator at(root, error);
        m_summary.readable = !error;
        m_summary.newestFolder = root;
        for (; !error && at != fs::directory_iterator(); at.increment(error)) {
            if (isCameraTree(at->path()))
                cameras.push_back(at->path());
        }
        // Where the count ends early, the pictures of the camera are in it.
        for (const HostPath& tree : cameras)
            walk(tree, deepest - 1);
        if (m_summary.readable)
            walk(root, deepest, Trees::OthersThanCameras);
    }

    CardSummary summary() {
        Newest all;
        Newest opened;
        std::map<QString, std::pair<int, Newest>> cameras; // the last folder of each
        for (const auto& [folder, newest] : m_folders) {
            all = std::max(all, newest);
            if (const auto of = cameraFolder(folder)) {
                const auto [known, isNew] = cameras.try_emplace(of->camera, of->number, newest);
                if (!isNew && of->number > known->second.first)
                    known->second = {of->number, newest};
            }
        }
        // A camera counts its folders up, whatever its clock says; between two cameras only the times can tell.
        for (const auto& [camera, last] : cameras)
            opened = std::max(opened, last.second);
        if (cameras.empty())
            opened = all;
        if (m_summary.pictures > 0) {
            m_summary.newest = QDateTime::fromSecsSinceEpoch(all.time).date();
            m_summary.newestFolder = opened.picture.parent_path();
            m_summary.newestPicture = opened.picture;
        }
        return m_summary;
    }

private:
    enum class Trees { All, OthersThanCameras };
    void walk(const HostPath& folder, int deeper, Trees trees = Trees::All) {
        std::error_code error;
        for (fs::directory_iterator at(folder, error), end; !error && at != end; at.increment(error)) {
            if (m_stop || ++m_entries > mostEntries) {
                m_summary.more = true;
                return;
            }
            const QString name = toText(at->path().filename());
            std::error_code kind;
            const fs::file_type type = at->symlink_status(kind).type();
            if (name.startsWith(u'.') || (trees == Trees::OthersThanCameras && isCameraTree(at->path())))
                continue;
            if (type == fs::file_type::directory && deeper > 0)
                walk(at->path(), deeper - 1);
            else if (type == fs::file_type::regular && isPictureFile(name, m_everyFormat))
                take(folder, at->path());
        }
    }

    void take(const HostPath& folder, const HostPath& picture) {
        struct stat status {};
        if (::lstat(picture.c_str(), &status) != 0)
            return;
        ++m_summary.pictures;
        Newest& newest = m_folders[folder];
        newest = std::max(newest, Newest{status.st_mtime, picture});
    }

    const std::atomic_bool& m_stop;
    const bool m_everyFormat;
    CardSummary m_summary;
    std::map<HostPath, Newest> m_folders;
    int m_entries = 0;
};

} // namespace

CardSummary summaryOfCard(const HostPath& root, const std::atomic_bool& stop, bool everyFormat) {
    return CardCount(root, stop, everyFormat).summary();
}

} // namespace lumora
