#include "editing/redeye/KeptCorrection.h"

#include "editing/redeye/RedEyePicture.h"
#include "order/EditRecord.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

bool KeptCorrection::isSeen() const {
    return m_state.Careful;
}

DrivePath KeptCorrection::begin(const DrivePath& picture) const {
    const DrivePath copy = WorkspacePaths::corrected(m_state, picture);
    const bool goesOn = m_state.Careful && m_state.edit.RedMarker == EditRecord::corrected && m_files.fileExists(copy);
    return goesOn ? copy : picture;
}

KeptCorrection::Accept KeptCorrection::accept(const RedEyePicture& picture) const {
    if (m_state.Careful && !picture.differsFromFile())
        return m_state.edit.RedMarker == EditRecord::corrected ? Accept::GiveUp : Accept::Nothing;
    return picture.RedChanged ? Accept::Save : Accept::Nothing;
}

} // namespace lumora
