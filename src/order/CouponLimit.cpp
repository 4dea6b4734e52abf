#include "order/CouponLimit.h"

#include "session/SessionState.h"

namespace lumora {

void CouponLimit::begin() const {
    if (m_state.Careful)
        m_state.coupon.MisparKoopon = 0;
}

std::optional<int> CouponLimit::takeQuickSize(const QString& size) const {
    CouponState& coupon = m_state.coupon;
    if (size != u"10/15" && size != u"20/30")
        return takeListedSize();
    coupon.MisparKoopon = size == u"10/15" ? coupon.SmallCount : coupon.LargeCount;
    return coupon.MisparKoopon;
}

std::optional<int> CouponLimit::takeListedSize() const {
    if (!m_state.Careful)
        return std::nullopt;
    return m_state.coupon.MisparKoopon = 0;
}

bool CouponLimit::measures() const {
    const CouponState& coupon = m_state.coupon;
    const bool hasNone = m_state.Optint == OrderKind::Album || coupon.MisparKoopon == 0;
    return coupon.HaKoopon == 1 && !(m_state.Careful && hasNone);
}

} // namespace lumora
