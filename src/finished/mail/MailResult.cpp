#include "finished/mail/MailResult.h"

namespace lumora {

QString MailResultText(int code, bool english) {
    const auto wording = [english](const QString& hebrew, const QString& inEnglish) {
        return english ? inEnglish : hebrew;
    };
    switch (code) {
    case 0:
        return wording(QStringLiteral("שרת הדואר מדווח כי המשלוח התקבל בהצלחה "),
                       QStringLiteral("The mail server took the message."));
    case 1:
        return wording(QStringLiteral("המשלוח בוטל על ידי משתמש "), QStringLiteral("The sending was cancelled."));
    case 2:
        return wording(QStringLiteral("תקלה מדווחת מהמחשב בעת נסיון למשלוח התמונות"),
                       QStringLiteral("The computer met a fault while it was sending the pictures."));
    case 3:
        return wording(
            QStringLiteral(" תוכנת הדואר לא הוגדרה כראוי"
                           "המחשב לא יצר קשר עם שרת הדואר שלך"),
            QStringLiteral("The mail program is not set up properly: the computer did not reach your mail server."));
    case 4:
        return wording(QStringLiteral("הדיסק ללא מקופ פנוי המספיק לביצוע המשלוח"),
                       QStringLiteral("There is not enough room on the disk to send the message."));
    case 5:
        return wording(QStringLiteral("ההודעה לא נשלחה בגלל מחסור בזיכרון"),
                       QStringLiteral("The message was not sent because memory ran out."));
    case 6:
        return wording(QStringLiteral("הגישה נדחתה"), QStringLiteral("Access was refused."));
    case 8:
        return wording(QStringLiteral("ריבוי פעולות במחשב מנעו את פעולת המשלוח"),
                       QStringLiteral("Too much was going on at once, so the message was not sent."));
    case 9:
        return wording(QStringLiteral("ריבוי בקבצים מצורפים לא התבצע משלוח"),
                       QStringLiteral("There were too many attachments, so nothing was sent."));
    case 10:
        return wording(QStringLiteral("ריבוי בכתובות למשלוח לא התבצע משלוח"),
                       QStringLiteral("There were too many addresses, so nothing was sent."));
    case 11:
        return wording(QStringLiteral("הקובץ המיועד לשיגור אינו נמצא"),
                       QStringLiteral("The file that was to be sent was not found."));
    case 12:
        return wording(QStringLiteral("הקובץ המיועד לשיגור אינו תקין ואינו ראוי למשלוח"),
                       QStringLiteral("The file that was to be sent is damaged and can't be sent."));
    case 13:
        return wording(QStringLiteral("שגיאה בעת כתיבה לתיקייה זמנית"),
                       QStringLiteral("Writing to a temporary folder failed."));
    case 14:
        return wording(QStringLiteral("השם שהוקלד בחלונית הכתובת אינו מדוייק על כן הקלד כתובת במדוייק"),
                       QStringLiteral("The address is not exact. Please enter the address exactly."));
    case 18:
        return wording(QStringLiteral("התוכן המילולי ארוך מדי לא נשלחה ההודעה"),
                       QStringLiteral("The message is too long and was not sent."));
    case 21:
        return wording(QStringLiteral("A recipient matched more than one of the recipient descriptor"
                                      "structures and MAPI_DIALOG was not set. No message was sent."),
                       QStringLiteral("The address fits more than one recipient. No message was sent."));
    case 16:
    case 17:
    case 19:
    case 20:
    case 22:
    case 23:
    case 24:
    case 26:
        return {};
    default:
        return wording(QStringLiteral("תקלה לא ברורה אבל בכל זאת מנעה משלוח של הקובץ"),
                       QStringLiteral("An unclear fault kept the file from being sent."));
    }
}

int MailResultCode(MailEnd end) {
    switch (end) {
    case MailEnd::Sent:
        return 0;
    case MailEnd::NoContact:
        return 3;
    case MailEnd::ServerFull:
        return 4;
    case MailEnd::NoMemory:
        return 5;
    case MailEnd::AccessRefused:
        return 6;
    case MailEnd::ServerBusy:
        return 8;
    case MailEnd::AttachmentMissing:
        return 11;
    case MailEnd::AttachmentUnreadable:
        return 12;
    case MailEnd::RecipientRefused:
        return 14;
    case MailEnd::TooLarge:
        return 18;
    case MailEnd::Refused:
        return 2;
    }
    return 2;
}

} // namespace lumora
