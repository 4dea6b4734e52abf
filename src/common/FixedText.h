#pragma once

#include <QString>

#include <cstdint>

namespace lumora {

// The text of a field that was not chosen yet, and of a part that a path lacks.
inline const QString notChosen = QStringLiteral("***");

// Left-justified in a field of width characters, blank-filled, cut when too long.
QString LeftField(const QString& text, int width);

// The last width characters, or all of a shorter text.
QString RightPart(const QString& text, int width);

// Leading-number parse: blanks, tabs and line feeds are passed over wherever they stand in the number, a sign, digits,
// one point and an exponent (E or D) are taken, and the first other character ends the number. No number gives 0.
double Val(const QString& text);

// Val rounded to the nearest integer, ties to even, and held within 16 bits: what a 16-bit field takes from a text.
std::int16_t Val16(const QString& text);

// A 16-bit field never wraps: what is beyond its range is held at the limit.
std::int16_t HoldIn16Bits(double value);

// The nearest integer, ties to even.
long long RoundHalfEven(double value);

// Left-padded with "0" to width characters, then cut to the last width characters.
QString ZeroPadded(long long number, int width);

// A number as plain decimal text with at most seven significant digits, never with an exponent, no trailing zeros.
QString PlainNumber(float number);

// True if the text holds a "?", which replaces a character outside the code page.
bool HasQuestionMark(const QString& text);

// Two upper-case hexadecimal digits for each character, taken by its value in the ANSI code page.
QString TextToHex(const QString& text);

// Two hexadecimal digits at a time back to characters of the ANSI code page.
QString HexToChars(const QString& hex);

// The decimal text of a hexadecimal text, with or without "&H" in front; "00" for what is no number. As the tools that
// share the format read it, up to four digits are a signed 16-bit number and more a signed 32-bit number.
QString HexToDecimal(const QString& hex);

} // namespace lumora
