#include "order/CompletenessGuard.h"

#include "order/OrderCompleteness.h"
#include "order/OrderFolder.h"
#include "platform/Platform.h"
#include "session/SessionState.h"

namespace lumora {

bool CompletenessGuard::maySend(const OrderFolder& folder, const QStringList& names) const {
    if (!m_state.Careful)
        return true;
    const OrderCompleteness counts =
        OrderCompleteness::read(m_platform.files, folder, names, DamagedPrints(m_platform.files, folder));
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
