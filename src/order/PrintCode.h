#pragma once

#include "common/FixedText.h"
#include "session/SessionState.h"

#include <QChar>
#include <QString>

namespace lumora {

// The first nine characters of a basket line: copies (2), size code (4), paper letter (1), border code (2). All later
// stages cut it by position.
struct PrintCode {
    static constexpr int width = 9;
    static constexpr int mostCopies = 99;

    int copies = 0;
    QString size;       // "1015"; blank for a special size
    QChar paper = u' '; // "M" matte, "G" glossy
    QString border;     // cut to two characters in the code: "WBX" becomes "WB"

    QString compose() const;
    // From the first nine characters of a line; what is no number counts as no copies.
    static PrintCode split(const QString& line);
    static int copiesOf(const QString& line);
    // The two characters of the copies.
    static QString copiesField(int copies) { return LeftField(QString::number(copies), 2); }
};

// Which words for the paper a path of the program knows. The offer of a whole folder knows fewer of them than the click
// of a picture, and labs have codes that rely on it.
enum class PaperWords { All, WholeFolder };

// "M" or "G"; for a word that is not known, the letter of the code before.
QChar paperLetter(const QString& maat, PaperWords words, QChar previous);

// Four characters: the size code of the paper; for a special size ("zz/zz") the customer's own code, blank by default.
QString sizeField(const OrderDetails& shemot);

// How the lines of a basket are built. An edited order carries the edit record between code and path.
enum class LineForm { Short, Full };

constexpr LineForm lineFormOf(OrderKind kind) {
    return printsAsTheyAre(kind) ? LineForm::Short : LineForm::Full;
}

// One line of the basket: code (9), in the full form the edit record (200), then the full path in any length.
struct BasketLine {
    PrintCode code;
    QString editState; // full form only
    QString path;

    // Characters before the path.
    static int pathColumn(LineForm form);

    QString compose(LineForm form) const;
    static BasketLine split(const QString& line, LineForm form);
};

} // namespace lumora
