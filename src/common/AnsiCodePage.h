#pragma once

#include <QByteArray>
#include <QString>

// The system's files, wires and fixed-width fields are in the ANSI code page Windows-1255, one byte a character.
// Text in memory is QString; it is converted at those borders and nowhere else.
namespace lumora::AnsiCodePage {

// A character that the code page lacks becomes "?", which is what the tests for "?" further down look for.
// One "?" stands for one character, also for one outside the Basic Multilingual Plane.
QByteArray encode(const QString& text);

// A byte that Windows-1255 leaves without a character (CA, D9 to DF, FB, FC, FF) comes back as
// U+FFFD, so that decode never invents a letter.
QString decode(const QByteArray& bytes);

// What is left of the text when it has been through the code page once: "?" for each character outside.
QString squeeze(const QString& text);

} // namespace lumora::AnsiCodePage
