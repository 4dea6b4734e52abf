#pragma once

#include "imaging/files/PictureFile.h"

#include <QString>

namespace lumora {

// How well a picture of so many pixels prints, whatever the paper and the edits. The grade is advice and blocks
// nothing.
enum class PrintGrade {
    Good,       // above 800000 pixels
    Unmarked,   // exactly 800000: the text of the picture before stays
    Borderline, // below 800000
    VeryLow,    // below 400000
};

PrintGrade printGrade(PictureSize size);

// The grade in words (PrintQualityTexts.cpp), height before width. Empty for Unmarked.
QString printGradeText(PrintGrade grade, PictureSize size, bool english);

// The large view in logical units: 300 wide for an upright or square picture, else 400; the height follows.
PictureSize largeViewSize(PictureSize picture);

} // namespace lumora
