#include "order/CompletenessGuard.h"
#include "order/OrderCompleteness.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"

namespace lumora {

void CompletenessGuard::tellNoPicture() const {
    m_platform.dialogs.message(m_state.wording(u"אין בהזמנה זו אף תמונה להדפסה, ולכן לא נשלח דבר.",
                                               u"This order holds no picture to print, so nothing is sent."));
}

bool CompletenessGuard::askForFewer(const OrderCompleteness& counts) const {
    return m_platform.dialogs.ask(
        m_state
            .wording(u"לפי הרישום יש בהזמנה %1 תמונות, ורק %2 מהן יישלחו. לשלוח בכל זאת?",
                     u"The order's log names %1 pictures, and only %2 of them would be sent. Send all the same?")
            .arg(counts.named.value_or(0))
            .arg(counts.sent()));
}

} // namespace lumora
