#pragma once

#include <QString>

#include <cstdint>

namespace lumora {

struct EditFields;

// The edit record of a picture: 200 characters, fields by position, left-justified and filled with blanks. A basket
// line holds it; the editor and the preparation of the order read it.
namespace EditRecord {

inline constexpr int width = 200;

// A field: its first character (counted from 1) and its width.
struct Column {
    int position;
    int width;
};

inline constexpr Column GainR{1, 4};
inline constexpr Column GainG{5, 4};
inline constexpr Column GainB{9, 4};
inline constexpr Column RotationCode{13, 3};
inline constexpr Column ZoomPercent{16, 3};
inline constexpr Column PanX{19, 4};
inline constexpr Column PanY{23, 4};
inline constexpr Column ToneFlag{27, 3};
inline constexpr Column SpareFlag{30, 3};
inline constexpr Column FrameName{33, 3};
inline constexpr Column LineFrameCode{36, 3};
inline constexpr Column RedMarker{39, 3};
inline constexpr Column AutoMarker{42, 3};
inline constexpr Column FrameFolder{45, 10};
inline constexpr Column TextFontSize{55, 2};
inline constexpr Column TextAlign{57, 2};
inline constexpr Column Spare59{59, 2};
inline constexpr Column Spare61{61, 2};
inline constexpr Column TextOn{63, 2};
inline constexpr Column Tag{65, 10};
inline constexpr Column TextBlue{75, 3};
inline constexpr Column TextGreen{78, 3};
inline constexpr Column TextRed{81, 3};
inline constexpr Column TextX{84, 3};
inline constexpr Column TextY{87, 3};
inline constexpr Column Spare90{90, 3};
inline constexpr Column TextVertical{93, 2};
inline constexpr Column TextStyle{95, 2};
inline constexpr Column TextFont{97, 30};
inline constexpr Column TextBody{127, 70};

// Field values. RedMarker is corrected when the picture is read from its corrected copy; AutoMarker is levelled when
// the automatic level step was asked for; both are notMarked otherwise.
inline const QString corrected = QStringLiteral("RED");
inline const QString levelled = QStringLiteral("111");
inline const QString notMarked = QStringLiteral("000");
inline const QString noFrame = QStringLiteral("000");      // FrameName of a picture that never had a frame
inline const QString frameRemoved = QStringLiteral("999"); // FrameName of a picture whose frame was removed
inline constexpr std::int16_t alignCentre = 1;             // TextAlign; with 0 the text begins at its point
inline constexpr std::int16_t alignFar = 2;
inline constexpr std::int16_t runsDown = 3; // TextVertical; with any other value the text runs across

// The frame that a border of the order stands for: "001" for "WB", "002" for "BK", noFrame for any other border.
QString frameOfBorder(const QString& paperBorderCode);

// The value that is read back after the field was stored: the right end of a long value is cut. A text also loses the
// blanks around it, but keeps a leading line break.
std::int16_t stored(Column column, std::int16_t number);
QString stored(Column column, const QString& text);

// The record of a picture without edits.
QString newPicture();

// The record before any picture is chosen: the three gains alone.
QString beforeAnyPicture();

} // namespace EditRecord

// Reads the fields of a picture from its record; PicturePath and TempRedName stay. A number ends at the first character
// that can't belong to it, so that blanks, "000" and "0  " all give 0. A font size below 8 becomes 8.
void UnpackEditState(const QString& record, EditFields& fields);

// Writes the fields into EditState. With the order's border "WB" or "BK" a picture without a frame ("000", not "999")
// gets the frame "001" or "002", from frameFolder if the picture names no folder. A long value loses its right end
// without an error: a gain keeps its first four characters.
void PackEditState(EditFields& fields, const QString& paperBorderCode, const QString& frameFolder);

// The steps of the editor's buttons. Results are held within 16 bits.
namespace EditStep {

// from plus hundredths / 100, computed in double precision and rounded to single.
float gain(float from, int hundredths);

// from plus step, held within 40 to 210 per cent.
std::int16_t zoom(std::int16_t from, int step);

// A turn in steps: above 540 it starts again at 180, downwards there is no limit. The quarter turns below hold their
// results within 180 to 540 instead.
std::int16_t turn(std::int16_t from, int step);
std::int16_t quarterRight(std::int16_t from);
std::int16_t quarterLeft(std::int16_t from);

} // namespace EditStep

} // namespace lumora
