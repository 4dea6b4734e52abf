#include "assembly/PreparationPage.h"

#include "order/LeftOutPictures.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

PreparationPage::PreparationPage(PageId id, SessionState& state, const Platform& platform, PageChain& chain,
                                 LeftOutControls& shown)
    : Page(id)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_leftOut(id, state, chain, shown) {}

bool PreparationPage::takeLines() {
    shared().List1.append(std::exchange(m_state.handOver.lines, {}));
    return std::exchange(m_state.handOver.pressStart, false);
}

void PreparationPage::counted() {
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

void PreparationPage::packing(int position) {
    shared().List1.setCurrentIndex(position - 1);
    setStage(Stage::Pictures, position);
}

void PreparationPage::inWork(const DrivePath& picture) {
    shared().Label4Picture.text = picture.leaf();
    Q_EMIT changed();
}

void PreparationPage::notPrepared(const DrivePath& picture) {
    shared().List4fail.append(picture.text());
    showProgress();
    Q_EMIT changed();
}

bool PreparationPage::sheetDrawn(const Bitmap& sheet) {
    shared().Picture5Image = sheet;
    shared().Picture5.visible = true;
    return true;
}

void PreparationPage::handOver(Outcome toSender) {
    const Outcome prepared = m_state.TachanaMekomit ? Outcome::KeptAtStation : toSender;
    const bool staysHere = prepared == Outcome::KeptAtStation || prepared == Outcome::PreparedForLater;
    if (staysHere && m_leftOut.isDue()) {
        m_toSender = toSender;
        m_leftOut.open();
        Q_EMIT changed();
        return;
    }
    m_handedOver = true;
    m_state.transfer.SugMishloah = Sending::NewOrder;
    const bool goesOn = m_chain.canFollow(id(), prepared);
    if (!goesOn)
        tell(u"ההזמנה מוכנה, אך הדף הבא אינו קיים בגרסה זו."_s,
             u"The order is ready, but this version has no page to go on with it."_s,
             m_state.transfer.OrderFolder.text());
    if (!goesOn || prepared == Outcome::KeptAtStation)
        m_state.handOver.kept = {m_state.MisparHazmana,
                                 prepared == Outcome::KeptAtStation ? m_state.transfer.leftOut.size() : 0};
    if (!m_chain.follow(id(), prepared))
        m_chain.unload(id());
}

Bitmap PreparationPage::smallLeftOut(int index, int cell) const {
    return SmallLeftOut(m_state, m_platform.files, index, cell);
}

void PreparationPage::askWithoutPrints() {
    m_leftOut.open(LeftOutBox::Order::WithoutPrints);
    Q_EMIT changed();
}

void PreparationPage::goOnWithout() {
    if (!m_leftOut.isOpen() || !shared().leftOut.Command4Bli.visible)
        return;
    m_leftOut.goOnWithout();
    handOver(m_toSender);
}

void PreparationPage::goBack() {
    if (m_leftOut.goBack())
        TakeOrderBack(m_state, m_platform);
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
