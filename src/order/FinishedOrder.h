#pragma once

#include <QDate>
#include <QString>

#include <optional>

namespace lumora {

// A finished order as the name of its folder tells it: YYYY_MM_DD_SSS_ssss^NNN, then "P" if the order is in pieces.
struct FinishedOrder {
    QDate date;
    QString number;
    bool pieces = false;
};
// No value when the folder's name has another form.
std::optional<FinishedOrder> FinishedOrderOf(const QString& folderName);

} // namespace lumora
