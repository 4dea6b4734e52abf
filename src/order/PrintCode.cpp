#include "order/PrintCode.h"

#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

QString PrintCode::compose() const {
    return copiesField(copies) + LeftField(size, 4) + paper + LeftField(border, 2);
}

PrintCode PrintCode::split(const QString& line) {
    const QString code = LeftField(line, width);
    return {copiesOf(code), code.mid(2, 4), code.at(6), code.mid(7, 2)};
}

int PrintCode::copiesOf(const QString& line) {
    return Val16(line.left(2));
}

QChar paperLetter(const QString& maat, PaperWords words, QChar previous) {
    const bool all = words == PaperWords::All;
    if (maat == QStringLiteral("מט") || maat == QStringLiteral("M") || (all && maat == QStringLiteral("Matte")))
        return u'M';
    if (maat == QStringLiteral("מבריק") || (all && maat == QStringLiteral("Glossy")))
        return u'G';
    return previous;
}

QString sizeField(const OrderDetails& shemot) {
    return LeftField(shemot.ppr == QStringLiteral("zz/zz") ? shemot.CustomCode : SizeCode(shemot.ppr), 4);
}

int BasketLine::pathColumn(LineForm form) {
    return form == LineForm::Full ? PrintCode::width + EditRecord::width : PrintCode::width;
}

QString BasketLine::compose(LineForm form) const {
    QString line = code.compose();
    if (form == LineForm::Full)
        line += LeftField(editState, EditRecord::width);
    return line + path;
}

BasketLine BasketLine::split(const QString& line, LineForm form) {
    BasketLine parts{PrintCode::split(line), {}, line.mid(pathColumn(form))};
    if (form == LineForm::Full)
        parts.editState = LeftField(line.mid(PrintCode::width, EditRecord::width), EditRecord::width);
    return parts;
}

} // namespace lumora
