// The page of pictures: choosing, counting, the whole folder, and what the editor stores.
#include "common/DrivePathText.h"
#include "editing/editor/tFrmNew.h"
#include "editing/render/StoredSmallView.h"
#include "order/EditRecord.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "selection/HandOverFiles.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

PrintCode kyoskNew::composeCode(int copies, PaperWords words) {
    m_paper = paperLetter(m_state.shemot.maat, words, m_paper);
    return {copies, sizeField(m_state.shemot), m_paper, m_state.shemot.Bord};
}

PrintCode kyoskNew::composeCodeOfCell(int cell) {
    m_cell = cell;
    const int copies = copiesOfCell(cell) == 0 ? 1 : copiesOfCell(cell);
    Label4[static_cast<std::size_t>(cell)].text = QString::number(copies);
    return composeCode(copies, PaperWords::All);
}

void kyoskNew::SumCopies() {
    Label7.text = QString::number(List1.SumCopies());
}

void kyoskNew::unpackOpen(const QString& record) {
    UnpackEditState(record, m_state.edit);
    Label24.text = m_state.edit.EditState;
}

void kyoskNew::Picture1_Click(int cell) {
    if (List2.item(cell).isEmpty())
        return;
    if (plain()) {
        AddSimple(cell);
    } else {
        leaveEditor(); // by the small pictures below it
        AddForEditor(cell);
        openInEditor(cell);
    }
    Q_EMIT changed();
}

void kyoskNew::AddSimple(int cell) {
    const QString path = List2.item(cell);
    const QString line = BasketLine{composeCodeOfCell(cell).compose(), {}, path}.compose(List1.form());
    Label1.text = path;
    showLarge(path);
    if (const int index = List1.FindByPath9(path); index >= 0)
        List1.replaceAt(index, line);
    else
        List1.append(line);
    Picture4[static_cast<std::size_t>(cell)].visible = true;
    Label2.text = path;
    SumCopies();
}

void kyoskNew::AddForEditor(int cell) {
    const QString path = List2.item(cell);
    BasketLine line{composeCodeOfCell(cell).compose(), {}, path};
    m_state.edit.PicturePath = path;
    Label1.text = path;
    if (const int index = List1.FindByPath(path); index >= 0) {
        unpackOpen(BasketLine::split(List1.item(index), List1.form()).editState);
        if (m_state.edit.RedMarker == EditRecord::corrected)
            m_state.edit.TempRedName = MangleFileName(path);
        line.editState = m_state.edit.EditState;
        List1.replaceAt(index, line.compose(List1.form()));
    } else {
        // What an earlier choice of the same picture left behind would show it changed.
        StoredSmallView::discard(m_state, m_platform.files, path);
        unpackOpen(EditRecord::newPicture());
        line.editState = m_state.edit.EditState;
        List1.append(line.compose(List1.form()));
    }
    Picture4[static_cast<std::size_t>(cell)].visible = true;
    Label2.text = path;
    SumCopies();
}

tFrmNew* kyoskNew::editor() const {
    return m_chain.find<tFrmNew>();
}

// Once an order, with this page.
void kyoskNew::loadEditor() {
    if (!m_chain.isRegistered(PageId::tFrmNew))
        return;
    m_chain.load(PageId::tFrmNew);
    connect(editor(), &tFrmNew::stored, this, &kyoskNew::ZZvvA_Click);
    connect(editor(), &tFrmNew::left, this, &kyoskNew::leaveEditor);
    connect(editor(), &tFrmNew::picked, this, &kyoskNew::showFolderOf);
}

void kyoskNew::openInEditor(int cell) {
    if (editor() == nullptr)
        return;
    setKeysPlain();
    editor()->openPicture();
    if (!editor()->pictureOpen())
        return; // it was told; the picture stays in the basket as it was
    Command13[static_cast<std::size_t>(cell)].colour = KeyColour::Orange;
    editorView.visible = true;
    m_chain.follow(PageId::kyoskNew, Outcome::EditorWanted);
}

// What is in hand is let go and packed before another picture's fields take the place of these: a zoom that is still
// held, a caption that was dragged and, by its own rule, not packed. What was seen is what prints.
void kyoskNew::leaveEditor() {
    if (editor() != nullptr) {
        editor()->stopHolds();
        editor()->keepRecord();
    }
    Command5_Click();
    repaintStored(m_state.edit.PicturePath);
    Q_EMIT changed();
}

void kyoskNew::Command12_Click(int cell) {
    if (!List2.item(cell).isEmpty())
        setCopies(cell, std::min(copiesOfCell(cell) + 1, PrintCode::mostCopies));
}

void kyoskNew::Command13_Click(int cell) {
    if (!List2.item(cell).isEmpty())
        setCopies(cell, std::max(copiesOfCell(cell) - 1, 0));
}

void kyoskNew::setCopies(int cell, int copies) {
    const auto at = static_cast<std::size_t>(cell);
    m_cell = cell;
    Label4[at].text = QString::number(copies);
    const QString path = List2.item(cell);
    const int index = List1.FindByPath(path);
    if (copies == 0) {
        List1.removeAt(index);
        Picture4[at].visible = false;
        if (Command13[at].colour == KeyColour::Orange) {
            Command13[at].colour = KeyColour::System;
            editorView.visible = false;
        }
        if (!plain() && index >= 0)
            repaintStored(path); // as the file is: chosen again it begins without its edits
    } else {
        // The rest of a line stays, edits included.
        if (index >= 0)
            List1.replaceAt(index, BasketLine::withCopies(List1.item(index), copies));
        else
            List1.append(
                BasketLine{composeCode(copies, PaperWords::All).compose(), m_state.edit.EditState, path}.compose(
                    List1.form()));
        Picture4[at].visible = true;
    }
    SumCopies();
    Q_EMIT changed();
}

void kyoskNew::Image8_Click() {
    for (int cell = 0; cell < cellsOfPage; ++cell) {
        while (!List2.item(cell).isEmpty() && Picture4[static_cast<std::size_t>(cell)].visible)
            Command13_Click(cell);
    }
}

void kyoskNew::Command11_Click() {
    List1.removeDuplicates();
    Label1.text = QString::number(List1.count());
    SumCopies();
    Q_EMIT changed();
}

void kyoskNew::AddWholeFolderLine(int index) {
    const QString path = List4.item(index);
    const QString line = BasketLine{composeCode(1, PaperWords::WholeFolder).compose(), {}, path}.compose(List1.form());
    if (const int found = List1.FindByPath9(path); found >= 0)
        List1.replaceAt(found, line);
    else
        List1.append(line);
}

void kyoskNew::Command24_Click() {
    Label35.visible = false;
    for (int i = 0; i < List4.count(); ++i)
        AddWholeFolderLine(i);
    Timer2.stop();
    for (Caption* part : {&Image13, &Label36, &Image20})
        part->visible = false;
    Image7.visible = true;
    SumCopies();
    List4.PageBack();
    ShowPage();
}

void kyoskNew::Command25_Click() {
    showGuide(Guide::ChooseByHand);
    Picture2.visible = true;
    Q_EMIT changed();
}

void kyoskNew::Command26_Click(int yes) {
    if (yes == 0)
        Command24_Click();
    else
        Command25_Click();
}

void kyoskNew::Command23_Click() {
    Image8_Click();
    ++m_drawing;
    Timer1.stop();
    Timer2.stop();
    for (Caption* part : {&Image19, &Image20, &Label36, &Frame1, &Picture66})
        part->visible = false;
    List4.clear();
    List1.clear();
    List2.clear();
    clearCells();
    Label34.text = QString::number(0);
    Label29.text.clear();
    SumCopies();
    Q_EMIT changed();
}

void kyoskNew::Command5_Click() {
    if (m_state.edit.PicturePath.trimmed().isEmpty() || editor() == nullptr)
        return;
    const Bitmap preview = editor()->takeSmallView();
    if (preview.isNull())
        return; // what was stored last still holds
    const Result<void> stored = StoredSmallView::store(m_state, m_platform.files, m_state.edit.PicturePath, preview);
    if (!stored)
        m_platform.dialogs.message(stored.failure().message);
}

void kyoskNew::ZZvvA_Click() {
    const QString path = m_state.edit.PicturePath;
    const int index = List1.FindByPath(path);
    if (path.isEmpty() || index < 0)
        return;
    // The cell may show another picture by now, so that the copies are those of the line.
    const PrintCode code = composeCode(PrintCode::copiesOf(List1.item(index)), PaperWords::All);
    List1.replaceAt(index, BasketLine{code.compose(), m_state.edit.EditState, path}.compose(List1.form()));
    SumCopies();
    const Result<void> written = HandOverFiles(m_state, m_platform.files).write(List1.lines().items(), index);
    if (!written && !m_handOverFailed)
        m_platform.dialogs.message(written.failure().message);
    m_handOverFailed = !written;
    // Behind the editor the small picture waits until the customer comes back.
    if (m_chain.front() == this) {
        repaintStored(path);
        Q_EMIT changed();
    }
}

} // namespace lumora
