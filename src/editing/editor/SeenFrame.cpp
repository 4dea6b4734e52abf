#include "editing/editor/SeenFrame.h"

#include "order/EditRecord.h"
#include "session/SessionState.h"

namespace lumora {

bool SeenFrame::ticked(bool before) const {
    return m_state.Careful || before;
}

bool SeenFrame::takeOut(EditFields& edit) const {
    if (!m_state.Careful || edit.FrameName == EditRecord::noFrame || edit.FrameName == EditRecord::frameRemoved)
        return false;
    edit.FrameName = EditRecord::frameRemoved;
    return true;
}

FrameUse SeenFrame::use() const {
    return m_state.Careful ? FrameUse::PreviewElsePrint : FrameUse::Preview;
}

} // namespace lumora
