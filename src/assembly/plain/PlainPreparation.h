#pragma once

#include "assembly/Preparation.h"

namespace lumora {

class PlainPrints;
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
    std::vector<SheetCell> cellsOf(const QStringList& lines) const;
    QList<SheetLine> textsOf(SheetKind kind) const;
    bool makeSheet(PlainPrints& prints); // false when a click ended the program, and where the order is held back
    void packPicture(int index, PrintPacker& packer, PlainPrints& prints);
};

} // namespace lumora
