#pragma once

#include "common/Result.h"

#include <QByteArray>

#include <cstddef>
#include <cstdint>
#include <filesystem>

namespace lumora {

// A picture file open for reading, with the format that its first bytes show.
class PictureInput {
public:
    enum class Format { Jpeg, Bmp, Png };

    // An empty file, a folder or pipe, and a file of another format fail each with its own reason.
    static Result<PictureInput> open(const std::filesystem::path& path);
    // A JPEG file that lies in memory.
    static PictureInput ofJpeg(QByteArray file);

    PictureInput(PictureInput&& other) noexcept;
    PictureInput& operator=(PictureInput&&) = delete;
    ~PictureInput();

    const std::filesystem::path& path() const { return m_path; }
    Format format() const { return m_format; }
    std::int64_t size() const { return m_size; }
    int descriptor() const { return m_file; } // -1 in memory

    // Gives the number of bytes read, 0 at the end, or -1 with errno set.
    std::ptrdiff_t read(void* target, std::size_t count);

private:
    PictureInput() = default;

    std::filesystem::path m_path;
    int m_file = -1;
    QByteArray m_bytes; // without a file
    std::int64_t m_at = 0;
    std::int64_t m_size = 0;
    Format m_format = Format::Jpeg;
};

// A failure of this picture: "PATH: reason".
Failure pictureFailure(const std::filesystem::path& path, Failure::Kind kind, const QString& reason);

// Fails when a side is under 1 or over 65,500, or with more than 250 million pixels.
Result<void> checkPictureBounds(const std::filesystem::path& path, std::int64_t width, std::int64_t height);

} // namespace lumora
