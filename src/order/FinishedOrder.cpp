#include "order/FinishedOrder.h"

#include <QRegularExpression>

namespace lumora {

std::optional<FinishedOrder> FinishedOrderOf(const QString& folderName) {
    static const QRegularExpression form(QStringLiteral("^(\\d{4}_\\d{2}_\\d{2})_.*\\^(\\d+)(P?)$"));
    const QRegularExpressionMatch match = form.match(folderName);
    const QDate date = QDate::fromString(match.captured(1), QStringLiteral("yyyy_MM_dd"));
    if (!date.isValid())
        return std::nullopt;
    return FinishedOrder{date, match.captured(2), !match.captured(3).isEmpty()};
}

} // namespace lumora
