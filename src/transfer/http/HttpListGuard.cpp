#include "transfer/http/HttpListGuard.h"

#include "session/SessionState.h"

namespace lumora {

ListMatch HttpListGuard::match() const {
    return m_state.Careful ? ListMatch::Whole : ListMatch::Part;
}

bool HttpListGuard::asksAgain(ServerVerdict verdict) const {
    return m_state.Careful && verdict == ServerVerdict::NotVerified;
}

int HttpListGuard::nextList(int missing, ServerVerdict verdict) const {
    const bool thereIsOne = verdict == ServerVerdict::Listed && !ListFileName(missing).isEmpty();
    return m_state.Careful && !thereIsOne ? first : missing;
}

} // namespace lumora
