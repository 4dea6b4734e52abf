#include "assembly/edited/OpenedRecords.h"

#include "common/FixedText.h"
#include "editing/render/FrameLists.h"
#include "editing/render/PicturePlacement.h"
#include "imaging/files/PictureFile.h"
#include "order/BasketLine.h"
#include "order/EditRecord.h"
#include "order/KeptPictures.h"
#include "order/UnfinishedOrders.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

QStringList OpenedRecords::of(const QStringList& lines) const {
    if (!m_state.Careful || !m_paper)
        return lines;
    QStringList opened;
    for (const QString& text : lines) {
        BasketLine line = BasketLine::split(text, LineForm::Full);
        line.editState = recordOf(line);
        opened += line.compose(LineForm::Full);
    }
    return opened;
}

QString OpenedRecords::recordOf(const BasketLine& line) const {
    EditFields edit;
    UnpackEditState(line.editState.trimmed().isEmpty() ? EditRecord::newPicture() : line.editState, edit);
    if (!isPanUnset(edit))
        return line.editState;
    const std::optional<HostPath> file =
        KeptPictures(m_files, m_state.keptFolder).hostOf(PictureOf(line, LineForm::Full, m_state));
    const Result<PictureSize> size = file ? readPictureSize(*file) : Result<PictureSize>(Failure{});
    if (!size)
        return line.editState;
    placeAtCentreIfUnset(edit, previewBox(*m_paper, orientationOf(*size)));
    PackEditState(edit, LeftField(m_state.shemot.Bord, 2),
                  FrameLists(m_files, WorkspacePaths::misgarot(m_state)).categories().value(0));
    return edit.EditState;
}

} // namespace lumora
