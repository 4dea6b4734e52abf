#include "order/PrintFileName.h"

#include "common/AnsiCodePage.h"
#include "common/FixedText.h"
#include "order/BasketLine.h"
#include "order/PrintCode.h"

#include <QRegularExpression>

namespace lumora {

using namespace Qt::StringLiterals;

QString PrintFileName::text() const {
    return code.left(PrintCode::width) + ZeroPadded(index, 4) + u'_' + QString::number(optint).rightJustified(2, u'0') +
           TextToHex(RightPart(AnsiCodePage::squeeze(baseName), 20)) + u".jpp"_s;
}

std::optional<PrintFileName> PrintFileName::parse(const QString& name) {
    static const QRegularExpression form(
        QRegularExpression::anchoredPattern(u"(.{9})([0-9]{4})_([0-9]{2})((?:[0-9A-F]{2}){1,20})\\.jpp"_s));
    const QRegularExpressionMatch match = form.match(name);
    if (!match.hasMatch())
        return std::nullopt;
    return PrintFileName{match.captured(1), match.captured(2).toInt(), match.captured(3).toInt(),
                         HexToChars(match.captured(4))};
}

int PrintFileName::copies() const {
    return PrintCode::copiesOf(code);
}

QString PrintBaseName(const DrivePath& path) {
    return RightPart(path.stem(), 20);
}

QString PrintNameOf(const BasketLine& line, int index, OrderKind kind) {
    return PrintFileName{line.code, index, static_cast<int>(kind), PrintBaseName(line.path)}.text();
}

} // namespace lumora
