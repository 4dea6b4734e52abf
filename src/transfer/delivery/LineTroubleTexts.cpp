#include "transfer/delivery/LineTrouble.h"

#include "platform/line/Encryption.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// What is said is for the shop, which can mend it or knows whom to call.
QString encryptionTrouble(const SessionState& state, TlsFault fault) {
    const auto told = [&](const QString& hebrew, const QString& english) {
        return state.wording(hebrew + u" לכן לא ניתן לשלוח אליו. יש להודיע על כך לחנות."_s,
                             english + u" So nothing can be sent to it. Please tell the shop."_s);
    };
    switch (fault) {
    case TlsFault::WrongHost:
        return told(u"תעודת האבטחה של השרת שייכת לשרת אחר, וייתכן שזה אינו השרת של המעבדה."_s,
                    u"The server's certificate belongs to another server; this may not be the lab's server."_s);
    case TlsFault::Expired:
        return told(u"תוקף תעודת האבטחה של השרת פג."_s, u"The server's certificate has expired."_s);
    case TlsFault::NotYetValid:
        return told(u"תעודת האבטחה של השרת עדיין אינה בתוקף. ייתכן שהשעון של מחשב זה אינו נכון."_s,
                    u"The server's certificate is not valid yet. This computer's clock may be wrong."_s);
    case TlsFault::SelfSigned:
        return told(u"השרת חתם בעצמו על תעודת האבטחה שלו, ולא ידוע אם זה השרת של המעבדה."_s,
                    u"The server has signed its certificate itself, so it is not known whether it is the lab's."_s);
    case TlsFault::UnknownAuthority:
    case TlsFault::NotTrusted:
        return told(u"מחשב זה אינו מכיר את מי שחתם על תעודת האבטחה של השרת, או שהתעודה פגומה."_s,
                    u"This computer does not know who has signed the server's certificate, or the certificate is not "
                    u"good."_s);
    case TlsFault::NoAuthorities:
        return told(u"לא ניתן לקרוא במחשב זה את קובץ תעודות האבטחה של המעבדה."_s,
                    u"The file with the lab's certificates can't be read on this computer."_s);
    case TlsFault::NotOffered:
    case TlsFault::DataNotEncrypted:
        return told(u"כאן הוגדר חיבור מוצפן, והשרת של המעבדה אינו מציע חיבור כזה."_s,
                    u"Encryption is set up here, and the lab's server does not offer it."_s);
    case TlsFault::TooOld:
        return told(u"ההצפנה שהשרת של המעבדה מציע ישנה מדי."_s,
                    u"The encryption that the lab's server offers is too old."_s);
    }
    return {};
}

} // namespace

// When to try again is said once, by the advice of the phase.
QString LineTroubleText(const SessionState& state, LineStep step, const Failure& failure, const QString& subject) {
    const bool answered = failure.kind == Failure::Kind::Refused || failure.kind == Failure::Kind::AccessDenied;
    // Isolating marks: the name may run in the other direction than the sentence.
    const QString name = QChar(0x2068) + subject + QChar(0x2069);
    if (failure.tls)
        return encryptionTrouble(state, *failure.tls);
    switch (step) {
    case LineStep::Open:
        return state.wording(u"למחשב אין קשר לאינטרנט. יש לבדוק את החיבור ולנסות שוב."_s,
                             u"This computer has no internet connection. Check it and try again."_s);
    case LineStep::Connect:
        if (failure.kind == Failure::Kind::Unsupported)
            return state.wording(
                u"השרת של המעבדה דורש חיבור מוצפן, וחיבור כזה לא הוגדר כאן. יש להודיע על כך לחנות."_s,
                u"The lab's server wants encryption, which is not set up here. Please tell the shop."_s);
        if (answered)
            return state.wording(u"השרת סירב לכניסה: ייתכן ששם המשתמש או הסיסמה שגויים, או שהשרת עמוס. "
                                 u"אפשר לנסות שוב או להודיע לחנות."_s,
                                 u"The server refused the login: the user name or the password may be "
                                 u"wrong, or the server is busy. Try again, or tell the shop."_s);
        return state.wording(u"השרת אינו עונה. יש לבדוק את החיבור לאינטרנט."_s,
                             u"The server does not answer. Please check the internet connection."_s);
    case LineStep::OrderFolder:
        if (answered)
            return state.wording(u"השרת לא פתח את תיקיית ההזמנה. יש להודיע על כך לחנות."_s,
                                 u"The server did not open the folder of this order. Please tell the shop."_s);
        return state.wording(u"הקשר נותק לפני שנפתחה תיקיית ההזמנה בשרת."_s,
                             u"The line was cut before the order's folder on the server was open."_s);
    case LineStep::File:
        if (failure.kind != Failure::Kind::NotFound)
            return state.wording(u"לא ניתן לשלוח את הקובץ %1 ממחשב זה. יש להודיע לחנות."_s.arg(name),
                                 u"The file %1 can't be sent from this computer. Please tell the shop."_s.arg(name));
        [[fallthrough]];
    case LineStep::Put:
        if (failure.kind == Failure::Kind::NotFound)
            return state.wording(u"הקובץ %1 לא נמצא במחשב."_s.arg(name),
                                 u"The file %1 was not found on this computer."_s.arg(name));
        if (answered)
            return state.wording(u"השרת לא קיבל את הקובץ %1. הוא עדיין לא הגיע."_s.arg(name),
                                 u"The server did not accept the file %1. It has not arrived yet."_s.arg(name));
        return state.wording(u"הקשר נותק בזמן שליחת הקובץ %1. הוא עדיין לא הגיע."_s.arg(name),
                             u"The line was cut while %1 was being sent. It has not arrived yet."_s.arg(name));
    case LineStep::List:
        if (failure.kind == Failure::Kind::Damaged)
            return state.wording(
                u"לא ניתן לקרוא את רשימת הקבצים של השרת, ולכן לא ידוע מה הגיע. יש להודיע על כך לחנות."_s,
                u"The server's list of files can't be read, so it is not known what has arrived. Please "
                u"tell the shop."_s);
        return state.wording(u"הקשר נותק בזמן הבדיקה מה הגיע לשרת."_s,
                             u"The line was cut while the files on the server were being checked."_s);
    case LineStep::Confirm:
        return state.wording(u"השרת לא אישר שכל הקבצים הגיעו. אם זה חוזר יש להודיע לחנות."_s,
                             u"The server did not confirm that all files have arrived. If this happens "
                             u"again, please tell the shop."_s);
    case LineStep::KeepList:
        return state.wording(
            u"רשימת הקבצים מהשרת לא נכתבה במחשב זה. יש לפנות מקום בדיסק או לתקן את ההרשאות ולנסות שוב."_s,
            u"The server's list of files can't be written on this computer. Free some space or mend the "
            u"rights, then try again."_s);
    case LineStep::KeepState:
        return state.wording(
            u"לא ניתן לרשום במחשב זה עד היכן הגיעה השליחה, ולכן היא הופסקה. ההזמנה שמורה. יש לפנות מקום בדיסק או לתקן "
            u"את ההרשאות וללחוץ על הלחצן שלח שוב."_s,
            u"How far the sending has come can't be written on this computer, so it has ended. The order is kept. Free "
            u"some space or mend the rights, then press Send again."_s);
    case LineStep::PrintCut:
        return state.wording(u"הקובץ %1 נפגם במחשב זה לאחר שהוכן. יש להודיע לחנות."_s.arg(name),
                             u"The file %1 was damaged on this computer after it was made. Please tell the "
                             u"shop."_s.arg(name));
    case LineStep::ServerChanges:
        return state.wording(u"השרת של המעבדה משנה את הקבצים בדרך. יש להתקשר למעבדה."_s,
                             u"The lab's server changes files on the way. Please call the lab."_s);
    case LineStep::ForeignFolder:
        return state.wording(u"בשרת כבר יש הזמנה אחרת בשם זה, ולכן לא נשלח דבר. יש להתקשר למעבדה."_s,
                             u"The server already holds another order under this name, so nothing was sent. Please "
                             u"call the lab."_s);
    case LineStep::FolderLost:
        return state.wording(
            u"הזמנה אחרת באותו שם נכנסה לתיקייה שבשרת, וייתכן שהזמנה זו אינה שלמה שם. יש להתקשר למעבדה."_s,
            u"Another order of the same name has come into the folder on the server, so this one may not be whole "
            u"there. Please call the lab."_s);
    case LineStep::Silence:
        return state.wording(u"השרת אינו עונה או שהקו איטי מדי, ולכן השליחה הופסקה."_s,
                             u"The server does not answer or the line is too slow, so the sending has ended."_s);
    }
    return failure.message;
}

} // namespace lumora
