#pragma once

#include "common/HostFile.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/BmpFile.h"

#include <QRect>
#include <QRegion>

#include <atomic>
#include <filesystem>
#include <optional>
#include <thread>

namespace lumora {

// The one step back of a correction: a file with the whole picture as it was before the latest change. The file is
// written once, in the background, while the customer looks for the eye, since writing 50 megapixels takes seconds;
// before a later change only the rows that differ are brought up to date. The file gets its name with the first change,
// so that a visit without a correction leaves no undo copy. A step back never reads the file of an earlier visit.
class RedUndoCopy {
public:
    RedUndoCopy() = default;
    ~RedUndoCopy();
    RedUndoCopy(const RedUndoCopy&) = delete;
    RedUndoCopy& operator=(const RedUndoCopy&) = delete;

    // Starts writing the copy beside file; what an earlier visit left there is not touched yet.
    void begin(const Bitmap& picture, const std::filesystem::path& file);

    // False while keep() would have to wait for the writing of a whole picture.
    bool isReady() const { return m_rows || (m_written && m_waiting && !m_waiting->failed()); }

    // Brings the file to the picture as it is now, before the part changes. Waits for the background writing.
    Result<void> keep(const Bitmap& picture, const QRect& part);

    // The picture was changed in this region without a keep() before.
    void changedOtherwise(const QRegion& region);

    // True when there is a step to take back.
    bool canRestore() const { return m_kept; }

    // Brings the picture back to what the file holds and tells where it changed. Nothing changes on failure.
    Result<QRegion> restore(Bitmap& picture);

    // Forgets the copy; the file stays if it holds a step back.
    void end();

private:
    Result<void> commitWaiting();
    Result<void> finishWriting(const Bitmap& picture);

    std::filesystem::path m_file;
    std::optional<NewContent> m_waiting; // the copy until the first change
    std::atomic<bool> m_written = false; // the thread is done with m_waiting
    std::jthread m_writer;
    std::optional<BmpRows> m_rows;
    QRegion m_differs; // where picture and file differ
    bool m_kept = false;
};

} // namespace lumora
