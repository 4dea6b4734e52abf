#include "entry/notice/Havharot.h"

#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

Havharot::Havharot(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::Havharot)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain) {}

void Havharot::setTexts() {
    const SessionState& s = m_state;
    Command2.visible = !m_plain;
    Command3.visible = !m_plain;
    Command4.visible = !m_plain;
    if (m_plain) {
        Title.text = s.wording(u"שירותים נוספים"_qs, u"More services"_qs);
        Label1.text = s.wording(u"בתחנה זו אין עדיין שירותים נוספים."_qs,
                                u"There are no further services at this station yet."_qs);
        Command1.text = s.wording(u"חזור"_qs, u"Back"_qs);
    } else {
        Title.text = s.wording(u"הבהרות ואזהרות"_qs, u"Clarifications and warnings"_qs);
        Label1.text = s.wording(u"התמונות שלכם נקראות בלבד ואינן משתנות.\n"
                                u"הזמנה שלא נשלחה נשארת במחשב זה עד שתישלח.\n"
                                u"אין לנתק כרטיס זיכרון בזמן הכנת ההזמנה.\n"
                                u"למשלוח תמונות בדואר דרושה תוכנת דואר מוגדרת."_qs,
                                u"Your pictures are only read and never changed.\n"
                                u"An order that was not sent stays on this computer until it is.\n"
                                u"Do not pull out a memory card while an order is being prepared.\n"
                                u"Sending pictures by mail needs a mail program that is set up."_qs);
        Command1.text = s.wording(u"המשך"_qs, u"Go on"_qs);
    }
    Command2.text = s.wording(u"יציאה"_qs, u"Exit"_qs);
    Command3.text = s.wording(u"בדוק תוכנת דואר"_qs, u"Check the mail program"_qs);
    Command4.text = s.wording(u"הגדר תוכנת דואר"_qs, u"Set up the mail program"_qs);
    Q_EMIT changed();
}

void Havharot::showPlain() {
    m_plain = true;
    setTexts();
}

void Havharot::Command1_Click() {
    m_chain.unload(PageId::Havharot);
}

void Havharot::Command2_Click() {
    m_chain.endProgram();
}

void Havharot::Command3_Click() {
    m_platform.shell.openWebPage(QStringLiteral("mailto:"));
}

void Havharot::Command4_Click() {
    m_platform.dialogs.message(m_state.wording(
        u"פתחו את הגדרות המערכת, בחרו יישומי ברירת מחדל,\nוקבעו שם את תוכנת הדואר."_qs,
        u"Open the system settings, choose the default applications,\nand set the mail program there."_qs));
}

} // namespace lumora
