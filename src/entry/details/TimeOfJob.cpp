#include "entry/details/TimeOfJob.h"

#include "common/FixedText.h"

namespace lumora {

QString BuildTimeOfJob(const QDate& day, const QString& kodMishloach, const QString& ser) {
    return ZeroPadded(day.year(), 4) + u'_' + ZeroPadded(day.month(), 2) + u'_' + ZeroPadded(day.day(), 2) + u'_' +
           LeftField(kodMishloach, 3) + u'_' + ser + u'^';
}

} // namespace lumora
