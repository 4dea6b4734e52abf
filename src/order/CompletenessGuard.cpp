#include "order/CompletenessGuard.h"

#include "order/OrderCompleteness.h"
#include "session/SessionState.h"

namespace lumora {

bool CompletenessGuard::maySend(const OrderCompleteness& counts) const {
    if (!m_state.Careful)
        return true;
    switch (counts.verdict()) {
    case OrderCompleteness::Verdict::None:
        tellNoPicture(counts);
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
