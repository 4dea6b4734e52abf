#pragma once

#include "common/DrivePath.h"
#include "order/PrintCode.h"
#include "session/SessionState.h"

#include <QString>

namespace lumora {

// The two forms of a basket line. The lines of an edited order hold the edit record between print code and path.
enum class LineForm { Short, Full };

constexpr LineForm lineFormOf(OrderKind kind) {
    return printsAsTheyAre(kind) ? LineForm::Short : LineForm::Full;
}

// One line of the basket: print code (9 characters), in the full form the edit record (200), then the full path.
struct BasketLine {
    QString code;      // PrintCode composes it; split() takes it unchecked
    QString editState; // the edit record; full form only
    DrivePath path;

    // Number of characters before the path.
    static int pathColumn(LineForm form);

    QString compose(LineForm form) const;
    static BasketLine split(const QString& line, LineForm form);

    // The copies as two characters; withCopies and withoutCopies replace and remove them in a whole line.
    QString copiesField() const { return code.left(PrintCode::copiesWidth); }
    static QString withCopies(const QString& line, int copies) {
        return PrintCode::copiesField(copies) + withoutCopies(line);
    }
    static QString withoutCopies(const QString& line) { return line.mid(PrintCode::copiesWidth); }

    // The lab accepts no file name of fewer than five characters: a line with one gets no print file and is not
    // reported as failed.
    bool hasUsableName() const;
};

} // namespace lumora
