#include "order/CompletenessGuard.h"
#include "order/OrderCompleteness.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"

namespace lumora {

void CompletenessGuard::tellNoPicture(const OrderCompleteness& counts) const {
    if (counts.damaged > 0) {
        m_platform.dialogs.message(
            m_state.wording(u"כל התמונות בהזמנה זו נפגמו במחשב זה לאחר שהוכנו, ולכן לא נשלח דבר.",
                            u"No picture of this order that was to be sent is whole on this computer any more, so "
                            u"nothing is sent."));
        return;
    }
    m_platform.dialogs.message(m_state.wording(u"אין בהזמנה זו אף תמונה להדפסה, ולכן לא נשלח דבר.",
                                               u"This order holds no picture to print, so nothing is sent."));
}

bool CompletenessGuard::askForFewer(const OrderCompleteness& counts) const {
    if (counts.damaged > 0)
        return m_platform.dialogs.ask(
            m_state
                .wording(u"בהזמנה %1 תמונות, ורק %2 מהן שלמות: קבצים שנפגמו במחשב זה לאחר שהוכנו: %3. לשלוח בכל זאת?",
                         u"The order has %1 pictures, and only %2 of them are whole: %3 were damaged on this computer "
                         u"after they were made. Send all the same?")
                .arg(counts.named.value_or(0))
                .arg(counts.sent())
                .arg(counts.damaged));
    return m_platform.dialogs.ask(
        m_state
            .wording(u"לפי הרישום יש בהזמנה %1 תמונות, ורק %2 מהן יישלחו. לשלוח בכל זאת?",
                     u"The order's log names %1 pictures, and only %2 of them would be sent. Send all the same?")
            .arg(counts.named.value_or(0))
            .arg(counts.sent()));
}

} // namespace lumora
