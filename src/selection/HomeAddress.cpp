#include "selection/HomeAddress.h"

#include "session/SessionState.h"

namespace lumora {

bool HomeAddress::isMissing(const QString& note) const {
    const QString& home = m_state.profile.Branches.back().caption;
    return m_state.Careful && !home.isEmpty() && m_state.BranchChoice == home &&
           m_state.shemot.n3.trimmed().isEmpty() && note.trimmed().isEmpty();
}

} // namespace lumora
