#include "common/Warning.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The program's own drive and the root of the file system stay; every other letter is a card or a stick.
bool mayBeTakenOut(const SessionState& state, const DrivePath& file) {
    const QString drive = file.text().left(2).toUpper();
    return drive.endsWith(u':') && drive != u"Z:"_s && drive != state.DiskRoot.text().left(2).toUpper();
}

} // namespace

QString failureWords(const SessionState& state, const Failure& failure, const DrivePath& file) {
    switch (failure.kind) {
    case Failure::Kind::NoSpace:
        return state.wording(u"הדיסק מלא", u"The disk is full");
    case Failure::Kind::NotFound:
    case Failure::Kind::AccessDenied:
        if (mayBeTakenOut(state, file))
            return state.wording(u"לא ניתן לקרוא את הקובץ. ייתכן שהכרטיס הוצא",
                                 u"The file can't be read. The card may have been taken out");
        if (failure.kind == Failure::Kind::AccessDenied)
            return state.wording(u"אין הרשאה לקרוא את הקובץ", u"This computer does not allow the file to be read");
        return state.wording(u"הקובץ אינו במקומו. ייתכן שהועבר או נמחק",
                             u"The file is not there any more. It may have been moved or deleted");
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

QString warnedWords(const SessionState& state, const Failure& failure, const DrivePath& file) {
    writeWarning(failure.message);
    return failureWords(state, failure, file);
}

QString askForHelp(const SessionState& state) {
    return state.kiosk.on ? state.wording(u"נא לפנות לצוות.", u"Please ask the staff.")
                          : state.wording(u"נא לפנות לחנות.", u"Please ask the shop.");
}

QString shortList(const SessionState& state, const QStringList& items, qsizetype most, const QString& between) {
    QStringList told = items.first(std::min(items.size(), most));
    if (items.size() > most)
        told += state.wording(u"ועוד %1", u"and %1 more").arg(items.size() - most);
    return told.join(between);
}

} // namespace lumora
