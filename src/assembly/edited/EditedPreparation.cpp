#include "assembly/edited/EditedPreparation.h"

#include "assembly/edited/OpenedRecords.h"
#include "common/FixedText.h"
#include "imaging/files/BmpFile.h"
#include "order/EditRecord.h"
#include "order/PrintFile.h"
#include "order/PrintFileName.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

EditedPreparation::EditedPreparation(SessionState& state, const Platform& platform, PreparationEvents& events)
    : Preparation(state, platform, events)
    , m_jobFolder(WorkspacePaths::jobFolder(state)) {}

KeptWork EditedPreparation::kept() const {
    return {m_state, m_platform.files, *m_folder};
}

void EditedPreparation::makeJobFolder() const {
    for (const DrivePath& path : {WorkspacePaths::root(m_state), WorkspacePaths::zmany(m_state), m_jobFolder}) {
        if (!m_platform.files.folderExists(path))
            static_cast<void>(m_platform.files.makeFolder(path));
    }
}

bool EditedPreparation::prepare(const QStringList& lines, std::optional<PaperSize> paper) {
    begin(OpenedRecords(m_state, m_platform.files, paper).of(lines));
    if (!claimFolder(OrderFolder::Ending::Plain, m_state.transfer.SugSheliach))
        return false;
    keep(kept().keepCorrected(m_lines));
    PrintPacker packer(m_state, m_platform.files, *m_folder, OrderTail::shortWidth);
    {
        EditedPrints prints(m_state, m_platform.files, m_lines, notMade(), paper);
        if (!forEachPicture([&](int i) { preparePicture(i, packer, prints); }))
            return false;
    }
    if (isHeldBackForPrints())
        return false;
    countOrder();
    if (!drawSheet())
        return false;
    if (!m_sheetSaved && isHeldBackForSheet({Failure::Kind::Other, m_folder->path().text()}))
        return false;
    m_events.closing();
    return writeLog(OrderLog::Layout::Edited);
}

void EditedPreparation::preparePicture(int index, PrintPacker& packer, EditedPrints& prints) {
    const BasketLine line = BasketLine::split(m_lines[index], LineForm::Full);
    packer.beginStep();
    if (!line.hasUsableName())
        return;
    m_events.inWork(line.path);
    if (isThere(index)) {
        remakeThumbnail(index, line);
        return;
    }
    if (isGivenUp(index, line.path))
        return;
    Bitmap preview;
    if (pack(packer, {index, line.code, line.path}, [&] { return renderPicture(line, prints, preview); }))
        saveThumbnail(line, preview);
    packer.removeScratch();
}

Result<QByteArray> EditedPreparation::renderPicture(const BasketLine& line, EditedPrints& prints, Bitmap& preview) {
    EditedPrintResult made = prints.next([this] { m_platform.pump.pump(); });
    if (made.toneCopy) {
        if (const Result<void> kept = keepToneCopy(line, *made.toneCopy); !kept) {
            notWritten(kept.failure());
            return kept.failure();
        }
    }
    preview = made.preview;
    return made.jpeg;
}

// The tone copy of a corrected picture is kept among the red-eye copies too, under the tone copy's own name.
Result<void> EditedPreparation::keepToneCopy(const BasketLine& line, NewContent& copy) {
    EditFields edit;
    UnpackEditState(line.editState, edit);
    if (Result<void> kept = copy.commit(NewContent::Durability::Passing); !kept)
        return kept;
    if (edit.RedMarker != EditRecord::corrected)
        return {};
    const DrivePath path = WorkspacePaths::toneCopy(m_state);
    return m_platform.files.copyFile(path, WorkspacePaths::corrected(m_state, path));
}

// A kill may have come between print and thumbnail.
void EditedPreparation::remakeThumbnail(int index, const BasketLine& line) {
    if (m_platform.files.fileExists(thumbnailPath(line)))
        return;
    const DrivePath path = m_folder->filePath(PrintNameOf(line, index, OrderKind::EditedPrint));
    const Result<QByteArray> bytes = m_platform.files.read(path);
    if (!bytes)
        return keep(bytes.failure());
    const Result<PrintFileContent> print = readPrintFile(*bytes, PrintFileShape::of(m_state.profile));
    if (!print)
        return keep(Failure{print.failure().kind, u"%1: %2"_s.arg(path.text(), print.failure().message)});
    saveThumbnail(line, printPreview(print->picture));
}

DrivePath EditedPreparation::thumbnailPath(const BasketLine& line) const {
    return m_jobFolder / (line.copiesField() + u'~' + PrintBaseName(line.path) + u".bmp"_s);
}

// Two pictures of one name and one number of copies share a thumbnail, and the sheet then shows the later one.
void EditedPreparation::saveThumbnail(const BasketLine& line, const Bitmap& preview) {
    const DrivePath path = thumbnailPath(line);
    const std::optional<HostPath> target = m_platform.files.drives().toHost(path);
    if (preview.isNull() || !target)
        return;
    m_events.printed(preview);
    NewContent thumbnail(*target, path.text());
    appendBmp(preview, thumbnail, [] { return false; });
    const Result<void> saved = thumbnail.commit(NewContent::Durability::Passing);
    keep(saved ? kept().keepThumbnail(path) : saved);
}

std::optional<Bitmap> EditedPreparation::drawSheet() {
    std::vector<SheetCell> cells;
    for (const QString& name : m_platform.files.names(m_jobFolder, u"*.bmp"_s)) {
        // Twice the last four characters: of the ending and of the name itself.
        const QString caption = name.left(std::max<qsizetype>(0, name.size() - 8));
        cells.push_back({m_platform.files.drives().toHost(m_jobFolder / name), caption});
    }
    return Preparation::drawSheet(SheetKind::Edited, m_lines, editedSheetLines(m_state, m_platform.clock.now()), cells);
}

} // namespace lumora
