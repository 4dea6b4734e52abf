#include "finished/mail/MailResult.h"

#include <algorithm>
#include <iterator>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr struct {
    int code;
    QStringView hebrew;
    QStringView english;
} resultTexts[] = {
    {0, u"שרת הדואר מדווח כי המשלוח התקבל בהצלחה ", u"The mail server took the message."},
    {1, u"המשלוח בוטל על ידי משתמש ", u"The sending was cancelled."},
    {2, u"תקלה מדווחת מהמחשב בעת נסיון למשלוח התמונות", u"The computer met a fault while it was sending the pictures."},
    {3,
     u" תוכנת הדואר לא הוגדרה כראוי"
     "המחשב לא יצר קשר עם שרת הדואר שלך",
     u"The mail program is not set up properly: the computer did not reach your mail server."},
    {4, u"הדיסק ללא מקופ פנוי המספיק לביצוע המשלוח", u"There is not enough room on the disk to send the message."},
    {5, u"ההודעה לא נשלחה בגלל מחסור בזיכרון", u"The message was not sent because memory ran out."},
    {6, u"הגישה נדחתה", u"Access was refused."},
    {8, u"ריבוי פעולות במחשב מנעו את פעולת המשלוח", u"Too much was going on at once, so the message was not sent."},
    {9, u"ריבוי בקבצים מצורפים לא התבצע משלוח", u"There were too many attachments, so nothing was sent."},
    {10, u"ריבוי בכתובות למשלוח לא התבצע משלוח", u"There were too many addresses, so nothing was sent."},
    {11, u"הקובץ המיועד לשיגור אינו נמצא", u"The file that was to be sent was not found."},
    {12, u"הקובץ המיועד לשיגור אינו תקין ואינו ראוי למשלוח",
     u"The file that was to be sent is damaged and can't be sent."},
    {13, u"שגיאה בעת כתיבה לתיקייה זמנית", u"Writing to a temporary folder failed."},
    {14, u"השם שהוקלד בחלונית הכתובת אינו מדוייק על כן הקלד כתובת במדוייק",
     u"The address is not exact. Please enter the address exactly."},
    {18, u"התוכן המילולי ארוך מדי לא נשלחה ההודעה", u"The message is too long and was not sent."},
    {21,
     u"A recipient matched more than one of the recipient descriptor"
     "structures and MAPI_DIALOG was not set. No message was sent.",
     u"The address fits more than one recipient. No message was sent."},
};

constexpr int wordless[] = {16, 17, 19, 20, 22, 23, 24, 26};

} // namespace

QString MailResultText(int code, bool english) {
    for (const auto& row : resultTexts) {
        if (row.code == code)
            return (english ? row.english : row.hebrew).toString();
    }
    if (std::find(std::begin(wordless), std::end(wordless), code) != std::end(wordless))
        return {};
    return english ? u"An unclear fault kept the file from being sent."_s
                   : u"תקלה לא ברורה אבל בכל זאת מנעה משלוח של הקובץ"_s;
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
