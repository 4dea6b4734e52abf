#pragma once

#include "common/FixedText.h"

#include <QChar>
#include <QString>
#include <QStringList>

#include <cstdint>

namespace lumora {

struct OrderDetails;

// The print code, nine characters: copies (2), size code (4), paper letter (1), border code (2). A basket line and the
// name of a print file begin with it, and all later stages cut it by position.
struct PrintCode {
    static constexpr int width = 9;
    static constexpr int copiesWidth = 2;
    static constexpr int mostCopies = 99;

    int copies = 0;
    QString size;       // "1015"; blank for a special size
    QChar paper = u' '; // "M" matte, "G" glossy
    QString border;     // cut to two characters in the code: "WBX" becomes "WB"

    QString compose() const;
    // From the first two characters of a line; what is no number counts as no copies.
    static int copiesOf(const QString& line);
    // The two characters of the copies.
    static QString copiesField(int copies) { return LeftField(QString::number(copies), copiesWidth); }
};

// What has the copies in its first two characters. A name that no order gave may hold a part of a copy, which does not
// count.
enum class CopiesIn { BasketLines, FileNames };

// The copies of all texts but those that end in "txt", held at 32767. The order sheet, whose name begins with "!", and
// names that begin with letters add 0.
std::int16_t sumOfCopies(const QStringList& texts, CopiesIn carriers);

// Which words for the paper a path of the program knows. The offer of a whole folder knows fewer of them than the click
// of a picture, and labs have codes that rely on it.
enum class PaperWords { All, WholeFolder };

// "M" or "G"; for a word that is not known, the letter of the code before.
QChar paperLetter(const QString& maat, PaperWords words, QChar previous);

// Four characters: the size code of the paper; for a special size ("zz/zz") the customer's own code, blank by default.
QString sizeField(const OrderDetails& shemot);

} // namespace lumora
