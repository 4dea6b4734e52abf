#pragma once

#include "imaging/files/PictureFile.h"
#include "platform/files/HostPath.h"

#include <QCache>
#include <QString>

#include <atomic>
#include <memory>
#include <mutex>
#include <vector>

namespace lumora {

// The small pictures of the pages: those that were seen are kept, up to 64 MiB, and those of the next page are read
// while the customer looks at this one. A file is known by path, length and time, so that one that has changed is read
// again.
class SmallPictures {
public:
    SmallPictures() = default;
    SmallPictures(const SmallPictures&) = delete;
    SmallPictures& operator=(const SmallPictures&) = delete;
    ~SmallPictures() { stopReadingAhead(); }

    // As loadSmallPictures().
    std::vector<Result<Bitmap>> load(const std::vector<HostPath>& paths, int cell);
    bool keeps(const HostPath& path, int cell) const { return m_kept->has(keyOf(path, cell)); }

    // Reads these in the background, one after the other, and nothing else any more. Does not wait for the picture that
    // is being read.
    void readAhead(const std::vector<HostPath>& paths, int cell);
    void stopReadingAhead() { ++m_kept->request; }

private:
    // The reader holds it too, and may end after this.
    struct Kept {
        bool has(const QString& key);
        void keep(const QString& key, const Result<Bitmap>& picture);

        std::mutex mutex;
        QCache<QString, Bitmap> pictures{qsizetype(64) << 20}; // costs are bytes
        std::atomic<unsigned> request = 0;                     // the latest; the reader gives up an earlier one
    };
    static QString keyOf(const HostPath& path, int cell);

    std::shared_ptr<Kept> m_kept = std::make_shared<Kept>();
};

} // namespace lumora
