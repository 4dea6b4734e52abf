#pragma once

#include "common/Result.h"
#include "editing/render/PicturePlacement.h"
#include "imaging/Bitmap.h"
#include "imaging/drawing/CaptionDraw.h"

#include <QByteArray>
#include <QColor>

#include <cstdint>
#include <filesystem>
#include <optional>

// The renderer of an edited picture: the editor's preview and the print come from the same drawing, at two sizes. A
// frame or a font that does not load is left out; a picture that does not load is a failure.
namespace lumora {

struct EditFields;

// The share of each channel in the grey that a tone begins with; the three add up to nine tenths.
inline constexpr float greyWeight = 0.3F;

enum class FrameUse { Preview, PreviewElsePrint, Print };

// The frame of a record out of the folder that holds the categories: "k<name>.bmp" is what the preview shows and
// "<name>.bmp" what is printed; where the latter can't be loaded, what was seen is printed. PreviewElsePrint falls back
// the other way. No value for "000" and "999", and for names that lead out of that folder.
std::optional<Bitmap> loadFrame(const std::filesystem::path& framesFolder, const EditFields& edit, FrameUse use);

// A picture opened for editing, small enough to be drawn at each tick of a held button.
class EditedPreview {
public:
    // zoomPercent decides the size of the work picture and stays so. The file may be a corrected copy. grey: the
    // record's tone flag. largestScale: how much larger than the box render() will be asked to draw; that many more
    // pixels are kept where the file has them.
    enum class Tone { Colour, Grey };
    static Result<EditedPreview> open(const std::filesystem::path& file, PaperSize paper, int zoomPercent, Tone tone,
                                      double largestScale = 1);

    PictureSize fileSize() const { return m_file; } // of the picture itself
    PictureSize box() const { return m_box; }
    const Bitmap& workPicture() const { return m_work; }

    // Turns the work picture grey; twice would darken it twice.
    void turnGrey();

    // As the function of PicturePlacement.h, in this picture's box.
    void placeAtCentreIfUnset(EditFields& edit) const { lumora::placeAtCentreIfUnset(edit, m_box); }

    // True when no part of the paper is bare, and when at least a pixel of the picture lies on it.
    bool coversPaper(const EditFields& edit) const;
    bool touchesPaper(const EditFields& edit) const;
    // The smallest zoom from the record's on with which the picture covers the paper, in the preview and in the print;
    // the largest where none does.
    static constexpr std::int16_t largestCoveringZoom = 210; // per cent
    std::int16_t coveringZoom(EditFields edit) const;

    // What an uncovered part of the paper shows; without it the whole picture, stretched.
    void setBackground(QColor colour);

    // Draws in the box's size times scale, rounded; every number of pixels in the record is multiplied by scale, as in
    // the print. frame comes from loadFrame. The stretched frame is kept as long as the same bitmap comes, and the
    // caption as CaptionInks says, so the caller should keep the frame and not load it for each drawing.
    Bitmap render(const EditFields& edit, const std::optional<Bitmap>& frame, double scale = 1);

private:
    EditedPreview() = default;

    // What lies over the picture at one scale.
    struct Overlay {
        double scale = 0;
        Bitmap background;
        std::int64_t frameKey = 0;
        KeyedFrame frame;
        CaptionInks inks;
        CaptionInk ink;
    };
    const Bitmap& sourceFor(double scale) const { return scale > 1 && !m_sharp.isNull() ? m_sharp : m_work; }
    void prepareOverlay(const EditFields& edit, const std::optional<Bitmap>& frame, double scale);

    PictureSize m_file;
    PaperSize m_paper;
    PictureSize m_box;
    Bitmap m_work;
    Bitmap m_sharp; // the work picture with more pixels, or null
    std::optional<QColor> m_colour;
    Overlay m_overlay;
};

struct EditedPrint {
    std::filesystem::path file; // the customer's picture or its corrected copy
    PaperSize paper;
    std::filesystem::path framesFolder;
    Bitmap grey = {};                      // what loadGrey() made of the file, where that was done before
    std::optional<QColor> background = {}; // without it the whole picture, stretched
};

// The whole picture as a tone prints it: grey at full size, ahead of any scaling.
Result<Bitmap> loadGrey(const std::filesystem::path& file);

// About how many bytes of memory the print takes while it is made.
std::int64_t renderingMemory(const EditedPrint& print, const EditFields& edit);

// The pixels of the print: 100 a centimetre, lying or upright as the file is.
Result<Bitmap> renderEditedPrint(const EditedPrint& print, const EditFields& edit, PictureTimes* times = nullptr);

// The same as the bytes of a JPEG file of quality 90.
Result<QByteArray> renderEditedPrintToJpeg(const EditedPrint& print, const EditFields& edit,
                                           PictureTimes* times = nullptr);

} // namespace lumora
