#include "editing/editor/CoverZoom.h"

#include "editing/render/EditedPicture.h"
#include "session/SessionState.h"

#include <utility>

namespace lumora {

void CoverZoom::turn(EditFields& edit, std::int16_t rotationCode, const EditedPreview& picture) {
    const bool covered = m_state.Careful && (isRaisedToTheLast(edit) || picture.coversPaper(edit));
    if (const auto own = std::exchange(m_own, std::nullopt))
        edit.ZoomPercent = *own;
    edit.RotationCode = rotationCode;
    if (!covered)
        return;
    const std::int16_t raised = picture.coveringZoom(edit);
    if (raised != edit.ZoomPercent)
        m_own = std::exchange(edit.ZoomPercent, raised);
}

// Where nothing covers, the zoom must not fall back and rise again with every turn.
bool CoverZoom::isRaisedToTheLast(const EditFields& edit) const {
    return m_own && edit.ZoomPercent == EditedPreview::largestCoveringZoom;
}

} // namespace lumora
