#pragma once

#include "imaging/files/PictureFile.h"
#include "platform/files/HostPath.h"

#include <QCache>
#include <QString>

#include <mutex>
#include <optional>
#include <thread>
#include <vector>

namespace lumora {

// The small pictures of the pages: those that were seen are kept, up to 64 MiB, and those of the next page are read
// while the customer looks at this one. A file is known by path, length and time, so that one that has changed is read
// again.
class SmallPictures {
public:
    // As loadSmallPictures().
    std::vector<Result<Bitmap>> load(const std::vector<HostPath>& paths, int cell);
    bool keeps(const HostPath& path, int cell) const;

    // Reads these in the background, one after the other.
    void readAhead(const std::vector<HostPath>& paths, int cell);
    void stopReadingAhead() { m_reader.request_stop(); }

private:
    static QString keyOf(const HostPath& path, int cell);
    void keep(const QString& key, const Result<Bitmap>& picture);

    mutable std::mutex m_mutex;
    QCache<QString, Bitmap> m_kept{qsizetype(64) << 20}; // costs are bytes
    std::jthread m_reader;                               // goes first, since it uses the others
};

} // namespace lumora
