#include "selection/SmallPictures.h"

namespace lumora {

using namespace Qt::StringLiterals;

QString SmallPictures::keyOf(const HostPath& path, int cell) {
    std::error_code absent;
    const auto length = std::filesystem::file_size(path, absent);
    const auto time = std::filesystem::last_write_time(path, absent).time_since_epoch().count();
    return absent ? QString() : u"%1|%2|%3|"_s.arg(cell).arg(length).arg(time) + toText(path);
}

void SmallPictures::keep(const QString& key, const Result<Bitmap>& picture) {
    if (!picture || key.isEmpty())
        return;
    const std::lock_guard lock(m_mutex);
    m_kept.insert(key, new Bitmap(*picture), picture->image().sizeInBytes());
}

bool SmallPictures::keeps(const HostPath& path, int cell) const {
    const QString key = keyOf(path, cell);
    const std::lock_guard lock(m_mutex);
    return m_kept.contains(key);
}

std::vector<Result<Bitmap>> SmallPictures::load(const std::vector<HostPath>& paths, int cell) {
    std::vector<QString> keys;
    std::vector<HostPath> unknown;
    std::vector<std::optional<Result<Bitmap>>> found(paths.size());
    for (std::size_t i = 0; i < paths.size(); ++i) {
        keys.push_back(keyOf(paths[i], cell));
        const std::lock_guard lock(m_mutex);
        if (const Bitmap* kept = m_kept.object(keys[i]))
            found[i] = *kept;
        else
            unknown.push_back(paths[i]);
    }
    std::vector<Result<Bitmap>> read = loadSmallPictures(unknown, cell);
    std::vector<Result<Bitmap>> all;
    for (std::size_t i = 0, next = 0; i < paths.size(); ++i) {
        if (!found[i]) {
            found[i] = std::move(read[next++]);
            keep(keys[i], *found[i]);
        }
        all.push_back(std::move(*found[i]));
    }
    return all;
}

void SmallPictures::readAhead(const std::vector<HostPath>& paths, int cell) {
    m_reader = std::jthread([this, paths, cell](const std::stop_token& stop) {
        for (const HostPath& path : paths) {
            if (stop.stop_requested())
                return;
            const QString key = keyOf(path, cell);
            if (!keeps(path, cell))
                keep(key, loadSmallPictures({path}, cell).front());
        }
    });
}

} // namespace lumora
