#include "assembly/plain/Form2.h"

#include "assembly/PaperResize.h"
#include "assembly/WorkAhead.h"
#include "common/FixedText.h"
#include "order/BasketLine.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/CaptionTexts.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <QTimer>

#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

BasketLine split(const QString& line) {
    return BasketLine::split(line, LineForm::Short);
}

// Either spelling of the camera and no other: what else there is was picked with a whole folder.
bool isJpegItem(const QString& item) {
    const QString ending = item.right(3);
    return ending == u"JPG" || ending == u"jpg";
}

} // namespace

// The prints of the order, scaled ahead of the step that packs them; only a source path goes into that work and only
// bytes come out.
class Form2::Prints {
public:
    Prints(const SessionState& state, const Files& files, const QStringList& items)
        : m_files(files)
        , m_paper(PaperSize::ofText(state.shemot.ppr))
        , m_sources(state.DchisaAmoka == 1 ? QList<DrivePath>() : sourcesToScale(items))
        , m_prints(static_cast<int>(m_sources.size()), [this](int i) { return scaling(m_sources[i]); }) {}

    // The print of the next picture that is to be scaled.
    template <class Waiting>
    Result<QByteArray> next(Waiting whileWaiting) {
        return m_prints.take(whileWaiting);
    }

private:
    using Ahead = WorkAhead<Result<QByteArray>>;

    static QList<DrivePath> sourcesToScale(const QStringList& items) {
        QList<DrivePath> sources;
        for (const QString& item : items) {
            const BasketLine picture = split(item);
            if (picture.hasUsableName() && !HasQuestionMark(item))
                sources += picture.path;
        }
        return sources;
    }

    Ahead::Work scaling(const DrivePath& path) const {
        const std::optional<HostPath> source = m_files.drives().toHost(path);
        return [source, paper = m_paper]() -> Result<QByteArray> {
            if (!source || !paper)
                return Failure{Failure::Kind::NotFound, {}};
            return resizeToPaper(*source, *paper);
        };
    }

    const Files& m_files;
    const std::optional<PaperSize> m_paper;
    const QList<DrivePath> m_sources;
    Ahead m_prints;
};

Form2::Form2(SessionState& state, const Platform& platform, PageChain& chain)
    : PreparationPage(PageId::Form2, state, platform, chain) {}

Form2::~Form2() = default;

void Form2::load() {
    if (takeLines())
        QTimer::singleShot(0, this, &Form2::start);
    Command4.visible = isAlbum();
    setStage(Stage::Waiting);
}

void Form2::setTexts() {
    setCaptions(m_state, {
                             {Label1, u"מארז תמונות", u"Preparing your pictures"},
                             {Command1, u"הסר תמונה זו מהרשימה", u"Remove this picture from the list"},
                             {Command3, u"הכן את ההזמנה", u"Prepare the order"},
                             {Command4, u"הצג דף אלבום", u"Show the album sheet"},
                             {Command5, u"צייר שוב את התמונות", u"Draw the pictures again"},
                             {Command6, u"הכן את ההזמנה עכשיו", u"Prepare the order now"},
                             {Command7, u"EXIT  יציאה", u"EXIT"},
                             {Command8, u"החזר את הדף למקומו", u"Put the sheet back"},
                             {Picture5, u"דף ההזמנה", u"Order sheet"},
                         });
    Label6.text = doNotDelete();
    Label10.text = untilPrinted();
    showProgress();
    Q_EMIT changed();
}

void Form2::start() {
    if (isPreparing() || handedOver())
        return;
    setPreparing(true);
    setStage(Stage::Checking);
    keepOnlyJpeg();
    const bool goOn = yield();
    setPreparing(false);
    if (goOn)
        prepare();
}

void Form2::prepare() {
    if (isPreparing() || handedOver())
        return;
    List4fail.clear();
    if (!somethingChosen())
        return;
    m_state.transfer.MailFlag = 0;
    m_writeFailures = 0;
    keepOnlyJpeg();
    if (!somethingChosen())
        return;
    List1.setCurrentIndex(0);

    setPreparing(true);
    const bool made = prepareOrder();
    if (m_chain.hasEnded())
        return;
    setPreparing(false);
    setStage(made ? Stage::Done : Stage::Waiting);
    if (!made)
        return;
    if (m_state.TachanaMekomit) {
        handOver(Outcome::KeptAtStation);
        return;
    }
    const bool toFinishedOrders = m_state.TmunatPaar == 1 && m_state.Optint == OrderKind::Sequence;
    if (toFinishedOrders && m_chain.canFollow(id(), Outcome::PreparedForLater))
        m_state.handOver.lines = {m_state.transfer.OrderLogBase.text()};
    handOver(toFinishedOrders ? Outcome::PreparedForLater : Outcome::PreparedForFtp);
}

void Form2::removeChosen() {
    if (isPreparing() || List1.currentIndex() < 0)
        return;
    List1.removeAt(List1.currentIndex());
    countTotal();
    Q_EMIT changed();
}

void Form2::choose(int index) {
    if (isPreparing())
        return;
    List1.setCurrentIndex(index);
    Q_EMIT changed();
}

// The walk steps on after a removal, so that the item behind a removed one is not looked at until the next walk: the
// lab knows the lists that come of it. Start walks twice.
void Form2::keepOnlyJpeg() {
    for (int i = 0; i < List1.count(); ++i) {
        if (isJpegItem(List1.item(i)))
            continue;
        List4removed.append(split(List1.item(i)).path.text());
        List1.removeAt(i);
    }
    showProgress();
    Q_EMIT changed();
}

bool Form2::prepareOrder() {
    // Before the sheet is drawn: it shows the number.
    const std::optional<OrderFolder> folder = claimFolder(OrderFolder::Ending::BySession);
    if (!folder)
        return false;
    countTotal();
    if (!drawSheet(isAlbum() ? SheetKind::Album : SheetKind::Plain))
        return false;

    const DrivePath sheetPath = folder->filePath(SheetName(m_state.MisparHazmana, m_state.shemot.ser, u".jpp"_s));
    const Result<QByteArray> sheet = encodeJpeg(Picture5Image, printQuality);
    const Result<void> saved = sheet ? m_platform.files.writeWhole(sheetPath, *sheet) : Result<void>(sheet.failure());
    if (!saved)
        tellWriteFailure(saved.failure());

    PrintPacker packer(m_state, m_platform.files, *folder, m_state.SugTzad);
    Prints prints(m_state, m_platform.files, List1.items());
    if (!forEachPicture([&](int i) { packPicture(i, packer, prints); }))
        return false;

    setStage(Stage::Closing);
    countOrder();
    return writeLog(*folder, isAlbum() ? OrderLog::Layout::Album : OrderLog::Layout::Plain);
}

void Form2::packPicture(int index, PrintPacker& packer, Prints& prints) {
    const BasketLine line = split(List1.item(index));
    packer.beginStep();
    if (!line.hasUsableName())
        return;
    // What the selection page leaves of a name that the code page can't carry.
    if (HasQuestionMark(List1.item(index))) {
        addFailed(line.path);
        return;
    }
    Label4Picture.text = line.path.leaf();
    Q_EMIT changed();
    pack(packer, {index, line.code, line.path}, [&] {
        return m_state.DchisaAmoka == 1 ? m_platform.files.read(line.path)
                                        : prints.next([this] { m_platform.pump.pump(); });
    });
}

bool Form2::isAlbum() const {
    return m_state.Optint == OrderKind::Album;
}

bool Form2::drawSheet(SheetKind kind) {
    OrderSheet sheet(kind, orderSheetSize(kind, List1.count()), orderSheetBackground(kind, m_state));
    const QDateTime now = m_platform.clock.now();
    sheet.drawLines(kind == SheetKind::Album ? albumSheetLines(m_state, now) : plainSheetLines(m_state, now));
    std::vector<SheetCell> cells;
    for (const QString& item : List1.items())
        cells.push_back({m_platform.files.drives().toHost(split(item).path),
                         split(item).copiesField() + u'_' + RightPart(split(item).path.stem(), 9)});
    setStage(Stage::Sheet);
    sheet.drawContactSheet(cells, [&](int i) {
        setStage(Stage::Sheet, i + 1);
        return yield();
    });
    Picture5Image = sheet.bitmap();
    Picture5.visible = true;
    Command5.visible = Command8.visible = true;
    return !m_chain.hasEnded();
}

void Form2::setPreparing(bool on) {
    for (Caption* button : {&Command1, &Command3, &Command4, &Command5, &Command6})
        button->enabled = !on;
    Command3.visible = !on;
    PreparationPage::setPreparing(on);
}

void Form2::showProgress() {
    PreparationPage::showProgress();
    Label4removed.visible = !List4removed.isEmpty();
    Label4removed.text = m_state
                             .wording(u"%1 קבצים שאינם תמונות jpg הוסרו מהרשימה:"_s,
                                      u"Files that are no jpg pictures and were left out: %1"_s)
                             .arg(List4removed.count());
}

} // namespace lumora
