#include "order/OrderNames.h"

namespace lumora {

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

bool TravelsInPieces(const QString& folder) {
    return folder.endsWith(u'P');
}

} // namespace lumora
