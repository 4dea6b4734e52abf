// The page of pictures: choosing, counting, the whole folder, and what the editor stores.
#include "common/DrivePath.h"
#include "editing/editor/tFrmNew.h"
#include "editing/render/StoredSmallView.h"
#include "order/EditRecord.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "selection/HandOverFiles.h"
#include "selection/door/PictureDoor.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

void kyoskNew::choosePicture(int cell) {
    const QString path = m_choice.path(cell);
    if (path.isEmpty() || m_door->isUnreadable(path))
        return;
    m_openWhenMade = !plain() && m_door->isWaiting(path) ? path : QString();
    if (!m_openWhenMade.isEmpty())
        return orderPictures();
    if (plain()) {
        m_choice.choose(cell, {});
        if (m_door->isWaiting(path))
            Picture2.bitmap = Bitmap();
        showLarge(DrivePath(path));
    } else {
        leaveEditor();
        takeIntoEditor(path);
        m_choice.choose(cell, m_state.edit.EditState);
    }
    takeInHand(path);
    showChoice();
    if (plain())
        return;
    m_openCell = -1;
    editor().openPicture();
    if (!editor().pictureOpen())
        return; // the editor has told why; the picture stays in the basket as it was
    m_openCell = cell;
    m_chain.follow(pageId, Outcome::EditorWanted);
    Q_EMIT changed();
}

// The session's edit fields become those of the picture.
void kyoskNew::takeIntoEditor(const QString& path) {
    const std::optional<QString> record = m_choice.recordOf(path);
    // The stored view of an earlier choice would show the picture changed.
    if (!record)
        StoredSmallView::discard(m_state, m_platform.files, DrivePath(path));
    m_state.edit.PicturePath = DrivePath(path);
    UnpackEditState(record.value_or(EditRecord::newPicture()), m_state.edit);
    if (m_state.edit.RedMarker == EditRecord::corrected)
        m_state.edit.TempRedName = MangleFileName(m_state.edit.PicturePath);
    Label24.text = m_state.edit.EditState;
}

tFrmNew& kyoskNew::editor() const {
    return *m_chain.find<tFrmNew>();
}

// A held zoom ends and a dragged caption is packed before the next picture's fields replace the present ones, so that
// the print is what the customer saw.
void kyoskNew::leaveEditor() {
    editor().stopHolds();
    editor().keepRecord();
    storeSmallView();
    repaint(m_state.edit.PicturePath.text());
}

void kyoskNew::addCopies(int cell, int more) {
    if (!m_choice.path(cell).isEmpty() && !m_door->isUnreadable(m_choice.path(cell)))
        setCopies(cell, m_choice.copies(cell) + more);
}

void kyoskNew::setCopies(int cell, int copies) {
    const QString path = m_choice.path(cell);
    const bool wasInBasket = m_choice.inBasket(path);
    m_choice.setCopies(cell, copies);
    if (!plain() && !wasInBasket && m_choice.inBasket(path))
        beginWithoutEdits(DrivePath(path));
    if (!m_choice.chosen(cell)) {
        if (m_choice.path(m_openCell) == path)
            m_openCell = -1;
        if (!plain() && wasInBasket)
            repaint(path); // as its file is, since a picture chosen again begins without edits
    }
    showChoice();
}

// What the editor still holds of the picture goes too, so that leaving the editor does not store it.
void kyoskNew::beginWithoutEdits(const DrivePath& picture) {
    StoredSmallView::discard(m_state, m_platform.files, picture);
    if (m_state.edit.PicturePath == picture)
        UnpackEditState(EditRecord::newPicture(), m_state.edit);
}

void kyoskNew::cancelPage() {
    for (int cell = 0; cell < cellsOfPage; ++cell) {
        if (m_choice.chosen(cell))
            setCopies(cell, 0);
    }
}

void kyoskNew::chooseWholeFolder() {
    // A folder of thousands on a card takes a while to look at.
    const QStringList listed = m_choice.folders().paths().items();
    for (qsizetype i = 0; !m_door->folder().isEmpty() && i < listed.size(); ++i) {
        m_door->worked(listed[i]);
        if (i % 16 == 15)
            m_platform.pump.pump();
    }
    m_choice.chooseAll([this](const QString& path) { return m_door->isUnreadable(path); });
    Timer2.stop();
    for (Caption* part : {&Label35, &Image13, &Label36, &Image20})
        part->visible = false;
    Image7.visible = true;
    m_choice.previousPage();
    drawPage();
}

void kyoskNew::chooseByHand() {
    showGuide(Guide::ChooseByHand);
    Q_EMIT changed();
}

void kyoskNew::beginAgain() {
    cancelPage();
    ++m_drawing;
    Timer1.stop();
    Timer2.stop();
    for (Caption* part : {&Image19, &Image20, &Label36, &Frame1, &Picture66})
        part->visible = false;
    m_choice.clear();
    Label29.text.clear();
    showPictureCount();
    clearCells();
    showChoice();
}

void kyoskNew::storeSmallView() {
    if (m_state.edit.PicturePath.text().trimmed().isEmpty())
        return;
    const Bitmap preview = editor().takeSmallView();
    if (preview.isNull())
        return; // the view stored last is still right
    const Result<void> stored = StoredSmallView::store(m_state, m_platform.files, m_state.edit.PicturePath, preview);
    if (!stored)
        m_platform.dialogs.message(stored.failure().message);
}

// The index of the basket's line that has the record now, or -1.
int kyoskNew::putRecord() {
    const QString& path = m_state.edit.PicturePath.text();
    const int index = path.isEmpty() ? -1 : m_choice.storeRecord(path, m_state.edit.EditState);
    if (index >= 0)
        showChoice();
    return index;
}

void kyoskNew::storeRecord() {
    const int index = putRecord();
    if (index < 0)
        return;
    const Result<void> written = writeHandOverFiles(m_state, m_platform.files, List1.items(), index);
    if (!written && !m_handOverFailed)
        m_platform.dialogs.message(written.failure().message);
    m_handOverFailed = !written;
    // While the editor is in front, the small picture is left until the customer comes back.
    if (m_chain.front() == this)
        repaint(m_state.edit.PicturePath.text());
}

} // namespace lumora
