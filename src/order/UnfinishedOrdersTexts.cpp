#include "order/UnfinishedOrders.h"

#include "session/SessionState.h"

namespace lumora {

QString GoneText(const SessionState& state, const UnfinishedOrder& order) {
    return state.wording(u"%1 מתוך %2 התמונות אינן עוד במקומן.", u"%1 of %2 pictures are no longer where they were.")
        .arg(order.gone)
        .arg(order.pictures);
}

QString ThrowAwayQuestion(const SessionState& state, const QString& number) {
    return state
        .wording(u"לזרוק את הזמנה מספר %1? לא ניתן להחזיר אותה.",
                 u"Throw order number %1 away? It can't be brought back.")
        .arg(number);
}

} // namespace lumora
