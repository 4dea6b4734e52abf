#pragma once

#include <QDate>
#include <QString>

namespace lumora {

// YYYY_MM_DD_SSS_ssss^: the day, the code of how the order started in exactly three characters, the mark of the
// machine's volume. The order number follows behind the "^".
QString BuildTimeOfJob(const QDate& day, const QString& kodMishloach, const QString& ser);

} // namespace lumora
