#include "editing/caption/CaptionGuard.h"

#include "editing/caption/CaptionStep.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

int CaptionGuard::lastSign(const QString& text) const {
    return m_state.Careful && text.endsWith(u"\r\n"_s) ? 2 : 1;
}

// Only a picture that had a caption has a font.
void CaptionGuard::begin(EditFields& edit) const {
    if (m_state.Careful && !edit.TextFont.isEmpty())
        edit.TextOn = 1;
    else
        CaptionStep::begin(edit);
}

bool CaptionGuard::keepsDraggedPlace() const {
    return m_state.Careful;
}

} // namespace lumora
