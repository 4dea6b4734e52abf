// The page of pictures: the checks at the end of choosing, the closing panel, the hand-over.
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "selection/FinishRule.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/lab/MailDomains.h"

namespace lumora {

void kyoskNew::Image7_Click() {
    openBranches();
    Command3_Click();
}

void kyoskNew::openBranches() {
    Pic4snifim.visible = m_state.coupon.HaKoopon == 1;
    for (std::size_t branch = 0; branch < Command4Snif.size(); ++branch)
        Command4Snif[branch].text = m_state.profile.Branches[branch].caption;
    // The shops have the names that the lab gives them; home delivery is a word of ours.
    if (m_state.english())
        Command4Snif.back().text = QStringLiteral("Home delivery");
}

void kyoskNew::Image13_Click() {
    Txt4Ml2.text = m_state.album.MailZalam;
    Image7_Click();
}

void kyoskNew::Command3_Click() {
    PicB4Sioom.visible = false;
    Frame4.visible = false;
    fillDomains();
    if (couponRefuses())
        return;
    m_state.DchisaAmoka = 0; // that of an order before is none of this one
    if (plain())
        FinishSimple();
    else
        openClosingPanel();
    Q_EMIT changed();
}

void kyoskNew::fillDomains() {
    Combo1Items = mailDomains();
    Combo1Index = -1;
    m_promptStands = true;
    Combo1.text = mailDomainPrompt(m_state.english());
}

bool kyoskNew::couponRefuses() {
    if (m_state.coupon.HaKoopon != 1)
        return false;
    const CouponFit fit = checkCoupon(m_state.coupon.MisparKoopon, Val16(Label7.text));
    if (fit == CouponFit::Matches)
        return false;
    closeFinish();
    if (fit == CouponFit::TooMany)
        say(QStringLiteral("חרגת מכמות התמונות שרכשת בקופון\nעליך לבטל בחירה של חלק מהתמונות"),
            QStringLiteral("You chose more pictures than your coupon holds\nPlease cancel some of the pictures"));
    else
        say(QStringLiteral("עליך לבחור תמונות לא פחות מהכמות שרכשת בקופון\nלא תתקבלנה הזמנות שאינן במלואן"),
            QStringLiteral("Please choose no fewer pictures than your coupon holds\nPartial orders are not accepted"));
    return true;
}

// Whatever lies above the page of pictures.
void kyoskNew::closeFinish() {
    for (Caption* panel : {&PicB4Sioom, &Frame4, &Pic4snifim, &Pic4Snif, &Picture7})
        panel->visible = false;
    Q_EMIT changed();
}

void kyoskNew::FinishSimple() {
    const DeepCompression deep = deepCompression(m_state.shemot.ppr, m_state.MediniyutDchisa);
    if (deep == DeepCompression::On)
        m_state.DchisaAmoka = 1;
    Picture7.visible = deep == DeepCompression::Ask;
    if (!openClosingPanel())
        return;
    const bool album = m_state.Optint == OrderKind::Album;
    const bool asksAddress = !m_state.TachanaMekomit;
    Text1.visible = asksAddress && !album;
    Combo1.visible = asksAddress && !album;
    Txt4Ml2.visible = asksAddress && album;
    if (album)
        Txt4Ml2.text = m_state.album.MailZalam;
}

bool kyoskNew::openClosingPanel() {
    Command7.visible = true;
    // A local station asks for no address, whatever else is set.
    Label33.visible = !m_state.DoarReshut && !m_state.TachanaMekomit;
    m_state.handOver.lines.clear();
    m_platform.pump.pump();
    if (m_handedOver)
        return false;
    if (List1.isEmpty()) {
        closeFinish();
        say(QStringLiteral("לא נבחרו תמונות"), QStringLiteral("No pictures were chosen"));
        return false;
    }
    SumCopies();
    PicB4Sioom.visible = true;
    Frame4.visible = true;
    Label19.text = m_state.shemot.ppr;
    Label20.text = Label7.text;
    return true;
}

void kyoskNew::Command20_Click() {
    m_state.DchisaAmoka = 0;
    Picture7.visible = false;
    Q_EMIT changed();
}

void kyoskNew::Command21_Click() {
    m_state.DchisaAmoka = 1;
    Picture7.visible = false;
    Q_EMIT changed();
}

void kyoskNew::Command4Snif_Click(int branch) {
    m_state.BranchChoice = Command4Snif.at(static_cast<std::size_t>(branch)).text;
    Command28_Click();
}

void kyoskNew::Command4Snif_MouseMove(int branch) {
    branchInHand = branch;
    Pic4Snif.visible = true;
    ShowBranchCard();
    Q_EMIT changed();
}

void kyoskNew::ShowBranchCard() {
    QStringList rows;
    if (branchInHand >= 0 && branchInHand < static_cast<int>(m_state.profile.Branches.size())) {
        const Branch& branch = m_state.profile.Branches[static_cast<std::size_t>(branchInHand)];
        rows = {branch.name.isEmpty() ? Command4Snif[static_cast<std::size_t>(branchInHand)].text : branch.name,
                branch.address[0], branch.address[1], branch.phone};
        rows.removeAll(QString());
    }
    Label41.text = rows.join(u'\n');
}

void kyoskNew::Image33_Click() {
    openBranches();
    Q_EMIT changed();
}

void kyoskNew::Command28_Click() {
    Pic4snifim.visible = false;
    Pic4Snif.visible = false;
    Q_EMIT changed();
}

void kyoskNew::Text1_Change(const QString& text) {
    Text1.text = text;
}

void kyoskNew::Text2_Change(const QString& text) {
    Text2.text = text;
}

void kyoskNew::Txt4Ml2_Change(const QString& text) {
    Txt4Ml2.text = text;
}

void kyoskNew::Combo1_Change(const QString& text) {
    Combo1.text = text;
    Combo1Index = -1;
    m_promptStands = false;
}

void kyoskNew::Combo1_Click(int index) {
    Combo1_Change(Combo1Items.value(index));
    Combo1Index = index;
    Q_EMIT changed();
}

QString kyoskNew::noteOfOrder() const {
    return Text2.text + QStringLiteral(" - ") + m_state.BranchChoice;
}

void kyoskNew::Command8_Click() {
    if (plain()) {
        HandToSecondPage();
        return;
    }
    if (Text1.text.isEmpty()) {
        say(QStringLiteral("לא הקלדת כתובת דואר"), QStringLiteral("You did not type a mail address"));
        takeFocus(QStringLiteral("Text1"));
        Q_EMIT changed();
        return;
    }
    m_state.shemot.Hearot = noteOfOrder();
    m_state.shemot.Mail = Text1.text + u'@' + Combo1.text;
    HandToPreparation();
}

void kyoskNew::Command7_Click() {
    if (plain()) {
        HandToSecondPageNoMail();
        return;
    }
    m_state.shemot.Hearot = noteOfOrder();
    HandToPreparation();
}

void kyoskNew::Command10_Click() {
    closeFinish();
}

void kyoskNew::HandToPreparation() {
    if (handTo(Outcome::EditedChosen) || m_chain.canFollow(PageId::kyoskNew, Outcome::EditedChosen))
        return;
    say(QStringLiteral("הכנת הזמנה עם עריכת תמונות אינה זמינה בגרסה זו\nהתמונות שבחרת נשארו בסל"),
        QStringLiteral("This version can't prepare an order of edited pictures yet\n"
                       "The pictures that you chose are still in the basket"));
}

void kyoskNew::HandToSecondPage() {
    m_state.shemot.Hearot = noteOfOrder();
    // The address of an album order is known already.
    m_state.shemot.Mail = m_state.Optint == OrderKind::Album ? Txt4Ml2.text : Text1.text + u'@' + Combo1.text;
    handTo(Outcome::PlainChosen);
}

void kyoskNew::HandToSecondPageNoMail() {
    m_state.shemot.Hearot = noteOfOrder();
    m_state.shemot.Mail = QStringLiteral("לא הוקלד");
    handTo(Outcome::PlainChosen);
}

// Once: a second press that arrives while the page yields finds the basket on its way.
bool kyoskNew::handTo(Outcome chosen) {
    if (m_handedOver || !m_chain.canFollow(PageId::kyoskNew, chosen))
        return false;
    m_handedOver = true;
    leaveEditor(); // a picture that is still open there
    ++m_drawing;
    Timer1.stop();
    Timer2.stop();
    m_platform.pump.pump();
    m_state.handOver.lines = List1.lines().items();
    m_state.handOver.pressStart = chosen == Outcome::PlainChosen;
    if (!m_chain.follow(PageId::kyoskNew, chosen))
        return false;
    // The next order begins with an editor of its own.
    for (const PageId id : {PageId::mikledet, PageId::RedI, PageId::Form3, PageId::tFrmNew, PageId::BigPics})
        m_chain.unload(id);
    return true;
}

} // namespace lumora
