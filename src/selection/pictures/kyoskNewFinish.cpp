// The page of pictures: the checks at the end of choosing, the closing panel, the hand-over.
#include "editing/editor/tFrmNew.h"
#include "order/CouponLimit.h"
#include "order/MailAddressGuard.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "selection/HomeAddress.h"
#include "selection/OrderSpace.h"
#include "selection/door/PictureDoor.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/lab/MailDomains.h"

namespace lumora {

using namespace Qt::StringLiterals;

void kyoskNew::finish() {
    onceMade(&kyoskNew::openFinish);
}

void kyoskNew::openFinish() {
    openBranches();
    checkAndClose();
}

void kyoskNew::finishAlbum() {
    Txt4Ml2.text = m_state.album.MailZalam;
    finish();
}

void kyoskNew::checkAndClose() {
    PicB4Sioom.visible = Frame4.visible = false;
    Combo1Items = mailDomains();
    if (!m_tookBack && !MailAddressGuard(m_state).keepsDomain(typedAddress())) {
        Combo1Index = -1;
        m_promptStands = true;
        Combo1.text = mailDomainPrompt(m_state.english());
    }
    if (couponRefuses())
        return;
    const DeepCompression deep = decideCompression();
    openClosingPanel();
    // The question is shown only together with the closing panel below it.
    Picture7.visible = PicB4Sioom.visible && deep == DeepCompression::Ask;
}

DeepCompression kyoskNew::decideCompression() {
    const bool mayBeDeep = plain() && (m_state.Optint != OrderKind::Album || m_state.DchisatAlbum);
    const DeepCompression deep =
        mayBeDeep ? deepCompression(m_state.shemot.ppr, m_state.MediniyutDchisa) : DeepCompression::Off;
    m_state.DchisaAmoka = deep == DeepCompression::On ? 1 : 0;
    return deep;
}

bool kyoskNew::couponRefuses() {
    if (!CouponLimit(m_state).measures())
        return false;
    const CouponFit fit = checkCoupon(m_state.coupon.MisparKoopon, m_choice.basket().SumCopies());
    if (fit == CouponFit::Matches)
        return false;
    closeFinish();
    if (fit == CouponFit::TooMany)
        say(u"חרגת מכמות התמונות שרכשת בקופון\nעליך לבטל בחירה של חלק מהתמונות",
            u"You chose more pictures than your coupon holds\nPlease cancel some of the pictures");
    else
        say(u"עליך לבחור תמונות לא פחות מהכמות שרכשת בקופון\nלא תתקבלנה הזמנות שאינן במלואן",
            u"Please choose no fewer pictures than your coupon holds\nPartial orders are not accepted");
    return true;
}

void kyoskNew::openClosingPanel() {
    m_state.handOver.lines.clear();
    m_platform.pump.pump();
    if (m_handedOver)
        return;
    if (m_choice.basket().isEmpty()) {
        closeFinish();
        say(u"לא נבחרו תמונות", u"No pictures were chosen");
        return;
    }
    PicB4Sioom.visible = Frame4.visible = true;
    Label19.text = m_state.shemot.ppr;
    Label20.text = QString::number(m_choice.basket().SumCopies());
    if (m_state.Optint == OrderKind::Album)
        Txt4Ml2.text = m_state.album.MailZalam;
    showAddressWord();
    countCoarse();
    Q_EMIT changed();
}

void kyoskNew::countCoarse() {
    m_coarse = m_resolution.coarse(m_choice.basket());
    coarseNote.visible = showCoarse.visible = !m_coarse.isEmpty();
    setCoarseTexts();
}

void kyoskNew::showCoarsePictures() {
    closeFinish();
    QString first;
    turnPage([&] {
        m_choice.showAlone(m_coarse);
        first = m_choice.path(0);
        drawPage();
    });
    if (!plain() || first.isEmpty())
        return;
    showLarge(DrivePath(first));
    takeInHand(first);
    Q_EMIT changed();
}

// Closes every panel above the cells.
void kyoskNew::closeFinish() {
    for (Caption* panel : {&PicB4Sioom, &Frame4, &Pic4snifim, &Pic4Snif, &Picture7})
        panel->visible = false;
    Q_EMIT changed();
}

void kyoskNew::setDeepCompression(bool deep) {
    m_state.DchisaAmoka = deep ? 1 : 0;
    Picture7.visible = false;
    countCoarse();
    showPaper();
    showChoice();
}

// Does not signal: the caller signals once for both panels.
void kyoskNew::openBranches() {
    Pic4snifim.visible = m_state.coupon.HaKoopon == 1;
    nameBranches();
}

void kyoskNew::nameBranches() {
    for (std::size_t branch = 0; branch < Command4Snif.size(); ++branch)
        Command4Snif[branch].text = m_state.profile.Branches[branch].caption;
    // The lab's file names the shops; the name of home delivery is fixed.
    if (m_state.english())
        Command4Snif.back().text = u"Home delivery"_s;
    // A lab with fewer shops leaves captions empty.
    for (Caption& branch : Command4Snif)
        branch.visible = !branch.text.isEmpty();
}

void kyoskNew::offerBranches() {
    openBranches();
    Q_EMIT changed();
}

void kyoskNew::chooseBranch(int branch) {
    // The lab reads the Hebrew name of home delivery in both languages.
    m_state.BranchChoice = m_state.profile.Branches.at(static_cast<std::size_t>(branch)).caption;
    closeBranches();
    homeAddressKnown();
}

// Asks for an address to which the prints can go.
bool kyoskNew::homeAddressKnown() {
    if (!HomeAddress(m_state).isMissing(Text2.text))
        return true;
    say(u"נא להקליד בהערות את הכתובת למשלוח:\nרחוב, מספר ועיר",
        u"Please type the address for the delivery into the notes:\nstreet, number and town");
    focusOn(u"Text2"_s);
    return false;
}

void kyoskNew::focusOn(const QString& box) {
    m_focusBox = box;
    ++m_focusRequest;
    Q_EMIT changed();
}

void kyoskNew::showBranch(int branch) {
    Pic4Snif.visible = true;
    QStringList rows;
    if (branch >= 0 && branch < static_cast<int>(m_state.profile.Branches.size())) {
        const auto at = static_cast<std::size_t>(branch);
        const Branch& card = m_state.profile.Branches[at];
        rows = {card.name.isEmpty() ? Command4Snif[at].text : card.name, card.address[0], card.address[1], card.phone};
        rows.removeAll(QString());
    }
    Label41.text = rows.join(u'\n');
    Q_EMIT changed();
}

void kyoskNew::closeBranches() {
    Pic4snifim.visible = Pic4Snif.visible = false;
    Q_EMIT changed();
}

void kyoskNew::type(Caption& box, const QString& text) {
    box.text = text;
    showAddressWord();
    Q_EMIT changed();
}

void kyoskNew::typeDomain(const QString& text) {
    Combo1.text = text;
    Combo1Index = -1;
    m_promptStands = false;
    showAddressWord();
    Q_EMIT changed();
}

void kyoskNew::chooseDomain(int index) {
    typeDomain(Combo1Items.value(index));
    Combo1Index = index;
    Q_EMIT changed();
}

TypedAddress kyoskNew::typedAddress() const {
    return {Text1.text, Combo1.text, m_promptStands};
}

void kyoskNew::goOnWithAddress() {
    const MailAddressGuard guard(m_state);
    const TypedAddress typed = typedAddress();
    const QString address = guard.address(typed);
    if (!plain() && (Text1.text.isEmpty() || address.isEmpty())) {
        say(u"לא הקלדת כתובת דואר", u"You did not type a mail address");
        return focusOn(u"Text1"_s);
    }
    if (m_state.Optint == OrderKind::Album)
        return handOver(Txt4Ml2.text);
    if (guard.lacksDomain(typed)) {
        say(u"נא לבחור או להקליד את ספק הדואר,\nאחרי השטרודל",
            u"Please choose or type the mail provider,\nbehind the at sign");
        return focusOn(u"Combo1"_s);
    }
    handOver(address.isEmpty() ? mailNotTyped : address);
}

void kyoskNew::goOnWithoutAddress() {
    handOver(plain() ? mailNotTyped : m_state.shemot.Mail);
}

// The sheet and the log of an album have the address as it is corrected here.
void kyoskNew::typeAlbumMail(const QString& text) {
    type(Txt4Ml2, text);
    m_state.album.MailZalam = text.trimmed();
}

// A second press that arrives while the page yields does nothing.
void kyoskNew::handOver(const QString& mail) {
    if (m_handedOver || !homeAddressKnown())
        return;
    if (m_state.kiosk.on) {
        if (const std::optional<QString> lacking = OrderSpace::lacking(List1.items(), m_state, m_platform.files)) {
            m_platform.dialogs.message(*lacking);
            return;
        }
    }
    m_handedOver = true;
    m_state.handOver.closing = {Text1.text, Combo1.text, Combo1Index, m_promptStands, Text2.text};
    m_state.handOver.details = m_state.shemot;
    m_state.shemot.Hearot = Text2.text + u" - "_s + m_state.BranchChoice;
    m_state.shemot.Mail = mail;
    if (!plain())
        leaveEditor(); // a picture that is still open there
    ++m_drawing;
    Timer1.stop();
    Timer2.stop();
    m_platform.pump.pump();
    m_state.handOver.lines = m_state.handOver.basket = List1.items();
    m_state.handOver.doorFolder = m_door->folder();
    m_state.handOver.pictures = List4.items();
    m_state.handOver.pressStart = plain();
    m_chain.follow(pageId, plain() ? Outcome::PlainChosen : Outcome::EditedChosen);
    // The next order begins with an editor of its own.
    unloadEditor();
}

} // namespace lumora
