#include "entry/details/RememberedDetails.h"

#include "session/SessionState.h"

namespace lumora {

Result<void> RememberedDetails::typed(const DetailStore::Customer& customer, bool remember) const {
    if (m_state.kiosk.on)
        return {};
    return remember || !m_state.Careful ? m_store.SaveDetails(customer) : Result<void>();
}

Result<void> RememberedDetails::ordered(const DetailStore::Customer& customer, bool remember) const {
    if (m_state.kiosk.on)
        return m_store.forgetDetails();
    // Details without a name were not typed for this order.
    if (m_state.Careful && m_state.Optint == OrderKind::Album && (!remember || customer.name.trimmed().isEmpty()))
        return {};
    return remember ? m_store.SaveDetails(customer) : m_store.forgetDetails();
}

} // namespace lumora
