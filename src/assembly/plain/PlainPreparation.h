#pragma once

#include "assembly/Preparation.h"

namespace lumora {

class TextList;

// Prepares a plain order: each picture is scaled to the paper, or copied as it is where deep compression is on.
class PlainPreparation : public Preparation {
public:
    using Preparation::Preparation;

    // Moves the lines that name no JPEG file to removed. A walk passes over the line behind a removed one, which the
    // next walk reads. As built in, "Jpg" and the like are no such ending.
    void keepOnlyJpeg(TextList& lines, TextList& removed);
    // Nothing is left to prepare: leftOut has what keepOnlyJpeg() has removed.
    void leaveOutAll() { m_state.transfer.leftOut = m_noJpeg; }

    bool isAlbum() const;
    // No value when a click ended the program.
    std::optional<Bitmap> drawSheet(SheetKind kind, const QStringList& lines);
    // False, and told, when the order is not complete, or when a click ended the program.
    bool prepare(const QStringList& lines);

private:
    class Prints;

    bool makeSheet(); // false when a click ended the program, and where the order is held back
    void packPicture(int index, PrintPacker& packer, Prints& prints);
};

} // namespace lumora
