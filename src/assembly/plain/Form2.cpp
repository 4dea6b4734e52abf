#include "assembly/plain/Form2.h"

#include "session/CaptionTexts.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <QTimer>

namespace lumora {

using namespace Qt::StringLiterals;

Form2::Form2(SessionState& state, const Platform& platform, PageChain& chain)
    : PreparationPage(PageId::Form2, state, platform, chain, leftOut)
    , m_preparation(state, platform, *this) {}

Form2::~Form2() = default;

void Form2::load() {
    m_preparation.takeHandOver();
    if (takeLines())
        QTimer::singleShot(0, this, &Form2::start);
    Command4.visible = m_preparation.isAlbum();
    setStage(Stage::Waiting);
}

void Form2::setTexts() {
    setCaptions(m_state, {
                             {Label1, u"מארז תמונות", u"Preparing your pictures"},
                             {Command1, u"הסר תמונה זו מהרשימה", u"Remove this picture"},
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
    keepOnlyJpeg();
    if (!somethingChosen()) {
        m_preparation.leaveOutAll();
        if (!List4removed.isEmpty())
            askWithoutPrints();
        return;
    }
    List1.setCurrentIndex(0);

    setPreparing(true);
    const bool made = m_preparation.prepare(List1.items());
    if (m_chain.hasEnded())
        return;
    setPreparing(false);
    setStage(made ? Stage::Done : Stage::Waiting);
    if (m_preparation.endedWithoutPrints())
        askWithoutPrints();
    if (!made)
        return;
    const bool toFinishedOrders = !m_state.TachanaMekomit && m_state.TmunatPaar == 1 &&
                                  m_state.Optint == OrderKind::Sequence &&
                                  !m_state.closedToCustomers(); // that page lists the orders of others
    if (toFinishedOrders && m_chain.canFollow(id(), Outcome::PreparedForLater))
        m_state.handOver.lines = {m_state.transfer.OrderLogBase.text()};
    handOver(toFinishedOrders ? Outcome::PreparedForLater : Outcome::PreparedForFtp);
}

void Form2::removeChosen() {
    if (isPreparing() || List1.currentIndex() < 0)
        return;
    List1.removeAt(List1.currentIndex());
    m_preparation.count(List1.items());
    Q_EMIT changed();
}

void Form2::choose(int index) {
    if (isPreparing())
        return;
    List1.setCurrentIndex(index);
    Q_EMIT changed();
}

// The basket of an order that goes on has been through this.
void Form2::keepOnlyJpeg() {
    if (!m_preparation.goesOn())
        m_preparation.keepOnlyJpeg(List1, List4removed);
    showProgress();
    Q_EMIT changed();
}

bool Form2::sheetDrawn(const Bitmap& sheet) {
    PreparationPage::sheetDrawn(sheet);
    Command5.visible = Command8.visible = true;
    return true;
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
                             .wording(u"%1 קבצים שסיומתם אינה jpg או JPG הוסרו מהרשימה:"_s,
                                      u"Files whose ending is not jpg or JPG were left out: %1"_s)
                             .arg(List4removed.count());
}

} // namespace lumora
