#include "platform/files/Drives.h"

#include "platform/files/UserFolders.h"

#include <QStringList>

#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <set>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;
namespace {

constexpr QChar rootLetter = u'Z';

HostPath normal(const HostPath& path) {
    std::error_code error;
    HostPath absolute = fs::absolute(path, error);
    if (error)
        absolute = path;
    absolute = absolute.lexically_normal();
    return absolute.has_filename() || absolute == absolute.root_path() ? absolute : absolute.parent_path();
}

// The names from folder down to path; no value when path lies elsewhere.
std::optional<std::vector<HostPath>> below(const HostPath& folder, const HostPath& path) {
    const auto [inFolder, inPath] = std::mismatch(folder.begin(), folder.end(), path.begin(), path.end());
    if (inFolder != folder.end())
        return std::nullopt;
    return std::vector<HostPath>(inPath, path.end());
}

// An empty folder that nothing is mounted on belongs to a medium that is not there.
bool holdsMedium(const HostPath& folder) {
    struct stat here {};
    struct stat above {};
    if (::stat(folder.c_str(), &here) != 0 || !S_ISDIR(here.st_mode) || ::access(folder.c_str(), R_OK | X_OK) != 0)
        return false;
    if (::stat(folder.parent_path().c_str(), &above) == 0 && here.st_dev != above.st_dev)
        return true;
    std::error_code error;
    return fs::directory_iterator(folder, error) != fs::directory_iterator();
}

std::pair<dev_t, ino_t> identity(const HostPath& folder) {
    struct stat status {};
    ::stat(folder.c_str(), &status);
    return {status.st_dev, status.st_ino};
}

} // namespace

Drives::Drives(HostPath dataFolder, QChar programLetter, std::vector<HostPath> mediaRoots, QString offeredFirst)
    : m_dataFolder(normal(dataFolder))
    , m_programLetter(programLetter.toUpper())
    , m_mediaRoots(std::move(mediaRoots))
    , m_offeredFirst(std::move(offeredFirst)) {
    for (HostPath& root : m_mediaRoots)
        root = normal(root);
    refreshMedia();
}

std::vector<HostPath> Drives::defaultMediaRoots() {
    std::vector<HostPath> roots = {"/media"};
    if (const passwd* user = ::getpwuid(::getuid()); user && user->pw_name) {
        roots.push_back(HostPath("/media") / user->pw_name);
        roots.push_back(HostPath("/run/media") / user->pw_name);
    }
    return roots;
}

HostPath Drives::defaultDataFolder() {
    return userFolder("XDG_DATA_HOME", ".local/share") / "lumora" / "drive_c";
}

DrivePath Drives::programRoot() const {
    return DrivePath(QString(m_programLetter) + u":\\"_s);
}

std::vector<HostPath> Drives::findMedia(const std::vector<HostPath>& roots) {
    std::vector<HostPath> found;
    std::set<std::pair<dev_t, ino_t>> seen;
    for (const HostPath& root : roots) {
        std::error_code error;
        std::vector<HostPath> here;
        for (fs::directory_iterator at(root, error), end; !error && at != end; at.increment(error))
            here.push_back(at->path());
        std::sort(here.begin(), here.end());
        for (const HostPath& folder : here) {
            const bool isRoot = std::find(roots.begin(), roots.end(), folder) != roots.end();
            if (!isRoot && holdsMedium(folder) && seen.insert(identity(folder)).second)
                found.push_back(folder);
        }
    }
    return found;
}

void Drives::giveLetters(const std::vector<HostPath>& found) {
    const auto isGone = [&](const auto& drive) {
        return std::find(found.begin(), found.end(), drive.second) == found.end();
    };
    const auto takeLetter = [this](const HostPath& folder) {
        for (char16_t letter = u'D'; letter < u'Z'; ++letter) {
            if (letter != m_programLetter && m_media.try_emplace(letter, folder).second)
                return true;
        }
        return false;
    };
    for (const HostPath& folder : found) {
        const bool known =
            std::any_of(m_media.begin(), m_media.end(), [&](const auto& drive) { return drive.second == folder; });
        if (known)
            continue;
        // A medium that was taken out keeps its letter: cards number their pictures alike, and a path of the first card
        // must not lead to a picture of the second. Letters are given again only when none is left.
        if (!takeLetter(folder)) {
            std::erase_if(m_media, isGone);
            takeLetter(folder);
        }
    }
}

std::vector<Drives::Drive> Drives::drives() const {
    std::vector<Drive> all;
    const auto add = [&](QChar letter, const HostPath& folder, const QString& name, bool removable) {
        all.push_back({letter, folder, name, removable, m_offeredFirst.contains(letter)});
    };
    add(m_programLetter, m_dataFolder, toText(m_dataFolder.filename()), false);
    for (const auto& [letter, folder] : m_media) {
        if (holdsMedium(folder))
            add(letter, folder, toText(folder.filename()), true);
    }
    if (m_programLetter != rootLetter)
        add(rootLetter, "/", u"/"_s, false);
    const auto place = [&](const Drive& drive) {
        return drive.offeredFirst ? m_offeredFirst.indexOf(drive.letter) : m_offeredFirst.size();
    };
    std::stable_sort(all.begin(), all.end(), [&](const Drive& a, const Drive& b) { return place(a) < place(b); });
    return all;
}

std::optional<HostPath> Drives::toHost(const DrivePath& path) const {
    const QString& drivePath = path.text();
    if (drivePath.size() < 2 || drivePath[1] != u':' || drivePath.contains(QChar(u'\0')))
        return std::nullopt;
    const QChar letter = drivePath[0].toUpper();
    HostPath folder;
    if (letter == m_programLetter)
        folder = m_dataFolder;
    else if (letter == rootLetter)
        folder = "/";
    else if (const auto medium = m_media.find(letter); medium != m_media.end())
        folder = medium->second;
    else
        return std::nullopt;

    QString rest = drivePath.mid(2);
    // Two folder names of the editor are written with a slash.
    rest.replace(u'/', u'\\');
    std::vector<QString> names;
    for (const QString& name : rest.split(u'\\', Qt::SkipEmptyParts)) {
        if (name == QLatin1String("."))
            continue;
        if (name != QLatin1String("..")) {
            names.push_back(name);
        } else {
            if (names.empty())
                return std::nullopt;
            names.pop_back();
        }
    }
    for (const QString& name : names)
        folder /= toHostPath(ShortenedName(name));
    return folder;
}

DrivePath Drives::toDrive(const HostPath& hostPath) const {
    const HostPath path = normal(hostPath);
    QChar letter = rootLetter;
    std::vector<HostPath> names(path.begin(), path.end());
    if (!names.empty() && names.front() == "/")
        names.erase(names.begin());
    for (const Drive& drive : drives()) {
        auto inside = below(drive.folder, path);
        if (inside && drive.letter != rootLetter && inside->size() <= names.size()) {
            letter = drive.letter;
            names = std::move(*inside);
        }
    }
    DrivePath drivePath(QString(letter) + u":\\"_s);
    for (const HostPath& name : names)
        drivePath = drivePath / toDriveName(name);
    return drivePath;
}

QString ShortenedName(const QString& name) {
    constexpr std::size_t longest = 255;
    constexpr qsizetype longestEnding = 5;
    const std::string whole = toHostPath(name).native();
    if (whole.size() <= longest)
        return name;

    std::uint32_t checksum = 2166136261U; // FNV-1a
    for (const char c : whole)
        checksum = (checksum ^ static_cast<unsigned char>(c)) * 16777619U;

    const qsizetype dot = name.lastIndexOf(u'.');
    const QString ending = dot >= 0 && name.size() - dot <= longestEnding ? name.mid(dot) : QString();
    const QString close = u'~' + QString::number(checksum, 16).rightJustified(8, u'0').toUpper() + ending;
    QString kept = name.chopped(ending.size());
    const std::size_t room = longest - toHostPath(close).native().size();
    while (toHostPath(kept).native().size() > room)
        kept.chop(kept.back().isLowSurrogate() && kept.size() > 1 && kept[kept.size() - 2].isHighSurrogate() ? 2 : 1);
    return kept + close;
}

} // namespace lumora
