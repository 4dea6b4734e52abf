#include "order/PrintCode.h"

#include "common/PaperSize.h"
#include "session/SessionState.h"

#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

QString PrintCode::compose() const {
    return copiesField(copies) + LeftField(size, 4) + paper + LeftField(border, 2);
}

int PrintCode::copiesOf(const QString& line) {
    return Val16(line.left(copiesWidth));
}

std::int16_t sumOfCopies(const QStringList& texts, CopiesIn carriers) {
    double total = 0;
    for (const QString& text : texts) {
        if (text.endsWith(QLatin1String("txt")))
            continue;
        const double copies = Val(text.left(PrintCode::copiesWidth));
        total += carriers == CopiesIn::FileNames ? std::floor(copies) : copies;
    }
    return HoldIn16Bits(total);
}

QChar paperLetter(const QString& maat, PaperWords words, QChar previous) {
    const bool all = words == PaperWords::All;
    if (maat == u"מט"_s || maat == u"M"_s || (all && maat == u"Matte"_s))
        return u'M';
    if (maat == u"מבריק"_s || (all && maat == u"Glossy"_s))
        return u'G';
    return previous;
}

QString sizeField(const OrderDetails& shemot) {
    return LeftField(shemot.ppr == mixedSizes ? shemot.CustomCode : SizeCode(shemot.ppr), 4);
}

} // namespace lumora
