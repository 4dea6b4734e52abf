#include "assembly/edited/B3.h"

#include "common/DrivePath.h"
#include "editing/editor/gdisave.h"
#include "session/CaptionTexts.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int shownForAWhile = 2000; // milliseconds

} // namespace

B3::B3(SessionState& state, const Platform& platform, PageChain& chain)
    : PreparationPage(PageId::B3, state, platform, chain, leftOut)
    , Timer2(shownForAWhile, [this] { prepare(); })
    , m_preparation(state, platform, *this) {}

B3::~B3() = default;

void B3::load() {
    m_preparation.takeHandOver();
    takeLines();
    for (const QString& item : List1.items())
        List2.append(LeafName(item));
    m_paper = PaperSize::ofText(m_state.shemot.ppr);
    setStage(Stage::Waiting);
    Timer2.start();
}

void B3::setTexts() {
    setCaptions(m_state, {
                             {Label4Title, u"הכנת תמונות למשלוח", u"Preparing your pictures"},
                             {Command1, u"הסר תמונה זו מהרשימה", u"Remove this picture from the list"},
                             {Command5, u"הכן את ההזמנה", u"Prepare the order"},
                             // One button for each language.
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
    List4fail.clear();
    m_preparation.makeJobFolder();
    const bool made = yield() && somethingChosen() && m_preparation.prepare(List1.items(), m_paper);
    if (m_chain.hasEnded())
        return;
    setPreparing(false);
    setStage(made ? Stage::Done : Stage::Waiting);
    if (m_preparation.endedWithoutPrints())
        askWithoutPrints();
    if (made)
        handOver(m_state.transfer.SugSheliach == Sender::Http ? Outcome::PreparedForHttp : Outcome::PreparedForFtp);
}

void B3::stopAndLeave() {
    Timer2.stop();
    leaveProgram();
}

void B3::packing(int position) {
    List2.setCurrentIndex(position - 1);
    PreparationPage::packing(position);
}

void B3::drawingSheet(int position) {
    if (position == 0)
        List1.setCurrentIndex(0);
    PreparationPage::drawingSheet(position);
}

void B3::printed(const Bitmap& small) {
    Picture3 = small;
    Q_EMIT changed();
}

bool B3::sheetDrawn(const Bitmap& sheet) {
    PreparationPage::sheetDrawn(sheet);
    return m_chain.load<gdisave>().saveOrderSheet(Picture5Image);
}

void B3::setPreparing(bool on) {
    Command5.enabled = !on;
    Command5.visible = !on;
    PreparationPage::setPreparing(on);
}

} // namespace lumora
