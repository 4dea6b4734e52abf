#pragma once

#include <QByteArray>
#include <QString>

// The system's files, wires and fixed-width fields are in the ANSI code page Windows-1255, one byte a character.
// Text in memory is QString; it is converted at those borders and nowhere else.
namespace lumora::AnsiCodePage {

// Each character that the code page lacks becomes one "?", also one outside the Basic Multilingual Plane;
// HasQuestionMark finds such a text.
QByteArray encode(const QString& text);

// A byte that Windows-1255 leaves without a character (CA, D9 to DF, FB, FC, FF) becomes U+FFFD.
QString decode(const QByteArray& bytes);

// The text with "?" in place of each character that the code page lacks.
QString squeeze(const QString& text);

// squeeze() leaves no "?" in it.
bool holds(const QString& text);

} // namespace lumora::AnsiCodePage
