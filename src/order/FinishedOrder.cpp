#include "order/FinishedOrder.h"

#include <QRegularExpression>

namespace lumora {

using namespace Qt::StringLiterals;

std::optional<FinishedOrder> FinishedOrderOf(const QString& folderName) {
    static const QRegularExpression form(u"^(\\d{4}_\\d{2}_\\d{2})_.*\\^(\\d+)(P?)$"_s);
    const QRegularExpressionMatch match = form.match(folderName);
    const QDate date = QDate::fromString(match.captured(1), u"yyyy_MM_dd"_s);
    if (!date.isValid())
        return std::nullopt;
    return FinishedOrder{date, match.captured(2), !match.captured(3).isEmpty()};
}

} // namespace lumora
