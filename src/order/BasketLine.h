#pragma once

#include "order/PrintCode.h"
#include "session/SessionState.h"

#include <QString>

namespace lumora {

// How the lines of a basket are built. An edited order carries the edit record between code and path.
enum class LineForm { Short, Full };

constexpr LineForm lineFormOf(OrderKind kind) {
    return printsAsTheyAre(kind) ? LineForm::Short : LineForm::Full;
}

// One line of the basket: print code (9), in the full form the edit record (200), then the full path in any length.
struct BasketLine {
    QString code;      // as it stands; PrintCode composes it
    QString editState; // full form only
    QString path;

    // Characters before the path.
    static int pathColumn(LineForm form);

    QString compose(LineForm form) const;
    static BasketLine split(const QString& line, LineForm form);

    // The two characters of the copies, and a line with its copies changed or left out.
    QString copiesField() const { return code.left(PrintCode::copiesWidth); }
    static QString withCopies(const QString& line, int copies) {
        return PrintCode::copiesField(copies) + withoutCopies(line);
    }
    static QString withoutCopies(const QString& line) { return line.mid(PrintCode::copiesWidth); }

    // The lab knows no file names of fewer than five characters: such a line has no print file, and no list tells of
    // it.
    bool hasUsableName() const;
};

} // namespace lumora
