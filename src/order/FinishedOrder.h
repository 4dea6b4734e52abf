#pragma once

#include <QDate>
#include <QString>

#include <optional>

namespace lumora {

// A finished order by the name of its folder, YYYY_MM_DD_SSS_ssss^NNN and a "P" where it travels in pieces.
struct FinishedOrder {
    QDate date;
    QString number;
    bool pieces = false;
};
// No value for a folder with a name of another kind.
std::optional<FinishedOrder> FinishedOrderOf(const QString& folderName);

} // namespace lumora
