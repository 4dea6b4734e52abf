#include "desk/HotFolder.h"

#include "common/HostFile.h"
#include "order/PrintFile.h"
#include "platform/files/HostPath.h"

#include <QRandomGenerator>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <cstdio>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;

namespace {

const fs::path hidden = ".desk";
// Below a room: what is written, and, once all of it is, what goes to its place.
const fs::path draft = "draft";
const fs::path outward = "out";

QString newId() {
    return QString::number(QRandomGenerator::system()->generate64(), 16).rightJustified(16, u'0');
}

// Moves the file to a name that nothing has. 0, or the errno.
int moveToNewName(const fs::path& from, const fs::path& to) {
    if (::renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), RENAME_NOREPLACE) == 0)
        return 0;
    if (errno != EINVAL && errno != ENOSYS)
        return errno;
    // Network file systems do not know the flag.
    std::error_code error;
    if (fs::exists(to, error) || error)
        return error ? error.value() : EEXIST;
    return ::rename(from.c_str(), to.c_str()) == 0 ? 0 : errno;
}

Result<void> syncFolder(const fs::path& folder) {
    const Descriptor open(::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (open.valid() && ::fsync(open.number()) != 0 && errno == EIO)
        return fileFailure(folder, u"can't be written"_s, errno);
    return {};
}

// Relative to the folder. A folder that can't be read is a failure: who clears the room takes the list for all.
Result<std::vector<fs::path>> filesBelow(const fs::path& folder) {
    std::vector<fs::path> files;
    std::error_code error;
    fs::recursive_directory_iterator at(folder, error);
    for (const fs::recursive_directory_iterator end; !error && at != end; at.increment(error)) {
        std::error_code asked;
        if (at->is_regular_file(asked))
            files.push_back(at->path().lexically_relative(folder));
        else if (asked && asked != std::errc::no_such_file_or_directory)
            return fileFailure(at->path(), u"can't be read"_s, asked.value());
    }
    if (error)
        return fileFailure(folder, u"can't be listed"_s, error.value());
    std::sort(files.begin(), files.end());
    return files;
}

Result<void> makeFolders(const fs::path& folder) {
    std::error_code error;
    fs::create_directories(folder, error);
    if (error)
        return fileFailure(folder, u"the folder can't be made"_s, error.value());
    return {};
}

} // namespace

Result<HotFolder> HotFolder::open(const fs::path& given) {
    if (const auto made = makeFolders(given / hidden); !made)
        return made.failure();
    std::error_code error;
    const fs::path folder = fs::canonical(given, error);
    if (error)
        return fileFailure(given, u"can't be read"_s, error.value());
    // Rooms hold customers' pictures.
    ::chmod((folder / hidden).c_str(), 0700);
    const fs::path idFile = folder / hidden / "id";
    if (!fs::exists(idFile, error)) {
        const QString own = newId();
        const fs::path ownFile = folder / hidden / ("id-" + own.toStdString());
        if (const auto written = writeWholeFile(ownFile, own.toLatin1()); !written)
            return written.failure();
        const int failed = moveToNewName(ownFile, idFile);
        if (failed == EEXIST)
            fs::remove(ownFile, error);
        else if (failed != 0)
            return fileFailure(idFile, u"can't be written"_s, failed);
    }
    const Result<QByteArray> id = readWholeFile(idFile, toText(idFile), 64);
    if (!id)
        return id.failure();
    if (id->size() != 16)
        return Failure{Failure::Kind::Damaged, u"%1: holds no mark of a hot folder"_s.arg(toText(idFile))};
    return HotFolder(folder, QString::fromLatin1(*id));
}

fs::path HotFolder::pathOf(const QString& room) const {
    return m_folder / hidden / toHostPath(room);
}

QString HotFolder::keyOf(const QString& room) {
    return room.left(room.lastIndexOf(u'~'));
}

QStringList HotFolder::rooms() const {
    QStringList names;
    std::error_code error;
    for (fs::directory_iterator at(m_folder / hidden, error), end; !error && at != end; at.increment(error)) {
        if (const QString name = toText(at->path().filename()); name.contains(u'~'))
            names += name;
    }
    return names;
}

Result<void> HotFolder::checkId() const {
    const fs::path idFile = m_folder / hidden / "id";
    const Result<QByteArray> id = readWholeFile(idFile, toText(idFile), 64);
    if (!id)
        return id.failure();
    if (QString::fromLatin1(*id) != m_id)
        return Failure{Failure::Kind::NotFound, u"%1 is not the hot folder that it was"_s.arg(toText(m_folder))};
    return {};
}

bool HotFolder::isOld(const QString& room) const {
    std::error_code error;
    const fs::file_time_type changed = fs::last_write_time(pathOf(room), error);
    return !error && fs::file_time_type::clock::now() - changed > std::chrono::hours(24);
}

Result<QString> HotFolder::makeRoom(const QString& key) const {
    if (const auto same = checkId(); !same)
        return same.failure();
    const QString room = key + u'~' + newId();
    if (const auto made = makeFolders(pathOf(room) / draft); !made)
        return made.failure();
    return room;
}

bool HotFolder::isReady(const QString& room) const {
    std::error_code error;
    return fs::is_directory(pathOf(room) / outward, error);
}

Result<Descriptor> HotFolder::hold(const QString& room) const {
    const fs::path path = pathOf(room) / "lock";
    Descriptor file(::open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600));
    if (!file.valid())
        return fileFailure(path, u"can't be written"_s, errno);
    if (::flock(file.number(), LOCK_EX | LOCK_NB) == 0)
        return file;
    if (errno == EWOULDBLOCK)
        return Failure{Failure::Kind::InUse, u"%1: another process is at work in it"_s.arg(toText(pathOf(room)))};
    return fileFailure(path, u"can't be locked"_s, errno);
}

void HotFolder::clear(const QString& room) const {
    std::error_code error;
    // What is ended in the middle of this leaves no room that counts as ready.
    fs::rename(pathOf(room) / outward, pathOf(room) / draft, error);
    fs::remove_all(pathOf(room), error);
}

Result<void> HotFolder::makeReady(const QString& room, const ArrivedOrder& order, const PrintLayout& layout,
                                  PrintFileShape shape) const {
    const fs::path out = pathOf(room) / draft;
    const auto put = [&](const fs::path& place, const QByteArray& picture) -> Result<void> {
        std::error_code error;
        for (const fs::path& taken : {out / place, m_folder / place}) {
            if (fs::exists(taken, error))
                return Failure{Failure::Kind::InUse, u"%1: is there already"_s.arg(toText(m_folder / place))};
            if (error)
                return fileFailure(taken, u"can't be read"_s, error.value());
        }
        if (const auto made = makeFolders((out / place).parent_path()); !made)
            return made;
        return writeWholeFile(out / place, picture);
    };
    for (const ArrivedOrder::Print& print : order.prints) {
        const Result<QByteArray> bytes = readHostFile(print.path);
        const Result<PrintFileContent> content =
            bytes ? readPrintFile(*bytes, shape) : Result<PrintFileContent>(bytes.failure());
        if (!content)
            return content.failure();
        const QString leaf = plainName(order.name + u'_' + print.file.chopped(4)) + u".jpg"_s;
        const QString folder = layout.folderOf(PrintWords::of(print.name), order.name);
        if (const auto written = put(toHostPath(folder + u'/' + leaf), content->picture); !written)
            return written;
    }
    const Result<QByteArray> sheet = readHostFile(order.sheet);
    if (!sheet)
        return sheet.failure();
    if (const auto written = put(toHostPath(u"sheets/"_s + plainName(order.name) + u".jpg"_s), *sheet); !written)
        return written;
    if (const int failed = moveToNewName(out, pathOf(room) / outward); failed != 0)
        return fileFailure(out, u"can't be renamed"_s, failed);
    return syncFolder(pathOf(room));
}

Result<void> HotFolder::place(const QString& room) const {
    if (const auto same = checkId(); !same)
        return same;
    const fs::path out = pathOf(room) / outward;
    std::error_code error;
    if (!fs::is_directory(out, error))
        return Failure{Failure::Kind::NotFound,
                       u"%1 was removed before all prints had moved to their places: look which ones came out, and "
                       u"place the others by export"_s.arg(toText(out))};
    const Result<std::vector<fs::path>> files = filesBelow(out);
    if (!files)
        return files.failure();
    for (const fs::path& file : *files) {
        const fs::path target = m_folder / file;
        if (const auto made = makeFolders(target.parent_path()); !made)
            return made;
        const int failed = moveToNewName(out / file, target);
        if (failed == ENOENT && !fs::exists(out / file, error) && !error)
            continue;
        if (failed != 0)
            return fileFailure(target, u"can't be placed"_s, failed);
        // Else a print could come back into the room by a loss of power, with the minilab at work on it.
        if (const auto synced = syncFolder(target.parent_path()); !synced)
            return synced;
    }
    const Result<std::vector<fs::path>> left = filesBelow(out);
    if (!left)
        return left.failure();
    if (!left->empty())
        return Failure{Failure::Kind::Other, u"%1: has not moved to its place"_s.arg(toText(out / left->front()))};
    return {};
}

Result<void> HotFolder::addLine(const QString& list, const QByteArray& head, const QByteArray& line) const {
    if (const auto same = checkId(); !same)
        return same;
    const fs::path path = m_folder / toHostPath(list);
    const auto refuse = [&](int error) { return fileFailure(path, u"can't be written"_s, error); };
    const Descriptor file(::open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0666));
    if (!file.valid() || ::flock(file.number(), LOCK_EX) != 0)
        return refuse(errno);
    const Result<QByteArray> all = readWholeFile(path, toText(path), qint64(1) << 30);
    if (!all)
        return all.failure();
    // A line without an end was cut by a full disk or a loss of power.
    const qsizetype whole = all->lastIndexOf('\n') + 1;
    const QByteArray mark = ',' + line.split(',').value(1) + ',';
    if (all->first(whole).contains(mark))
        return {};
    const QByteArray text = (whole == 0 ? head + "\r\n" : QByteArray()) + line + "\r\n";
    if (::ftruncate(file.number(), whole) != 0)
        return refuse(errno);
    const ssize_t written = ::pwrite(file.number(), text.constData(), static_cast<std::size_t>(text.size()), whole);
    if (written != text.size() || ::fsync(file.number()) != 0) {
        const int error = written < 0 ? errno : ENOSPC;
        return ::ftruncate(file.number(), whole) == 0 ? refuse(error) : refuse(errno);
    }
    return {};
}

} // namespace lumora
