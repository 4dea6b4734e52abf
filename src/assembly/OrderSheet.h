#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"

#include <QDateTime>
#include <QList>
#include <QString>

#include <filesystem>
#include <functional>
#include <optional>
#include <vector>

// The order sheet: the order's details as lines of text on top of a contact sheet of its pictures, for the people at
// the lab.
namespace lumora {

struct SessionState;

// What the two preparation pages draw differently.
enum class SheetKind { Plain, Edited, Album };

// The box grows with the number of pictures.
PictureSize orderSheetSize(SheetKind kind, int items);

QColor orderSheetBackground(SheetKind kind, const SessionState& state);

struct SheetLine {
    QString text;
    bool onlyHere = false; // the order log lacks it: it is broken into several lines, never shortened
};

// The lines of text from the top, blanks included.
QList<SheetLine> plainSheetLines(const SessionState& state, const QDateTime& now);
QList<SheetLine> editedSheetLines(const SessionState& state, const QDateTime& now);
QList<SheetLine> albumSheetLines(const SessionState& state, const QDateTime& now);

// A line, or a piece of one, where it stands on the sheet, in pixels.
struct PlacedText {
    QString text;
    int fontPixels;
    int top;
};
struct PlacedLines {
    std::vector<PlacedText> texts; // from the top
    int bottom;
};

// A line that is too long is set smaller, down to 8 pixels; what is longer still is shortened with "...", or broken
// where it is only here or has a letter that the log's code page lacks.
PlacedLines placeSheetLines(const QList<SheetLine>& lines, int sheetWidth);

// A picture of the contact sheet and the text below it. A cell without a source stays empty.
struct SheetCell {
    std::optional<std::filesystem::path> source;
    QString caption;
};

inline constexpr int sheetCellSize = 80;

// How a picture lies on the sheet, always in landscape: 80 pixels wide, a portrait or square one turned a quarter
// clockwise.
struct SheetPlace {
    PictureSize upright; // before it is turned
    bool turned;
};
SheetPlace sheetPlaceOf(PictureSize picture);
Bitmap laidOnSheet(const Bitmap& upright, const SheetPlace& place);

// A picture as the sheet shows it.
Result<Bitmap> sheetThumbnail(const std::filesystem::path& source);

class OrderSheet {
public:
    OrderSheet(SheetKind kind, PictureSize size, QColor background);

    // Lines that reach the pictures make the sheet higher. To be called once, before the pictures.
    void drawLines(const QList<SheetLine>& lines);

    // Cells in rows from the left: columns 0 to cols and rows 1 to rows, both included, without the cells beyond them
    // and clipped at the bottom of the box. Pictures are read on several threads. after(i) runs on the calling thread
    // after each cell and while it waits; false ends the drawing.
    void drawContactSheet(const std::vector<SheetCell>& cells, const std::function<bool(int)>& after);

    // The same where somebody else makes the pictures: the next one in the order of the cells. It calls its argument
    // again and again until the picture is there.
    using NextPicture = std::function<Result<Bitmap>(const std::function<void()>& whileWaiting)>;
    void drawContactSheet(const std::vector<SheetCell>& cells, const NextPicture& next,
                          const std::function<bool(int)>& after);

    // How many cells the grid holds.
    int capacity() const { return capacityOf(m_size); }
    static int capacityOf(PictureSize size);

    const Bitmap& bitmap() const { return m_bitmap; }

private:
    int firstRowTop() const;

    SheetKind m_kind;
    PictureSize m_size; // by the number of pictures
    QColor m_background;
    Bitmap m_bitmap;
    int m_added = 0; // pixels by which long lines have moved the pictures down
};

} // namespace lumora
