#include "common/Warning.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

QString failureWords(const SessionState& state, const Failure& failure) {
    writeWarning(failure.message);
    switch (failure.kind) {
    case Failure::Kind::NoSpace:
        return state.wording(u"הדיסק מלא", u"The disk is full");
    case Failure::Kind::NotFound:
    case Failure::Kind::AccessDenied:
        return state.wording(u"לא ניתן לקרוא את הקובץ. ייתכן שהכרטיס הוצא",
                             u"The file can't be read. The card may have been taken out");
    case Failure::Kind::NoProgram:
        return state.wording(u"חסרה תוכנה במחשב זה", u"A program is missing on this computer");
    case Failure::Kind::Damaged:
        return state.wording(u"הקובץ פגום", u"The file is damaged");
    case Failure::Kind::TooLarge:
    case Failure::Kind::TimedOut:
        return state.wording(u"התמונה גדולה מדי", u"The picture is too large");
    case Failure::Kind::Unsupported:
        return state.wording(u"סוג קובץ שלא ניתן להציג", u"A kind of file that can't be shown");
    default:
        return state.wording(u"תקלה לא צפויה", u"An unexpected fault");
    }
}

QString shortList(const SessionState& state, const QStringList& items, qsizetype most, const QString& between) {
    QStringList told = items.first(std::min(items.size(), most));
    if (items.size() > most)
        told += state.wording(u"ועוד %1", u"and %1 more").arg(items.size() - most);
    return told.join(between);
}

} // namespace lumora
