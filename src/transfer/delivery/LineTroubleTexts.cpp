#include "transfer/delivery/LineTrouble.h"

#include "session/SessionState.h"

namespace lumora {

QString LineTroubleText(const SessionState& state, LineStep step, const Failure& failure, const QString& subject) {
    const bool answered = failure.kind == Failure::Kind::Refused || failure.kind == Failure::Kind::AccessDenied;
    // Isolating marks: the name may run in the other direction than the sentence.
    const QString name = QChar(0x2068) + subject + QChar(0x2069);
    switch (step) {
    case LineStep::Open:
        return state.wording(QStringLiteral("למחשב אין קשר לאינטרנט. יש לבדוק את החיבור ולנסות שוב."),
                             QStringLiteral("This computer has no internet connection. Check it and try again."));
    case LineStep::Connect:
        if (failure.kind == Failure::Kind::Unsupported)
            return state.wording(
                QStringLiteral("השרת של המעבדה דורש חיבור מוצפן, ולתוכנה זו אין חיבור כזה. יש להודיע על כך לחנות."),
                QStringLiteral("The lab's server wants encryption, which this program does not have. Please tell the "
                               "shop."));
        if (answered)
            return state.wording(QStringLiteral("השרת סירב לכניסה: ייתכן ששם המשתמש או הסיסמה שגויים, או שהשרת עמוס. "
                                                "אפשר לנסות שוב או להודיע לחנות."),
                                 QStringLiteral("The server refused the login: the user name or the password may be "
                                                "wrong, or the server is busy. Try again, or tell the shop."));
        return state.wording(QStringLiteral("השרת אינו עונה. יש לבדוק את החיבור לאינטרנט ולנסות שוב בעוד כמה דקות."),
                             QStringLiteral("The server does not answer. Check the internet connection and try again "
                                            "in a few minutes."));
    case LineStep::OrderFolder:
        if (answered)
            return state.wording(
                QStringLiteral("השרת לא פתח את תיקיית ההזמנה. יש להודיע על כך לחנות."),
                QStringLiteral("The server did not open the folder of this order. Please tell the shop."));
        return state.wording(QStringLiteral("הקשר נותק לפני שנפתחה תיקיית ההזמנה בשרת."),
                             QStringLiteral("The line was cut before the order's folder on the server was open."));
    case LineStep::File:
        if (failure.kind != Failure::Kind::NotFound)
            return state.wording(
                QStringLiteral("לא ניתן לשלוח את הקובץ %1 ממחשב זה. יש להודיע לחנות.").arg(name),
                QStringLiteral("The file %1 can't be sent from this computer. Please tell the shop.").arg(name));
        [[fallthrough]];
    case LineStep::Put:
        if (failure.kind == Failure::Kind::NotFound)
            return state.wording(QStringLiteral("הקובץ %1 לא נמצא במחשב.").arg(name),
                                 QStringLiteral("The file %1 was not found on this computer.").arg(name));
        if (answered)
            return state.wording(
                QStringLiteral("השרת לא קיבל את הקובץ %1. הוא עדיין לא הגיע.").arg(name),
                QStringLiteral("The server did not accept the file %1. It has not arrived yet.").arg(name));
        return state.wording(
            QStringLiteral("הקשר נותק בזמן שליחת הקובץ %1. הוא עדיין לא הגיע.").arg(name),
            QStringLiteral("The line was cut while %1 was being sent. It has not arrived yet.").arg(name));
    case LineStep::List:
        if (failure.kind == Failure::Kind::Damaged)
            return state.wording(
                QStringLiteral("לא ניתן לקרוא את רשימת הקבצים של השרת, ולכן לא ידוע מה הגיע. יש להודיע על כך לחנות."),
                QStringLiteral("The server's list of files can't be read, so it is not known what has arrived. Please "
                               "tell the shop."));
        return state.wording(QStringLiteral("הקשר נותק בזמן הבדיקה מה הגיע לשרת."),
                             QStringLiteral("The line was cut while the files on the server were being checked."));
    case LineStep::Confirm:
        return state.wording(QStringLiteral("השרת לא אישר שכל הקבצים הגיעו. אם זה חוזר יש להודיע לחנות."),
                             QStringLiteral("The server did not confirm that all files have arrived. If this happens "
                                            "again, please tell the shop."));
    case LineStep::KeepList:
        return state.wording(
            QStringLiteral("רשימת הקבצים מהשרת לא נכתבה במחשב זה. יש לפנות מקום בדיסק או לתקן את ההרשאות ולנסות שוב."),
            QStringLiteral("The server's list of files can't be written on this computer. Free some space or mend the "
                           "rights, then try again."));
    }
    return failure.message;
}

} // namespace lumora
