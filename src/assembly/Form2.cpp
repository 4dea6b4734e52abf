#include "assembly/Form2.h"

#include "assembly/OrderFolder.h"
#include "assembly/OrderLog.h"
#include "assembly/OrderSheet.h"
#include "assembly/OrderTail.h"
#include "assembly/PaperResize.h"
#include "assembly/PrintFile.h"
#include "assembly/PrintFileName.h"
#include "assembly/WorkAhead.h"
#include "common/DrivePathText.h"
#include "common/FixedText.h"
#include "platform/Dialogs.h"
#include "platform/Files.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <QTimer>

#include <utility>
#include <vector>

namespace lumora {
namespace {

constexpr int codeWidth = 9; // of the print code in front of a path
constexpr qsizetype shortestFileName = 5;

QString codeOf(const QString& item) {
    return item.left(codeWidth);
}

QString pathOf(const QString& item) {
    return item.mid(codeWidth);
}

bool hasUsableName(const QString& item) {
    return LeafName(item).size() >= shortestFileName;
}

// Either spelling of the camera and no other: what else there is was picked with a whole folder.
bool isJpegItem(const QString& item) {
    const QString ending = item.right(3);
    return ending == QLatin1String("JPG") || ending == QLatin1String("jpg");
}

} // namespace

// What the steps of one preparation share. The prints are scaled ahead of the step that packs them; only a source path
// goes into that work and only bytes come out.
class Form2::Steps {
public:
    Steps(const SessionState& state, const Files& files, const QStringList& items)
        : folder(state, OrderFolder::Ending::BySession)
        , tail(OrderTail::of(state))
        , shape(PrintFileShape::of(state.profile))
        , scratch(WorkspacePaths::scratchPicture(state))
        , m_files(files)
        , m_paper(PaperSize::parse(state.shemot.ppr))
        , m_sources(state.DchisaAmoka == 1 ? QStringList() : sourcesToScale(items))
        , m_prints(static_cast<int>(m_sources.size()), [this](int i) { return scaling(m_sources[i]); }) {}

    // The print of the next picture that is to be scaled.
    template <class Waiting>
    Result<QByteArray> nextPrint(Waiting whileWaiting) {
        return m_prints.take(whileWaiting);
    }

    static bool isScaled(const QString& item) { return hasUsableName(item) && !HasQuestionMark(item); }

    const OrderFolder folder;
    const OrderTail tail;
    const PrintFileShape shape;
    const QString scratch;

private:
    using Prints = WorkAhead<Result<QByteArray>>;

    static QStringList sourcesToScale(const QStringList& items) {
        QStringList sources;
        for (const QString& item : items) {
            if (isScaled(item))
                sources += pathOf(item);
        }
        return sources;
    }

    Prints::Work scaling(const QString& path) const {
        const std::optional<HostPath> source = m_files.drives().toHost(path);
        return [source, paper = m_paper]() -> Result<QByteArray> {
            if (!source || !paper)
                return Failure{Failure::Kind::NotFound, {}};
            return resizeToPaper(*source, *paper);
        };
    }

    const Files& m_files;
    const std::optional<PaperSize> m_paper;
    const QStringList m_sources;
    Prints m_prints;
};

Form2::Form2(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::Form2)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain) {}

Form2::~Form2() = default;

void Form2::load() {
    List1.append(std::exchange(m_state.handOver.lines, {}));
    if (std::exchange(m_state.handOver.pressStart, false))
        QTimer::singleShot(0, this, &Form2::Command3_Click);
    Command6.visible = false;
    Command4.visible = m_state.Optint == 10;
    Picture5.visible = false;
    Command5.visible = Command8.visible = false;
    setStage(Stage::Waiting);
}

void Form2::setTexts() {
    const auto say = [this](const char16_t* hebrew, const char16_t* english) {
        return m_state.wording(QString::fromUtf16(hebrew), QString::fromUtf16(english));
    };
    Label1.text = say(u"מארז תמונות", u"Preparing your pictures");
    Label6.text = say(u"אם בכוונתך למחוק את התמונות מהמחשב או מהמצלמה או מכל מדיה אחרת",
                      u"If you mean to delete the pictures from the computer, the camera or any other medium,");
    Label10.text = say(u"אל תמחק אותם עד אשר תקבל את התמונות מודפסות",
                       u"do not delete them until you hold the printed pictures in your hands");
    Command1.text = say(u"הסר תמונה זו מהרשימה", u"Remove this picture from the list");
    Command3.text = say(u"הכן את ההזמנה", u"Prepare the order");
    Command4.text = say(u"הצג דף אלבום", u"Show the album sheet");
    Command5.text = say(u"צייר שוב את התמונות", u"Draw the pictures again");
    Command6.text = say(u"הכן את ההזמנה עכשיו", u"Prepare the order now");
    Command7.text = say(u"EXIT  יציאה", u"EXIT");
    Command8.text = say(u"החזר את הדף למקומו", u"Put the sheet back");
    Picture5.text = say(u"דף ההזמנה", u"Order sheet");
    showProgress();
    Q_EMIT changed();
}

void Form2::Command3_Click() {
    if (preparing || m_handedOver)
        return;
    setPreparing(true);
    setStage(Stage::Checking);
    KeepOnlyJpeg();
    const bool goOn = yield();
    setPreparing(false);
    if (goOn)
        Command6_Click();
}

void Form2::Command6_Click() {
    if (preparing || m_handedOver)
        return;
    const auto nothingChosen = [this] {
        if (!List1.isEmpty())
            return false;
        setStage(Stage::Waiting);
        tell(QStringLiteral("לא נבחרו תמונות"), QStringLiteral("No pictures were chosen"), {});
        return true;
    };
    List4fail.clear();
    if (nothingChosen())
        return;
    m_state.transfer.MailFlag = 0;
    m_runningNumber = 1;
    m_writeFailures = 0;
    KeepOnlyJpeg();
    if (nothingChosen())
        return;
    List1.setCurrentIndex(0);

    setPreparing(true);
    const bool made = prepareOrder();
    if (m_chain.hasEnded())
        return;
    setPreparing(false);
    setStage(made ? Stage::Done : Stage::Waiting);
    if (made)
        handOver();
}

void Form2::Command1_Click() {
    if (preparing || List1.currentIndex() < 0)
        return;
    List1.removeAt(List1.currentIndex());
    CountTotalPics();
    Q_EMIT changed();
}

void Form2::Command7_Click() {
    m_chain.endProgram();
    m_chain.unload(PageId::Form2);
}

void Form2::Command4_Click() {
    if (preparing)
        return;
    setPreparing(true);
    CountTotalPics();
    const bool goOn = drawSheet(true);
    setPreparing(false);
    if (goOn)
        setStage(Stage::Waiting);
}

void Form2::Command5_Click() {
    if (preparing)
        return;
    setPreparing(true);
    const bool goOn = drawSheet(m_state.Optint == 10);
    setPreparing(false);
    if (goOn)
        setStage(Stage::Waiting);
}

void Form2::Command8_Click() {
    Picture5Position = {5, 5};
    Q_EMIT changed();
}

void Form2::List1_Click(int index) {
    if (preparing)
        return;
    List1.setCurrentIndex(index);
    Q_EMIT changed();
}

void Form2::Picture5_MouseDown(QPoint at) {
    m_dragFrom = at - Picture5Position;
}

void Form2::Picture5_MouseMove(QPoint at) {
    if (!m_dragFrom)
        return;
    Picture5Position = at - *m_dragFrom;
    Q_EMIT changed();
}

void Form2::Picture5_MouseUp() {
    m_dragFrom.reset();
}

// The walk steps on after a removal, so that the item behind a removed one is not looked at until the next walk: the
// lab knows the lists that come of it. Start walks twice.
void Form2::KeepOnlyJpeg() {
    for (int i = 0; i < List1.count(); ++i) {
        if (isJpegItem(List1.item(i)))
            continue;
        List4removed.append(pathOf(List1.item(i)));
        List1.removeAt(i);
    }
    showProgress();
    Q_EMIT changed();
}

void Form2::CountTotalPics() {
    double total = 0;
    for (const QString& item : List1.items()) {
        if (item.right(3) != QLatin1String("txt"))
            total += Val(item.left(2));
    }
    m_state.shemot.TotalPics = HoldIn16Bits(total);
    Label5.text = QString::number(m_state.shemot.TotalPics);
}

bool Form2::prepareOrder() {
    // Before the sheet is drawn: it shows the number.
    claimOrderNumber(m_state, m_platform.files, OrderFolder::Ending::BySession);
    CountTotalPics();
    if (!drawSheet(m_state.Optint == 10))
        return false;

    const OrderFolder folder(m_state, OrderFolder::Ending::BySession);
    m_state.transfer.OrderFolder = folder.path();
    if (const Result<void> made = makeOrderFolder(m_state, m_platform.files, folder); !made) {
        tell(QStringLiteral("לא ניתן ליצור את תיקיית ההזמנה. פנה מקום בדיסק או תקן את ההרשאות ונסה שוב."),
             QStringLiteral("The order's folder can't be made. Free some space or mend the rights, then try again."),
             made.failure().message);
        return false;
    }
    const QString sheetPath = folder.sheetPath(QStringLiteral(".jpp"));
    const Result<QByteArray> sheet = encodeJpeg(Picture5Image, printQuality);
    const Result<void> saved = sheet ? m_platform.files.writeWhole(sheetPath, *sheet) : Result<void>(sheet.failure());
    if (!saved)
        tellWriteFailure(saved.failure());

    Steps steps(m_state, m_platform.files, List1.items());
    for (int i = 0; i < List1.count(); ++i) {
        List1.setCurrentIndex(i);
        setStage(Stage::Pictures, i + 1);
        PackOnePicture(i, steps);
        if (!yield())
            return false;
    }
    if (m_writeFailures > 1)
        tell(QStringLiteral("%1 קבצים של ההזמנה לא נכתבו.").arg(m_writeFailures),
             QStringLiteral("%1 files of the order could not be written.").arg(m_writeFailures), {});

    setStage(Stage::Closing);
    if (const Result<void> counted = Workspace(m_state, m_platform.files).writeCounter(); !counted)
        tell(QStringLiteral("מספר ההזמנה הבאה לא נשמר. ההזמנה ממשיכה כרגיל."),
             QStringLiteral("The number of the next order could not be stored. This order goes on."),
             counted.failure().message);
    const QByteArray log = plainOrderLog(m_state, List1.items(), List4fail.items(), m_platform.clock.now());
    if (const Result<void> logged = m_platform.files.writeWhole(folder.logPath(), log); !logged) {
        tell(QStringLiteral("לא ניתן לכתוב את פרטי ההזמנה, ולכן ההזמנה לא נשלחה. התמונות שהוכנו נשמרו. תקן ונסה שוב."),
             QStringLiteral(
                 "The order's details can't be written, so the order was not sent. What was prepared is kept. "
                 "Put it right, then try again."),
             logged.failure().message);
        return false;
    }
    m_state.transfer.OrderLogBase = folder.logBase();
    return true;
}

void Form2::PackOnePicture(int index, Steps& steps) {
    const Files& files = m_platform.files;
    const QString item = List1.item(index);
    const QString path = pathOf(item);
    const Result<void> folderThere = makeOrderFolder(m_state, files, steps.folder);
    if (!hasUsableName(item))
        return;
    // What the selection page leaves of a name that the code page can't carry.
    if (HasQuestionMark(item)) {
        addFailed(path);
        return;
    }
    Label4Picture.text = LeafName(path);
    Q_EMIT changed();

    // The picture before goes first, or a picture that can't be read would be printed as that one.
    Result<void> step = files.fileExists(steps.scratch) ? files.removeFile(steps.scratch) : Result<void>();
    const Result<QByteArray> picture =
        m_state.DchisaAmoka == 1 ? files.read(path) : steps.nextPrint([this] { m_platform.pump.pump(); });
    if (step && picture)
        step = files.writeWhole(steps.scratch, *picture);
    // What can't be read is the picture's own fault and stands in the list; the order's files are another matter.
    if (!step || !picture) {
        addFailed(path);
        if (!step)
            tellWriteFailure(step.failure());
        return;
    }

    const QString base = PrintBaseName(path);
    m_manifestLine = QString::number(picture->size()) + QStringLiteral(">>") + codeOf(item) +
                     QString::number(m_runningNumber) + u'_' + base + QStringLiteral(".jpg\r\n");
    const Result<QByteArray> packed = folderThere
                                          ? packPrintFile(*picture, steps.shape, steps.tail.form(m_state.SugTzad, base))
                                          : Result<QByteArray>(folderThere.failure());
    const QString name = PrintFileName{codeOf(item), index, m_state.Optint, base}.text();
    const Result<void> written =
        packed ? files.writeWhole(steps.folder.printFilePath(name), *packed) : Result<void>(packed.failure());
    if (!written) {
        addFailed(path);
        tellWriteFailure(written.failure());
    }
}

void Form2::handOver() {
    m_handedOver = true;
    m_state.transfer.SugMishloah = 0;
    const QString prepared = m_state
                                 .wording(QStringLiteral("הזמנה מספר %1 מוכנה ונשמרה בתחנה."),
                                          QStringLiteral("Order number %1 is ready and kept at this station."))
                                 .arg(m_state.MisparHazmana);
    if (m_state.TachanaMekomit) {
        m_state.handOver.notice = prepared;
        m_chain.unload(PageId::Form2);
        return;
    }
    const bool toFinishedOrders = m_state.TmunatPaar == 1 && m_state.Optint == 3;
    const PageId next = toFinishedOrders ? PageId::MoogMeret : PageId::FtpFrm;
    if (!m_chain.isRegistered(next)) {
        tell(QStringLiteral("ההזמנה מוכנה, אך הדף הבא אינו קיים בגרסה זו."),
             QStringLiteral("The order is ready, but this version has no page to go on with it."),
             m_state.transfer.OrderFolder);
        m_state.handOver.notice = prepared;
    } else {
        if (toFinishedOrders)
            m_state.handOver.lines = {m_state.transfer.OrderLogBase};
        m_chain.show(next);
    }
    m_chain.unload(PageId::Form2);
}

bool Form2::drawSheet(bool album) {
    const SheetKind kind = album ? SheetKind::Album : SheetKind::Plain;
    OrderSheet sheet(kind, orderSheetSize(kind, List1.count()), orderSheetBackground(kind, m_state));
    const QDateTime now = m_platform.clock.now();
    sheet.drawLines(album ? albumSheetLines(m_state, now) : plainSheetLines(m_state, now));
    std::vector<SheetCell> cells;
    for (const QString& item : List1.items())
        cells.push_back({m_platform.files.drives().toHost(pathOf(item)),
                         item.left(2) + u'_' + RightPart(NameWithoutEnding(item), 9)});
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
    preparing = on;
    for (Caption* button : {&Command1, &Command3, &Command4, &Command5, &Command6})
        button->enabled = !on;
    Q_EMIT changed();
}

void Form2::setStage(Stage stage, int position) {
    m_stage = stage;
    progressValue = position;
    progressMaximum = List1.count();
    if (stage != Stage::Pictures)
        Label4Picture.text.clear();
    showProgress();
    Q_EMIT changed();
}

void Form2::showProgress() {
    const QString position = QString::number(progressValue);
    const QString count = QString::number(progressMaximum);
    Label16.text = count;
    Label17.text = m_stage == Stage::Pictures ? position : QString();
    switch (m_stage) {
    case Stage::Waiting:
        Label4Progress.text =
            m_state.wording(QStringLiteral("ההזמנה עוד לא הוכנה"), QStringLiteral("The order is not prepared yet"));
        break;
    case Stage::Checking:
        Label4Progress.text =
            m_state.wording(QStringLiteral("בודק את רשימת התמונות"), QStringLiteral("Checking the list of pictures"));
        break;
    case Stage::Sheet:
        Label4Progress.text = m_state
                                  .wording(QStringLiteral("מצייר את דף ההזמנה: תמונה %1 מתוך %2"),
                                           QStringLiteral("Drawing the order sheet: picture %1 of %2"))
                                  .arg(position, count);
        break;
    case Stage::Pictures:
        Label4Progress.text = m_state
                                  .wording(QStringLiteral("מכין תמונה מספר %1 מתוך %2 תמונות שבחרת"),
                                           QStringLiteral("Preparing picture %1 of the %2 that you chose"))
                                  .arg(position, count);
        break;
    case Stage::Closing:
        Label4Progress.text =
            m_state.wording(QStringLiteral("רושם את פרטי ההזמנה"), QStringLiteral("Writing down the order's details"));
        break;
    case Stage::Done:
        Label4Progress.text = m_state.wording(QStringLiteral("ההזמנה מוכנה"), QStringLiteral("The order is ready"));
        break;
    }
    Label4fail.visible = !List4fail.isEmpty();
    Label4fail.text = m_state
                          .wording(QStringLiteral("%1 תמונות לא ניתן היה להכין:"),
                                   QStringLiteral("Pictures that could not be prepared: %1"))
                          .arg(List4fail.count());
    Label4removed.visible = !List4removed.isEmpty();
    Label4removed.text = m_state
                             .wording(QStringLiteral("%1 קבצים שאינם תמונות jpg הוסרו מהרשימה:"),
                                      QStringLiteral("Files that are no jpg pictures and were left out: %1"))
                             .arg(List4removed.count());
}

void Form2::addFailed(const QString& path) {
    List4fail.append(path);
    showProgress();
    Q_EMIT changed();
}

// On a full disk every picture fails in the same way: the first is told at once, the others in one sum at the end.
void Form2::tellWriteFailure(const Failure& failure) {
    if (m_writeFailures++ == 0)
        tell(QStringLiteral("קובץ של ההזמנה לא נכתב. מה שכבר הוכן נשמר."),
             QStringLiteral("A file of the order could not be written. What was prepared so far is kept."),
             failure.message);
}

void Form2::tell(const QString& hebrew, const QString& english, const QString& reason) {
    const QString text = m_state.wording(hebrew, english);
    m_platform.dialogs.message(reason.isEmpty() ? text : text + u'\n' + reason);
}

// Lets the page paint and a click through. False when that click ended the program.
bool Form2::yield() {
    m_platform.pump.pump();
    return !m_chain.hasEnded();
}

} // namespace lumora
