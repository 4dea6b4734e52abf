// Called by nothing: the quick order by a name alone and the orders by a coupon, to which no control leads yet.
#include "entry/details/nnn.h"

#include "entry/details/DetailStore.h"
#include "entry/details/TileMenu.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

// The quick form has one box; its text is both name and telephone.
void nnn::QuickCheck() {
    if (m_leaving || !nameGiven())
        return;
    OrderDetails& shemot = m_state.shemot;
    shemot.n1 = Text2.text.trimmed();
    shemot.n2 = Text2.text.trimmed();
    shemot.ppr = u"10/15"_s;
    shemot.maat = u"מבריק"_s;
    shemot.Bord = borderCode(0);
    shemot.FillFit = u"FIT"_s;
    if (!Check2.checked)
        succeeded(DetailStore(m_state, m_platform.files).forgetQuickDetails());
    m_state.Optint = OrderKind::EditedPrint;
    GoToSelection();
}

void nnn::CouponOrder(Coupon coupon) {
    m_state.coupon.SmallCount = coupon == Coupon::Small ? 220 : 350;
    m_state.coupon.LargeCount = coupon == Coupon::Small ? 3 : 5;
    m_quickSizes[0] = u"10/15"_s;
    m_quickSizes[1] = u"20/30"_s;
    if (termsAgreed(Check1))
        nameGiven();
    showStep();
}

bool nnn::nameGiven() {
    const bool given = !Text2.text.isEmpty();
    if (!given)
        tell(u"אחד או יותר מהפרטים חסרים בדוק שוב בבקשה",
             u"One or more of the details are missing, please check again");
    return given;
}

} // namespace lumora
