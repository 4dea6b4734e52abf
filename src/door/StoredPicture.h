#pragma once

#include "common/Result.h"
#include "door/DoorNeed.h"
#include "door/SrgbConversion.h"
#include "imaging/files/JpegReader.h"

#include <QByteArray>
#include <QImage>

#include <filesystem>
#include <memory>

namespace lumora {

// A picture as its file stores it: turned only where the format's own decoder turns, in its own colours.
struct StoredPicture {
    QImage image;
    SrgbConversion::Pixels pixels = SrgbConversion::Pixels::Light;
    HeaderColours colours;
    QByteArray profile; // where the colours come by one
    int orientation = 1;
};

// Decodes a file of any kind in two steps: what needs files of this machine happens in open(), what a stranger's bytes
// decide happens in the other calls.
class StoredPictureReader {
public:
    static Result<std::unique_ptr<StoredPictureReader>> open(const std::filesystem::path& path);

    const QByteArray& bytes() const { return m_bytes; }
    const PictureHeader& header();
    // One call uses the reader up.
    Result<StoredPicture> read();

private:
    explicit StoredPictureReader(const std::filesystem::path& path)
        : m_path(path) {}

    Result<StoredPicture> readJpeg(StoredPicture picture);
    Result<StoredPicture> readHeif();
    Result<StoredPicture> readByQt(StoredPicture picture);
    Result<void> checkSize(qint64 width, qint64 height) const;
    Failure damaged() const;

    std::filesystem::path m_path;
    QByteArray m_bytes;
    PictureKind m_kind = PictureKind::None;
    std::optional<PictureHeader> m_header;
    std::optional<PictureInput> m_input;
};

} // namespace lumora
