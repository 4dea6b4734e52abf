#pragma once

#include "common/FixedText.h"

#include <QChar>
#include <QString>
#include <QStringList>

#include <cstdint>

namespace lumora {

struct OrderDetails;

// The print code, nine characters: copies (2), size code (4), paper letter (1), border code (2). A basket line and the
// name of a print file begin with it; all readers cut it by position.
struct PrintCode {
    static constexpr int width = 9;
    static constexpr int copiesWidth = 2;
    static constexpr int paperAt = copiesWidth + 4; // behind copies and size code
    static constexpr int mostCopies = 99;

    int copies = 0;
    QString size;       // "1015"; for a special size the customer's own code
    QChar paper = u' '; // "M" matte, "G" glossy
    QString border;     // only its first two characters get into the code: "WBX" becomes "WB"

    QString compose() const;
    // The copies of a basket line or print file's name; 0 when the first two characters are no number.
    static int copiesOf(const QString& line);
    // The paper letter of a basket line or print file's name.
    static QChar paperOf(const QString& line) { return line.size() < width ? QChar(u' ') : line[paperAt]; }
    // The copies as two characters.
    static QString copiesField(int copies) { return LeftField(QString::number(copies), copiesWidth); }
};

// Which texts begin with the copies. A file name that no order made may begin with a fraction, which is rounded down.
enum class CopiesIn { BasketLines, FileNames };

// The copies of all texts but those that end in "txt", held at 32767. The order sheet and names that begin with a
// letter count 0.
std::int16_t sumOfCopies(const QStringList& texts, CopiesIn carriers);

// Which words for the paper kind are known. Adding a whole folder knows fewer words than a click on a picture; labs
// rely on the resulting codes.
enum class PaperWords { All, WholeFolder };

// "M" or "G"; previous when the word is not known.
QChar paperLetter(const QString& maat, PaperWords words, QChar previous);

// Four characters: the size code of the paper. For a special size ("zz/zz") the customer's own code, blank by default.
QString sizeField(const OrderDetails& shemot);

} // namespace lumora
