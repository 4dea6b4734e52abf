#pragma once

#include <QString>

#include <cstdint>

namespace lumora {

struct EditFields;

// The edit record of a picture: 200 characters, fields by position, left-justified and blank-filled. The basket carries
// it and both the editor and the preparation read it.
namespace EditRecord {

inline constexpr int width = 200;

// A field by its first character (from 1) and its width.
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

// What the fields hold where they are set. RedMarker: the picture is taken from its corrected copy; AutoMarker: the
// automatic level step was asked for; in both, notMarked else.
inline const QString corrected = QStringLiteral("RED");
inline const QString levelled = QStringLiteral("111");
inline const QString notMarked = QStringLiteral("000");
inline const QString noFrame = QStringLiteral("000");      // FrameName of a picture that never had one,
inline const QString frameRemoved = QStringLiteral("999"); // and of one that lost it
inline constexpr std::int16_t alignCentre = 1;             // TextAlign; 0: the text begins at its point
inline constexpr std::int16_t alignFar = 2;
inline constexpr std::int16_t runsDown = 3; // TextVertical; every other value: across

// The frame that a border of the order stands for, "WB" or "BK"; noFrame for any other.
QString frameOfBorder(const QString& paperBorderCode);

// What a field becomes in its column: the right end of what is too long is cut, and of a text the blanks around it are
// not part, while a line break at its beginning is.
std::int16_t stored(Column column, std::int16_t number);
QString stored(Column column, const QString& text);

// The record of a picture that was not edited.
QString newPicture();

// What the record holds before any picture is chosen: the three gains alone.
QString beforeAnyPicture();

} // namespace EditRecord

// Splits a record into the fields of a picture; PicturePath and TempRedName stay. Numbers stop at the first character
// that is no part of one, so that blanks, "000" and "0  " all read as 0; a font size below 8 becomes 8.
void UnpackEditState(const QString& record, EditFields& fields);

// Writes the fields into EditState. The border "WB" or "BK" of the order becomes frame "001" or "002" of a picture that
// has none ("000"; one whose frame was removed, "999", stays without), and takes frameFolder where the record names
// no folder. A field that is too long loses its right end without a word: a gain keeps its first four characters.
void PackEditState(EditFields& fields, const QString& paperBorderCode, const QString& frameFolder);

// The steps of the editor's buttons. What leaves 16 bits is held at the limit.
namespace EditStep {

// A gain and so many hundredths, in double precision, kept as a single.
float gain(float from, int hundredths);

// Held within 40 to 210.
std::int16_t zoom(std::int16_t from, int step);

// Over 540 the turn starts again at 180; downwards there is no limit. The quarter turns have their own range, and the
// two do not agree.
std::int16_t turn(std::int16_t from, int step);
std::int16_t quarterRight(std::int16_t from);
std::int16_t quarterLeft(std::int16_t from);

} // namespace EditStep

} // namespace lumora
