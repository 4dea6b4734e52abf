#include "selection/SmallPictures.h"

#include "common/Background.h"

#include <QThreadPool>

#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QThreadPool& reader() {
    static QThreadPool& pool = backgroundPool(1);
    return pool;
}

} // namespace

QString SmallPictures::keyOf(const HostPath& path, int cell) {
    std::error_code absent;
    const auto length = std::filesystem::file_size(path, absent);
    const auto time = std::filesystem::last_write_time(path, absent).time_since_epoch().count();
    return absent ? QString() : u"%1|%2|%3|"_s.arg(cell).arg(length).arg(time) + toText(path);
}

bool SmallPictures::Kept::has(const QString& key) {
    const std::lock_guard lock(mutex);
    return pictures.contains(key);
}

void SmallPictures::Kept::keep(const QString& key, const Result<Bitmap>& picture) {
    if (!picture || key.isEmpty())
        return;
    const std::lock_guard lock(mutex);
    pictures.insert(key, new Bitmap(*picture), picture->image().sizeInBytes());
}

std::vector<Result<Bitmap>> SmallPictures::load(const std::vector<HostPath>& paths, int cell) {
    std::vector<QString> keys;
    std::vector<HostPath> unknown;
    std::vector<std::optional<Result<Bitmap>>> found(paths.size());
    for (std::size_t i = 0; i < paths.size(); ++i) {
        keys.push_back(keyOf(paths[i], cell));
        const std::lock_guard lock(m_kept->mutex);
        if (const Bitmap* kept = m_kept->pictures.object(keys[i]))
            found[i] = *kept;
        else
            unknown.push_back(paths[i]);
    }
    std::vector<Result<Bitmap>> read = loadSmallPictures(unknown, cell);
    std::vector<Result<Bitmap>> all;
    for (std::size_t i = 0, next = 0; i < paths.size(); ++i) {
        if (!found[i]) {
            found[i] = std::move(read[next++]);
            m_kept->keep(keys[i], *found[i]);
        }
        all.push_back(std::move(*found[i]));
    }
    return all;
}

void SmallPictures::readAhead(const std::vector<HostPath>& paths, int cell) {
    reader().start([kept = m_kept, request = ++m_kept->request, paths, cell] {
        for (const HostPath& path : paths) {
            if (kept->request != request)
                return;
            const QString key = keyOf(path, cell);
            if (!kept->has(key))
                kept->keep(key, loadSmallPictures({path}, cell).front());
        }
    });
}

} // namespace lumora
