#include "entry/notice/Havharot.h"

#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "session/CaptionTexts.h"
#include "session/PageChain.h"

namespace lumora {

using namespace Qt::StringLiterals;

Havharot::Havharot(const SessionState& state, const Platform& platform, PageChain& chain)
    : Page(pageId)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain) {}

void Havharot::setTexts() {
    const bool isStaffs = m_state.closedToCustomers();
    Command2.visible = Command3.visible = Command4.visible = !m_plain && !isStaffs;
    if (!m_plain && isStaffs)
        setCaptions(m_state, {
                                 {Title, u"הבהרות ואזהרות", u"Clarifications and warnings"},
                                 {Label1,
                                  u"התמונות שלכם נקראות בלבד ואינן משתנות.\n"
                                  u"הזמנה שלא נשלחה נשארת במכשיר זה עד שתישלח.\n"
                                  u"אין לנתק כרטיס זיכרון בזמן הכנת ההזמנה.",
                                  u"Your pictures are only read and never changed.\n"
                                  u"An order that was not sent stays on this machine until it is.\n"
                                  u"Do not pull out a memory card while an order is being prepared."},
                                 {Command1, u"המשך", u"Go on"},
                             });
    else if (m_plain)
        setCaptions(m_state, {
                                 {Title, u"שירותים נוספים", u"More services"},
                                 {Label1, u"בתחנה זו אין עדיין שירותים נוספים.",
                                  u"There are no further services at this station yet."},
                                 {Command1, u"חזור", u"Back"},
                             });
    else
        setCaptions(m_state,
                    {
                        {Title, u"הבהרות ואזהרות", u"Clarifications and warnings"},
                        {Label1,
                         u"התמונות שלכם נקראות בלבד ואינן משתנות.\n"
                         u"הזמנה שלא נשלחה נשארת במחשב זה עד שתישלח.\n"
                         u"אין לנתק כרטיס זיכרון בזמן הכנת ההזמנה.\n"
                         u"משלוח בדואר יוצא דרך שרת הדואר של המעבדה. אין צורך בתוכנת דואר במחשב זה.\n"
                         u"ניקיון ההיסטוריה מוחק את קבצי ההדפסה של הזמנות קודמות%1. לאחר מכן לא ניתן לשלוח אותן שוב.\n"
                         u"דפי ההזמנה, רישומי ההזמנות והתמונות שלכם אינם נמחקים.",
                         u"Your pictures are only read and never changed.\n"
                         u"An order that was not sent stays on this computer until it is.\n"
                         u"Do not pull out a memory card while an order is being prepared.\n"
                         u"Mail goes by the lab's own mail server. It needs no mail program on this computer.\n"
                         u"Cleaning the history deletes the print files of earlier orders%1. They can't be sent "
                         u"again after that.\nOrder sheets, order logs and your own pictures stay."},
                        {Command1, u"המשך", u"Go on"},
                    });
    // The clean-up then keeps the others.
    const QString arrived = m_state.wording(u" שהגיעו", u" that have arrived");
    Label1.text.replace(u"%1"_s, m_state.Careful ? arrived : QString());
    setCaptions(m_state, {
                             {Command2, u"יציאה", u"Exit"},
                             {Command3, u"בדוק תוכנת דואר", u"Check the mail program"},
                             {Command4, u"הגדר תוכנת דואר", u"Set up the mail program"},
                         });
    Q_EMIT changed();
}

void Havharot::showPlain() {
    m_plain = true;
    setTexts();
}

void Havharot::goOn() {
    m_chain.unload(pageId);
}

void Havharot::endProgram() {
    m_chain.endProgram();
}

void Havharot::openMailProgram() {
    m_platform.shell.openWebPage(u"mailto:"_s, [&state = m_state, &platform = m_platform] {
        if (state.Careful || state.closedToCustomers())
            platform.dialogs.message(
                state.wording(u"במחשב זה אין תוכנת דואר. לתוכנה זו אין צורך בה.",
                              u"There is no mail program on this computer. This program needs none."));
    });
}

void Havharot::tellHowToSetUpMail() {
    m_platform.dialogs.message(m_state.wording(
        u"לתוכנה זו אין צורך בתוכנת דואר.\nלשימוש אחר: יש לפתוח את הגדרות המערכת, לבחור יישומי ברירת מחדל,\n"
        u"ולקבוע שם את תוכנת הדואר.",
        u"This program needs no mail program.\nFor other uses open the system settings, choose the "
        u"default applications,\nand set the mail program there."));
}

} // namespace lumora
