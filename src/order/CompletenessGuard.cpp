#include "order/CompletenessGuard.h"

#include "order/OrderCompleteness.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"

namespace lumora {

bool CompletenessGuard::maySend(const OrderCompleteness& counts) const {
    if (!m_state.Careful)
        return true;
    switch (counts.verdict()) {
    case OrderCompleteness::Verdict::None:
        m_platform.dialogs.message(whatIsMissing(counts));
        return false;
    case OrderCompleteness::Verdict::Fewer:
        return askForFewer(counts);
    case OrderCompleteness::Verdict::Whole:
    case OrderCompleteness::Verdict::Unknown:
        break;
    }
    return true;
}

} // namespace lumora
