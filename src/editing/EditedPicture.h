#pragma once

#include "common/Result.h"
#include "editing/PicturePlacement.h"
#include "imaging/Bitmap.h"

#include <QByteArray>
#include <QColor>

#include <filesystem>
#include <optional>

// The renderer of an edited picture: the editor's preview and the print come from the same drawing, at two sizes. A
// frame or a font that does not load is left out; a picture that does not load is a failure.
namespace lumora {

struct EditFields;

// A tone makes the picture grey first: this much of red, green and blue together, so that white comes out at nine
// tenths.
inline constexpr float greyWeight = 0.3F;

enum class FrameUse { Preview, Print };

// The frame of a record out of the folder that holds the categories: "k<name>.bmp" is what the preview shows and
// "<name>.bmp" what is printed; where the latter can't be loaded, what was seen is printed. No value for "000" and
// "999", and for names that lead out of that folder.
std::optional<Bitmap> loadFrame(const std::filesystem::path& framesFolder, const EditFields& edit, FrameUse use);

// A picture opened for editing: small enough to be drawn anew at each tick of a held button.
class EditedPreview {
public:
    // zoomPercent decides the size of the work picture and stays so. The file may be a corrected copy. grey: the
    // record's tone flag.
    enum class Tone { Colour, Grey };
    static Result<EditedPreview> open(const std::filesystem::path& file, PaperDigits paper, int zoomPercent, Tone tone);

    PictureSize box() const { return m_box; }
    const Bitmap& workPicture() const { return m_work; }

    // Turns the work picture grey; twice would darken it twice.
    void turnGrey();

    // A position of 781 or more in either direction is not set; both then become the centre of the box.
    void placeAtCentreIfUnset(EditFields& edit) const;

    // What an uncovered part of the paper shows; without it the whole picture, stretched.
    void setBackground(QColor colour);

    // In the box's size; frame as loadFrame gives it, or none.
    Bitmap render(const EditFields& edit, const std::optional<Bitmap>& frame) const;

private:
    EditedPreview() = default;
    void stretchBackground();

    PictureSize m_box;
    Bitmap m_work;
    Bitmap m_background;
};

struct EditedPrint {
    std::filesystem::path file; // the customer's picture or its corrected copy
    PaperDigits paper;
    std::filesystem::path framesFolder;
    // A tone makes the picture grey first. AlreadyGrey: the file is a grey copy, whatever the record says.
    enum class Source { AsItIs, AlreadyGrey } source = Source::AsItIs;
    std::optional<QColor> background; // without it the whole picture, stretched
};

// The pixels of the print: 100 a centimetre, lying or upright as the file is.
Result<Bitmap> renderEditedPrint(const EditedPrint& print, const EditFields& edit, PictureTimes* times = nullptr);

// The same as the bytes of a JPEG file of quality 90.
Result<QByteArray> renderEditedPrintToJpeg(const EditedPrint& print, const EditFields& edit,
                                           PictureTimes* times = nullptr);

} // namespace lumora
