// The wording that both preparation pages share, in both languages.
#include "assembly/PreparationPage.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

QString PreparationPage::doNotDelete() const {
    return m_state.wording(u"אם בכוונתך למחוק את התמונות מהמחשב או מהמצלמה או מכל מדיה אחרת",
                           u"If you mean to delete the pictures from the computer, the camera or any other "
                           "medium,");
}

QString PreparationPage::untilPrinted() const {
    return m_state.wording(u"אל תמחק אותם עד אשר תקבל את התמונות מודפסות",
                           u"do not delete them until you hold the printed pictures in your hands");
}

QString PreparationPage::countText() const {
    return m_count > 0 ? m_state.wording(u"מתוך %1", u"of %1").arg(m_count) : QString();
}

QString PreparationPage::totalText() const {
    const QString& copies = controls().Label5.text;
    return copies.isEmpty() ? QString() : m_state.wording(u"תמונות להדפסה: %1", u"Prints: %1").arg(copies);
}

void PreparationPage::notWritten(NotWritten what, const Failure& failure) {
    switch (what) {
    case NotWritten::Folder:
        return tell(u"לא ניתן ליצור את תיקיית ההזמנה. יש לפנות מקום בדיסק או לתקן את ההרשאות ולנסות שוב."_s,
                    u"The order's folder can't be made. Free some space or mend the rights, then try again."_s,
                    failure.message);
    case NotWritten::File:
        return tell(u"קובץ של ההזמנה לא נכתב. מה שכבר הוכן נשמר."_s,
                    u"A file of the order could not be written. What was prepared so far is kept."_s, failure.message);
    case NotWritten::Print:
        return tell(u"תמונה שהכנתה נכשלה נשארה בתיקיית ההזמנה, ולכן ההזמנה לא נשלחה. התמונות שהוכנו נשמרו. "
                    u"יש לתקן ולנסות שוב."_s,
                    u"A print that failed can't be removed from the order, so the order was not sent. What was "
                    u"prepared is kept. Put it right, then try again."_s,
                    failure.message);
    case NotWritten::Sheet:
        return tell(u"לא ניתן לכתוב את דף ההזמנה, ולכן ההזמנה לא נשלחה. התמונות שהוכנו נשמרו. יש לתקן ולנסות שוב."_s,
                    u"The order sheet can't be written, so the order was not sent. What was prepared is kept. "
                    u"Put it right, then try again."_s,
                    failure.message);
    case NotWritten::Counter:
        return tell(u"מספר ההזמנה הבאה לא נשמר. ההזמנה ממשיכה כרגיל."_s,
                    u"The number of the next order could not be stored. This order goes on."_s, failure.message);
    case NotWritten::Log:
        return tell(u"לא ניתן לכתוב את פרטי ההזמנה, ולכן ההזמנה לא נשלחה. התמונות שהוכנו נשמרו. יש לתקן ולנסות שוב."_s,
                    u"The order's details can't be written, so the order was not sent. What was prepared is kept. "
                    u"Put it right, then try again."_s,
                    failure.message);
    }
}

void PreparationPage::filesNotWritten(int count) {
    tell(u"%1 קבצים של ההזמנה לא נכתבו."_s.arg(count), u"%1 files of the order could not be written."_s.arg(count));
}

QString PreparationPage::listText() const {
    return m_state.wording(u"התמונות שבהזמנה", u"The pictures of the order");
}

void PreparationPage::showProgress() {
    PreparationControls& on = shared();
    const QString position = QString::number(m_position);
    const QString count = QString::number(m_count);
    const auto say = [&](const char16_t* hebrew, const char16_t* english) {
        on.Label4Progress.text = m_state.wording(hebrew, english);
    };
    on.Label16.text = count;
    on.Label17.text = m_stage == Stage::Pictures ? position : QString();
    switch (m_stage) {
    case Stage::Waiting:
        say(u"ההזמנה עוד לא הוכנה", u"The order is not prepared yet");
        break;
    case Stage::Checking:
        say(u"בודק את רשימת התמונות", u"Checking the list of pictures");
        break;
    case Stage::Sheet:
        say(u"מצייר את דף ההזמנה: תמונה %1 מתוך %2", u"Drawing the order sheet: picture %1 of %2");
        break;
    case Stage::Pictures:
        say(u"מכין תמונה מספר %1 מתוך %2 תמונות שבחרת", u"Preparing picture %1 of the %2 that you chose");
        break;
    case Stage::Closing:
        say(u"רושם את פרטי ההזמנה", u"Writing down the order's details");
        break;
    case Stage::Done:
        say(u"ההזמנה מוכנה", u"The order is ready");
        break;
    }
    if (m_stage == Stage::Sheet || m_stage == Stage::Pictures)
        on.Label4Progress.text = on.Label4Progress.text.arg(position, count);
    m_leftOut.show();
    on.Label4fail.visible = !on.List4fail.isEmpty();
    on.Label4fail.text = m_state.wording(u"%1 תמונות לא ניתן היה להכין:", u"Pictures that could not be prepared: %1")
                             .arg(on.List4fail.count());
}

} // namespace lumora
