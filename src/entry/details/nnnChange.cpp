// The page as the page of pictures opens it: size, paper and details are changed, and the pictures stay chosen.
#include "common/FixedText.h"
#include "entry/details/TileMenu.h"
#include "entry/details/nnn.h"
#include "order/CouponLimit.h"
#include "order/PrintCode.h"
#include "platform/Dialogs.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

// The page shows the order as it is. The terms were agreed to.
void nnn::beginChange() {
    const OrderDetails& order = m_state.shemot;
    m_before = Before{order, m_state.coupon, m_state.album};
    const auto typed = [](const QString& text) { return text == notChosen ? QString() : text; };
    Text2.text = typed(order.n1);
    Text3.text = typed(order.n2);
    Text4.text = typed(order.n3);
    if (m_state.Optint == OrderKind::Album) {
        m_album.change();
        return open(Step::Album);
    }
    for (std::size_t i = 0; i < Option1.size(); ++i)
        Option1[i].checked = !m_quickSizes[i].isEmpty() && m_quickSizes[i].trimmed() == order.ppr;
    Combo1.text = order.ppr;
    if (!std::ranges::any_of(Option1, &CheckCaption::checked))
        Combo1.take(Combo1.rows.find(order.ppr));
    const QChar letter = paperLetter(order.maat, PaperWords::All, u' ');
    Option3[0].checked = letter == u'M';
    Option3[1].checked = letter == u'G';
    for (std::size_t i = 0; i < Image13.size(); ++i) {
        Image13[i].checked = borderCode(static_cast<int>(i)) == order.Bord;
        if (Image13[i].checked)
            Picture16 = static_cast<int>(i);
    }
    Option4.checked = order.FillFit == u"FIT"_s;
    Option5.checked = order.FillFit == u"FIL"_s;
    Label4kpn.visible = CouponLimit(m_state).measures();
    Label4kpn.text = QString::number(m_state.coupon.MisparKoopon);
    Command12.enabled = true;
    open(Step::Options);
}

// What is remembered for the next time was decided when the order began. The last step shows what was chosen.
void nnn::showChange() {
    Command2.text = m_state.wording(u"חזרה בלי שינוי", u"Back, unchanged");
    Command3.text = m_state.wording(u"חזרה לתמונות", u"Back to the pictures");
    for (Caption* part : std::initializer_list<Caption*>{&Check2, &Command10, &Check1, &Command29, &LabelTerms,
                                                         &Command30, &Image4, &Label8})
        part->visible = false;
    if (m_step == Step::Terms)
        Title.text = LabelChoice.text;
    bool isFirst = m_step == Step::Details;
    if (m_step == Step::Album) {
        m_album.showChange(Command3.text);
        isFirst = m_album.panel() == AlbumPanels::Panel::Photographer;
        if (m_album.panel() == AlbumPanels::Panel::Bill)
            Title.text = m_album.controls().Pic4Bil.text;
    }
    if (isFirst)
        Command4.visible = false;
}

void nnn::leaveChange() {
    m_leaving = true;
    m_chain.follow(pageId, Outcome::PicturesWanted);
}

void nnn::cancelChange() {
    m_state.shemot = m_before->details;
    m_state.coupon = m_before->coupon;
    m_state.album = m_before->album;
    leaveChange();
}

bool nnn::asksToCancelAlbum() {
    const bool cancels =
        !m_album.isBegun() ||
        m_platform.dialogs.ask(m_state.wording(u"לבטל את הזמנת האלבום? מה שנבחר ונכתב יימחק.",
                                               u"Cancel the album? What was chosen and typed will be gone."));
    return cancels && !m_leaving && !m_chain.hasEnded();
}

} // namespace lumora
