#include "assembly/PreparationPage.h"

#include "order/BasketLine.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

PreparationPage::PreparationPage(PageId id, SessionState& state, const Platform& platform, PageChain& chain)
    : Page(id)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain) {}

bool PreparationPage::takeLines() {
    shared().List1.append(std::exchange(m_state.handOver.lines, {}));
    return std::exchange(m_state.handOver.pressStart, false);
}

void PreparationPage::countTotal() {
    m_state.shemot.TotalPics = sumOfCopies(controls().List1.items(), CopiesIn::BasketLines);
    shared().Label5.text = QString::number(m_state.shemot.TotalPics);
}

bool PreparationPage::somethingChosen() {
    if (!controls().List1.isEmpty())
        return true;
    setStage(Stage::Waiting);
    tell(u"לא נבחרו תמונות"_s, u"No pictures were chosen"_s);
    return false;
}

void PreparationPage::setPreparing(bool on) {
    m_preparing = on;
    Q_EMIT changed();
}

void PreparationPage::setStage(Stage stage, int position) {
    m_stage = stage;
    m_position = position;
    m_count = controls().List1.count();
    if (stage != Stage::Pictures)
        shared().Label4Picture.text.clear();
    showProgress();
    Q_EMIT changed();
}

double PreparationPage::share() const {
    return m_count > 0 ? static_cast<double>(m_position) / m_count : 0;
}

void PreparationPage::addFailed(const DrivePath& path) {
    shared().List4fail.append(path.text());
    showProgress();
    Q_EMIT changed();
}

std::optional<OrderFolder> PreparationPage::claimFolder(OrderFolder::Ending ending) {
    const Files& files = m_platform.files;
    const OrderFolder same = OrderFolder::inPreparation(m_state, ending);
    if (m_claimed && m_claimed->path() == same.path()) {
        for (const QString& name : files.names(same.path(), u"*.jpp"_s))
            static_cast<void>(files.removeFile(same.filePath(name)));
        return same;
    }
    const Result<OrderFolder> claimed = claimOrderFolder(m_state, files, ending);
    if (!claimed) {
        tell(u"לא ניתן ליצור את תיקיית ההזמנה. פנה מקום בדיסק או תקן את ההרשאות ונסה שוב."_s,
             u"The order's folder can't be made. Free some space or mend the rights, then try again."_s,
             claimed.failure().message);
        return std::nullopt;
    }
    m_claimed = *claimed;
    m_state.transfer.OrderFolder = claimed->path();
    return m_claimed;
}

bool PreparationPage::forEachPicture(const std::function<void(int)>& step) {
    for (int i = 0; i < controls().List1.count(); ++i) {
        shared().List1.setCurrentIndex(i);
        setStage(Stage::Pictures, i + 1);
        step(i);
        if (!yield())
            return false;
    }
    if (m_writeFailures > 1)
        tell(u"%1 קבצים של ההזמנה לא נכתבו."_s.arg(m_writeFailures),
             u"%1 files of the order could not be written."_s.arg(m_writeFailures));
    return true;
}

bool PreparationPage::pack(PrintPacker& packer, const PrintPacker::Line& line,
                           const std::function<Result<QByteArray>()>& picture) {
    const PrintPacker::Outcome outcome = packer.pack(line, picture);
    if (!outcome.packed)
        addFailed(line.path);
    if (outcome.writeFailure)
        tellWriteFailure(*outcome.writeFailure);
    return outcome.packed;
}

// On a full disk every picture fails in the same way: the first is told at once, the others in one sum at the end.
void PreparationPage::tellWriteFailure(const Failure& failure) {
    if (m_writeFailures++ == 0)
        tell(u"קובץ של ההזמנה לא נכתב. מה שכבר הוכן נשמר."_s,
             u"A file of the order could not be written. What was prepared so far is kept."_s, failure.message);
}

void PreparationPage::countOrder() {
    if (const Result<void> counted = Workspace(m_state, m_platform.files).writeCounter(); !counted)
        tell(u"מספר ההזמנה הבאה לא נשמר. ההזמנה ממשיכה כרגיל."_s,
             u"The number of the next order could not be stored. This order goes on."_s, counted.failure().message);
}

bool PreparationPage::writeLog(const OrderFolder& folder, OrderLog::Layout layout) {
    const QByteArray log =
        OrderLog::of(m_state, layout, controls().List1.items(), controls().List4fail.items(), m_platform.clock.now())
            .write();
    if (const Result<void> logged = m_platform.files.writeWhole(folder.logPath(), log); !logged) {
        tell(u"לא ניתן לכתוב את פרטי ההזמנה, ולכן ההזמנה לא נשלחה. התמונות שהוכנו נשמרו. תקן ונסה שוב."_s,
             u"The order's details can't be written, so the order was not sent. What was prepared is kept. "
             u"Put it right, then try again."_s,
             logged.failure().message);
        return false;
    }
    m_state.transfer.OrderLogBase = folder.logBase();
    return true;
}

void PreparationPage::handOver(Outcome prepared) {
    m_handedOver = true;
    m_state.transfer.SugMishloah = Sending::NewOrder;
    const bool goesOn = m_chain.canFollow(id(), prepared);
    if (!goesOn)
        tell(u"ההזמנה מוכנה, אך הדף הבא אינו קיים בגרסה זו."_s,
             u"The order is ready, but this version has no page to go on with it."_s,
             m_state.transfer.OrderFolder.text());
    if (!goesOn || prepared == Outcome::KeptAtStation)
        m_state.handOver.notice =
            m_state.wording(u"הזמנה מספר %1 מוכנה ונשמרה בתחנה.", u"Order number %1 is ready and kept at this station.")
                .arg(m_state.MisparHazmana);
    if (!m_chain.follow(id(), prepared))
        m_chain.unload(id());
}

void PreparationPage::leaveProgram() {
    m_chain.endProgram();
    m_chain.unload(id());
}

void PreparationPage::tell(const QString& hebrew, const QString& english, const QString& reason) {
    const QString text = m_state.wording(hebrew, english);
    m_platform.dialogs.message(reason.isEmpty() ? text : text + u'\n' + reason);
}

bool PreparationPage::yield() {
    m_platform.pump.pump();
    return !m_chain.hasEnded();
}

} // namespace lumora
