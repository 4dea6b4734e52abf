#include "platform/files/Files.h"

#include "common/AnsiCodePage.h"
#include "common/HostFile.h"

#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;
namespace {

// In bytes. The program's own files are far smaller; reading a larger file is an error.
constexpr qint64 largestRead = qint64(1) << 30;

Failure failure(Failure::Kind kind, const DrivePath& path, const QString& reason) {
    return {kind, u"%1: %2"_s.arg(path.text(), reason)};
}

// In a pattern "*" stands for any characters, "?" for one.
bool matches(QStringView pattern, QStringView name) {
    qsizetype p = 0;
    qsizetype n = 0;
    qsizetype star = -1;
    qsizetype resume = 0;
    while (n < name.size()) {
        if (p < pattern.size() && pattern[p] == u'*') {
            star = p++;
            resume = n;
        } else if (p < pattern.size() && (pattern[p] == u'?' || pattern[p].toCaseFolded() == name[n].toCaseFolded())) {
            ++p;
            ++n;
        } else if (star >= 0) {
            p = star + 1;
            n = ++resume;
        } else {
            return false;
        }
    }
    while (p < pattern.size() && pattern[p] == u'*')
        ++p;
    return p == pattern.size();
}

bool matchesAny(const QStringList& patterns, const QString& name) {
    return std::any_of(patterns.begin(), patterns.end(), [&](const QString& pattern) {
        return pattern == QLatin1String("*.*") || matches(pattern, name);
    });
}

void sortWithoutCase(QStringList& names) {
    std::sort(names.begin(), names.end(), [](const QString& a, const QString& b) {
        const int order = QString::compare(a, b, Qt::CaseInsensitive);
        return order != 0 ? order < 0 : a < b;
    });
}

enum class Wanted { Files, Folders };

// The names before conversion to the code page; hidden ones are left out.
QStringList entries(const HostPath& folder, Wanted wanted, std::error_code& error) {
    QStringList names;
    for (fs::directory_iterator at(folder, error), end; !error && at != end; at.increment(error)) {
        std::error_code unreadable;
        const bool fits = wanted == Wanted::Files ? at->is_regular_file(unreadable) : at->is_directory(unreadable);
        if (fits && !at->path().filename().native().starts_with('.'))
            names += toDriveName(at->path().filename());
    }
    sortWithoutCase(names);
    return names;
}

QStringList entries(const HostPath& folder, Wanted wanted) {
    std::error_code passedOver;
    return entries(folder, wanted, passedOver);
}

void collectInto(QStringList& all, const HostPath& folder, const DrivePath& shown, Files::Depth depth,
                 QStringList* unreadable) {
    std::error_code error;
    const QStringList files = entries(folder, Wanted::Files, error);
    if (error && unreadable)
        *unreadable += systemFailure(error.value(), shown.text()).message;
    for (const QString& name : files)
        all += (shown / AnsiCodePage::squeeze(name)).text();
    if (depth == Files::Depth::ThisFolder)
        return;
    for (const QString& name : entries(folder, Wanted::Folders)) {
        const HostPath sub = folder / toHostPath(name);
        // A link may lead back to a folder above, and the walk would not end.
        if (!fs::is_symlink(sub))
            collectInto(all, sub, shown / AnsiCodePage::squeeze(name), depth, unreadable);
    }
}

Result<void> write(const Result<HostPath>& host, const DrivePath& path, const QByteArray& bytes,
                   NewContent::Durability durability) {
    if (!host)
        return host.failure();
    NewContent content(*host, path.text());
    content.append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    return content.commit(durability);
}

} // namespace

Result<HostPath> Files::host(const DrivePath& path) const {
    if (path.text().contains(u'?'))
        return failure(Failure::Kind::NotFound, path, u"the name holds a \"?\""_s);
    if (auto found = m_drives.toHost(path))
        return *found;
    return failure(Failure::Kind::NotFound, path, u"no such drive or path"_s);
}

bool Files::fileExists(const DrivePath& path) const {
    const auto found = host(path);
    std::error_code error;
    return found && fs::is_regular_file(*found, error);
}

bool Files::folderExists(const DrivePath& path) const {
    const auto found = host(path);
    std::error_code error;
    return found && fs::is_directory(*found, error);
}

Result<void> Files::makeFolder(const DrivePath& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    if (::mkdir(found->c_str(), 0700) == 0 || (errno == EEXIST && folderExists(path)))
        return {};
    return systemFailure(errno, path.text());
}

Result<bool> Files::makeNewFolder(const DrivePath& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    if (::mkdir(found->c_str(), 0700) == 0)
        return true;
    if (errno == EEXIST)
        return false;
    return systemFailure(errno, path.text());
}

Result<void> Files::removeFile(const DrivePath& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    if (::unlink(found->c_str()) != 0)
        return systemFailure(errno, path.text());
    return {};
}

Result<void> Files::removeTree(const DrivePath& path) const {
    const DrivePath folder = path.folder();
    if (!folder.text().contains(u'\\') || QStringList{QString(), u"."_s, u".."_s}.contains(path.leaf()))
        return failure(Failure::Kind::Refused, path, u"a folder of the drive itself is not removed"_s);
    const auto found = host(path);
    if (!found)
        return found.failure();
    std::error_code error;
    fs::remove_all(*found, error);
    return error ? Result<void>(systemFailure(error.value(), path.text())) : Result<void>();
}

Result<QByteArray> Files::read(const DrivePath& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    return readWholeFile(*found, path.text(), largestRead);
}

Result<void> Files::writeWhole(const DrivePath& path, const QByteArray& bytes) const {
    return write(host(path), path, bytes, NewContent::Durability::Synced);
}

Result<void> Files::writePassing(const DrivePath& path, const QByteArray& bytes) const {
    return write(host(path), path, bytes, NewContent::Durability::Passing);
}

Result<void> Files::copyFile(const DrivePath& source, const DrivePath& target) const {
    const auto from = host(source);
    if (!from)
        return from.failure();
    const auto to = host(target);
    if (!to)
        return to.failure();
    const auto opened = openSource(*from, source.text());
    if (!opened)
        return opened.failure();
    NewContent content(*to, target.text());
    const auto copied = appendFrom(*opened, toTheEnd, content, source.text());
    if (!copied)
        return copied.failure();
    return content.commit();
}

Result<void> Files::keepCopy(const DrivePath& source, const DrivePath& target) const {
    const auto from = host(source);
    const auto to = host(target);
    std::error_code error;
    if (from && to && fs::is_regular_file(*from, error) && !fs::is_symlink(*from, error) &&
        ::link(from->c_str(), to->c_str()) == 0)
        return {};
    return copyFile(source, target);
}

Result<qint64> Files::size(const DrivePath& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    struct stat status {};
    if (::stat(found->c_str(), &status) != 0)
        return systemFailure(errno, path.text());
    if (!S_ISREG(status.st_mode))
        return failure(Failure::Kind::Unsupported, path, u"not a file"_s);
    return static_cast<qint64>(status.st_size);
}

Result<qint64> Files::freeBytes(const DrivePath& folder) const {
    const auto found = host(folder);
    if (!found)
        return found.failure();
    std::error_code error;
    const std::filesystem::space_info space = std::filesystem::space(*found, error);
    if (error)
        return systemFailure(error.value(), folder.text());
    return static_cast<qint64>(space.available);
}

QStringList Files::names(const DrivePath& folder, const QString& patterns) const {
    QStringList names = storedNames(folder, patterns);
    for (QString& name : names)
        name = AnsiCodePage::squeeze(name);
    return names;
}

QStringList Files::storedNames(const DrivePath& folder, const QString& patterns) const {
    QStringList wanted;
    for (const QString& pattern : patterns.split(u';', Qt::SkipEmptyParts))
        wanted += pattern.trimmed();
    const auto found = host(folder);
    QStringList names;
    if (!found)
        return names;
    for (const QString& name : entries(*found, Wanted::Files)) {
        if (matchesAny(wanted, name))
            names += name;
    }
    return names;
}

QStringList Files::folders(const DrivePath& folder) const {
    const auto found = host(folder);
    QStringList names;
    if (!found)
        return names;
    for (const QString& name : entries(*found, Wanted::Folders))
        names += AnsiCodePage::squeeze(name);
    return names;
}

QStringList Files::collect(const DrivePath& folder, Depth depth, QStringList* unreadable) const {
    const auto found = host(folder);
    QStringList all;
    if (found)
        collectInto(all, *found, folder, depth, unreadable);
    else if (unreadable)
        *unreadable += found.failure().message;
    return all;
}

void FileList::setFolder(const DrivePath& folder) {
    m_folder = folder;
    refresh();
}

void FileList::setPattern(const QString& patterns) {
    m_pattern = patterns;
    refresh();
}

void FileList::refresh() {
    m_names = m_as == Names::Stored ? m_files.storedNames(m_folder, m_pattern) : m_files.names(m_folder, m_pattern);
}

} // namespace lumora
