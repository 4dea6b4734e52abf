// The question about a telephone number that the tail would cut, in both languages.
#include "order/TailTelephone.h"
#include "session/SessionState.h"

namespace lumora {

QString TailTelephone::question(const QString& kept) const {
    return m_state
        .wording(u"מספר הטלפון ארוך מעשרה תווים. עם התמונות יירשם רק: %1\nלהמשיך כך?",
                 u"The telephone number has more than ten characters. Only this goes with the "
                 "pictures: %1\nGo on with it?")
        .arg(kept);
}

} // namespace lumora
