#include "finished/mail/UnsentPackages.h"

#include "finished/mail/PackageWalk.h"
#include "session/SessionState.h"

namespace lumora {

int UnsentPackages::count(const PackageWalk& walk) const {
    const int sent = walk.count(PackageWalk::Fate::Sent);
    return m_state.Careful && sent > 0 ? walk.count() - sent : 0;
}

} // namespace lumora
