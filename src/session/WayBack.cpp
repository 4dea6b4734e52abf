#include "session/WayBack.h"

#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

bool leadsToPictures(PageId from, const SessionState& state, const PageChain& chain) {
    return !state.handOver.basket.isEmpty() && chain.canFollow(from, Outcome::PicturesWanted);
}

bool goBackToPictures(PageId from, SessionState& state, PageChain& chain) {
    state.handOver.back = true;
    // The sending page has read the order's details from its log, which the code page may have changed.
    state.shemot = state.handOver.details;
    const bool left = chain.follow(from, Outcome::PicturesWanted);
    if (!left)
        state.handOver.back = false;
    return left;
}

} // namespace lumora
