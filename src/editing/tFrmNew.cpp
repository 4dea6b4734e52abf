#include "editing/tFrmNew.h"

#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

tFrmNew::tFrmNew(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::tFrmNew)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_frames(platform.files, WorkspacePaths::misgarot(state))
    , Timer2(holdMilliseconds, [this] { Timer2_Tick(); })
    , Timer3(holdMilliseconds, [this] { Timer3_Tick(); })
    , Timer6(holdMilliseconds, [this] { Timer6_Tick(); })
    , Timer7(holdMilliseconds, [this] { Timer7_Tick(); })
    , Timer8(holdMilliseconds, [this] { Timer8_Tick(); }) {}

tFrmNew::~tFrmNew() = default;

} // namespace lumora
