#pragma once

#include "door/DoorNeed.h"
#include "door/DoorStatus.h"
#include "door/SrgbConversion.h"
#include "imaging/files/PictureInput.h"

#include <QByteArray>
#include <QImage>

#include <filesystem>
#include <memory>
#include <optional>

namespace lumora {

// A picture as its file stores it: turned only where the format's own decoder turns, in its own colours.
struct StoredPicture {
    QImage image;
    SrgbConversion::Pixels pixels = SrgbConversion::Pixels::Rgb;
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
    // Done, or why there is no picture. One call uses the reader up.
    DoorStatus read(StoredPicture& picture);
    // The small picture that a HEIC or AVIF file carries beside its own; Unsupported where there is none.
    DoorStatus readDraft(StoredPicture& picture);

private:
    StoredPictureReader() = default;

    DoorStatus readJpeg(StoredPicture& picture);
    enum class Part { Whole, Draft };
    DoorStatus readHeif(StoredPicture& picture, Part part);
    DoorStatus readByQt(StoredPicture& picture);

    QByteArray m_bytes;
    PictureKind m_kind = PictureKind::None;
    std::optional<PictureHeader> m_header;
    std::optional<PictureInput> m_input;
};

} // namespace lumora
