#include "order/CompletenessGuard.h"
#include "order/OrderCompleteness.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"

namespace lumora {

QString CompletenessGuard::whatIsMissing(const OrderCompleteness& counts) const {
    const bool damaged = counts.damaged > 0;
    if (counts.verdict() == OrderCompleteness::Verdict::None)
        return damaged ? m_state.wording(u"כל התמונות בהזמנה זו נפגמו במחשב זה לאחר שהוכנו, ולכן לא נשלח דבר.",
                                         u"No picture of this order that was to be sent is whole on this computer any "
                                         u"more, so nothing is sent.")
                       : m_state.wording(u"אין בהזמנה זו אף תמונה להדפסה, ולכן לא נשלח דבר.",
                                         u"This order holds no picture to print, so nothing is sent.");
    const QString named = QString::number(counts.named.value_or(0));
    const QString sent = QString::number(counts.sent());
    if (damaged)
        return m_state
            .wording(u"בהזמנה %1 תמונות, ורק %2 מהן שלמות: קבצים שנפגמו במחשב זה לאחר שהוכנו: %3.",
                     u"The order has %1 pictures, and only %2 of them are whole: %3 were damaged on this computer "
                     u"after they were made.")
            .arg(named, sent, QString::number(counts.damaged));
    return m_state
        .wording(u"לפי הרישום יש בהזמנה %1 תמונות, ורק %2 מהן יישלחו.",
                 u"The order's log names %1 pictures, and only %2 of them would be sent.")
        .arg(named, sent);
}

bool CompletenessGuard::askForFewer(const OrderCompleteness& counts) const {
    return m_platform.dialogs.ask(whatIsMissing(counts) + m_state.wording(u" לשלוח בכל זאת?", u" Send all the same?"));
}

} // namespace lumora
