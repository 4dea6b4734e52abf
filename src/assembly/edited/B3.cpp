#include "assembly/edited/B3.h"

#include "assembly/OrderSheet.h"
#include "common/DrivePath.h"
#include "common/FixedText.h"
#include "editing/editor/gdisave.h"
#include "imaging/files/BmpFile.h"
#include "imaging/files/PictureFile.h"
#include "order/EditRecord.h"
#include "order/PrintFileName.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/CaptionTexts.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <algorithm>
#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int shownForAWhile = 2000; // milliseconds
constexpr int previewWidth = 300;

} // namespace

B3::B3(SessionState& state, const Platform& platform, PageChain& chain)
    : PreparationPage(PageId::B3, state, platform, chain)
    , Timer2(shownForAWhile, [this] { prepare(); }) {}

B3::~B3() = default;

void B3::load() {
    takeLines();
    listNames();
    m_paper = PaperSize::ofText(m_state.shemot.ppr);
    m_jobFolder = WorkspacePaths::jobFolder(m_state);
    setStage(Stage::Waiting);
    Timer2.start();
}

void B3::setTexts() {
    setCaptions(m_state, {
                             {Label4Title, u"הכנת תמונות למשלוח", u"Preparing your pictures"},
                             {Command1, u"הסר תמונה זו מהרשימה", u"Remove this picture from the list"},
                             {Command5, u"הכן את ההזמנה", u"Prepare the order"},
                             // The same button in the two languages of the page.
                             {Command2, u" Stop All and EXIT"},
                             {Command7, u"עצור המשלוח וצא מהתוכנה", u"Stop the sending and leave the program"},
                             {Picture5, u"דף ההזמנה", u"Order sheet"},
                         });
    Command2.visible = m_state.english();
    Command7.visible = !m_state.english();
    Label1.text = doNotDelete();
    Label2.text = untilPrinted();
    showProgress();
    Q_EMIT changed();
}

void B3::prepare() {
    Timer2.stop();
    if (isPreparing() || handedOver())
        return;
    setPreparing(true);
    const bool made = yield() && prepareOrder();
    if (m_chain.hasEnded())
        return;
    setPreparing(false);
    setStage(made ? Stage::Done : Stage::Waiting);
    if (!made)
        return;
    if (m_state.TachanaMekomit)
        handOver(Outcome::KeptAtStation);
    else
        handOver(m_state.transfer.SugSheliach == Sender::Http ? Outcome::PreparedForHttp : Outcome::PreparedForFtp);
}

void B3::stopAndLeave() {
    Timer2.stop();
    leaveProgram();
}

bool B3::prepareOrder() {
    List4fail.clear();
    m_writeFailures = 0;
    // Without the folder the sheet has no pictures, and that is all: the order goes on.
    for (const DrivePath& path : {WorkspacePaths::root(m_state), WorkspacePaths::zmany(m_state), m_jobFolder}) {
        if (!m_platform.files.folderExists(path))
            static_cast<void>(m_platform.files.makeFolder(path));
    }
    if (!somethingChosen())
        return false;
    m_state.transfer.MailFlag = 0;
    countTotal();
    const std::optional<OrderFolder> folder = claimFolder(OrderFolder::Ending::Plain);
    if (!folder)
        return false;

    listNames();
    List1.setCurrentIndex(0);
    PrintPacker packer(m_state, m_platform.files, *folder, OrderTail::shortWidth);
    {
        EditedPrints prints(m_state, m_platform.files, List1.items(), m_paper);
        if (!forEachPicture([&](int i) { preparePicture(i, packer, prints); }))
            return false;
    }

    setStage(Stage::Closing);
    countOrder();
    if (!buildOrderSheet())
        return false;
    setStage(Stage::Closing);
    return writeLog(*folder, OrderLog::Layout::Edited);
}

void B3::listNames() {
    List2.clear();
    for (const QString& item : List1.items())
        List2.append(LeafName(item));
}

void B3::preparePicture(int index, PrintPacker& packer, EditedPrints& prints) {
    List2.setCurrentIndex(index);
    const BasketLine line = BasketLine::split(List1.item(index), LineForm::Full);
    packer.beginStep();
    if (!line.hasUsableName())
        return;
    Label4Picture.text = line.path.leaf();
    Q_EMIT changed();
    if (pack(packer, {index, line.code, line.path}, [&] { return renderPicture(line, prints); }))
        saveThumbnail(line, packer.scratch());
    packer.removeScratch();
}

Result<QByteArray> B3::renderPicture(const BasketLine& line, EditedPrints& prints) {
    EditedPrintResult made = prints.next([this] { m_platform.pump.pump(); });
    if (made.toneCopy) {
        if (const Result<void> kept = keepToneCopy(line, *made.toneCopy); !kept) {
            tellWriteFailure(kept.failure());
            return kept.failure();
        }
    }
    return made.jpeg;
}

// The copy of a corrected picture is looked for among the red-eye copies too, under the name of the copy itself.
Result<void> B3::keepToneCopy(const BasketLine& line, NewContent& copy) {
    EditFields edit;
    UnpackEditState(line.editState, edit);
    if (Result<void> kept = copy.commit(NewContent::Durability::Passing); !kept)
        return kept;
    if (edit.RedMarker != EditRecord::corrected)
        return {};
    const DrivePath path = WorkspacePaths::toneCopy(m_state);
    return m_platform.files.copyFile(path, WorkspacePaths::corrected(m_state, path));
}

// Two pictures of one name and one number of copies share a thumbnail, and the sheet then shows the later one.
void B3::saveThumbnail(const BasketLine& line, const DrivePath& scratch) {
    const std::optional<HostPath> source = m_platform.files.drives().toHost(scratch);
    const DrivePath path = m_jobFolder / (line.copiesField() + u'~' + PrintBaseName(line.path) + u".bmp"_s);
    const std::optional<HostPath> target = m_platform.files.drives().toHost(path);
    const Result<PictureSize> size =
        source ? readPictureSize(*source) : Failure{Failure::Kind::NotFound, scratch.text()};
    if (!size || !target)
        return;
    const auto height = static_cast<int>(RoundHalfEven(static_cast<double>(previewWidth) * size->height / size->width));
    const Result<Bitmap> preview = loadPictureScaled(*source, {previewWidth, std::max(1, height)});
    if (!preview)
        return;
    Picture3 = *preview;
    Q_EMIT changed();
    NewContent thumbnail(*target, path.text());
    appendBmp(Picture3, thumbnail, [] { return false; });
    static_cast<void>(thumbnail.commit(NewContent::Durability::Passing)); // its cell of the sheet stays empty
}

bool B3::buildOrderSheet() {
    countTotal();
    List1.setCurrentIndex(0);
    OrderSheet sheet(SheetKind::Edited, orderSheetSize(SheetKind::Edited, List1.count()),
                     orderSheetBackground(SheetKind::Edited, m_state));
    sheet.drawLines(editedSheetLines(m_state, m_platform.clock.now()));
    std::vector<SheetCell> cells;
    FileList File1(m_platform.files, u"*.bmp"_s);
    File1.setFolder(m_jobFolder);
    for (const QString& name : File1.names()) {
        // Twice the last four characters: of the ending and of the name itself.
        const QString caption = name.left(std::max<qsizetype>(0, name.size() - 8));
        cells.push_back({m_platform.files.drives().toHost(m_jobFolder / name), caption});
    }
    setStage(Stage::Sheet);
    sheet.drawContactSheet(cells, [&](int i) {
        setStage(Stage::Sheet, i + 1);
        return yield();
    });
    if (m_chain.hasEnded())
        return false;
    Picture5Image = sheet.bitmap();
    Picture5.visible = true;
    m_chain.load<gdisave>().saveOrderSheet(Picture5Image);
    return true;
}

void B3::setPreparing(bool on) {
    Command5.enabled = !on;
    Command5.visible = !on;
    PreparationPage::setPreparing(on);
}

} // namespace lumora
