#include "order/OrderNames.h"

#include "common/DrivePath.h"
#include "common/FixedText.h"

namespace lumora {

QString BuildTimeOfJob(const QDate& day, const QString& kodMishloach, const QString& ser) {
    return ZeroPadded(day.year(), 4) + u'_' + ZeroPadded(day.month(), 2) + u'_' + ZeroPadded(day.day(), 2) + u'_' +
           LeftField(kodMishloach, 3) + u'_' + ser + u'^';
}

QString OrderName(const QString& TimeOfJob, const QString& number) {
    return TimeOfJob + number;
}

QString OrderNumberOf(const QString& name) {
    return name.mid(name.lastIndexOf(u'^') + 1);
}

QString SheetName(const QString& number, const QString& serial, const QString& ending) {
    return u'!' + number + u'_' + serial + ending;
}

bool IsSheet(const QString& leaf) {
    return leaf.startsWith(u'!');
}

QStringList LeafNames(const QStringList& paths) {
    QStringList names;
    for (const QString& path : paths)
        names += LeafName(path);
    return names;
}

bool TravelsInPieces(const QString& folder) {
    return folder.endsWith(u'P');
}

} // namespace lumora
