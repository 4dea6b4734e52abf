#pragma once

#include <QString>

#include <array>

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
inline constexpr Column TextOn{63, 2};
inline constexpr Column Tag{65, 10};
inline constexpr Column TextBlue{75, 3};
inline constexpr Column TextGreen{78, 3};
inline constexpr Column TextRed{81, 3};
inline constexpr Column TextX{84, 3};
inline constexpr Column TextY{87, 3};
inline constexpr Column TextVertical{93, 2};
inline constexpr Column TextStyle{95, 2};
inline constexpr Column TextFont{97, 30};
inline constexpr Column TextBody{127, 70};

// The record of a picture that was not edited.
QString newPicture();

// What the record holds before any picture is chosen: the three gains alone.
QString beforeAnyPicture();

} // namespace EditRecord

// Splits a record into the fields of a picture; PicturePath and TempRedName stay. Numbers stop at the first character
// that is no part of one, so that blanks, "000" and "0  " all read as 0; a font size below 8 becomes 8.
void UnpackEditState(const QString& record, EditFields& fields);

} // namespace lumora
