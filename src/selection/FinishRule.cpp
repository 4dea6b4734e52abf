#include "selection/FinishRule.h"

#include "common/FixedText.h"

namespace lumora {

AddressBox addressBoxOf(OrderKind kind, bool localStation) {
    if (localStation)
        return AddressBox::None;
    return kind == OrderKind::Album ? AddressBox::AlbumMail : AddressBox::Mail;
}

CouponFit checkCoupon(int couponPictures, int total) {
    if (couponPictures < total)
        return CouponFit::TooMany;
    return couponPictures > total ? CouponFit::TooFew : CouponFit::Matches;
}

DeepCompression deepCompression(const QString& ppr, int policy) {
    const QString longer = RightPart(ppr, 2).trimmed();
    if ((longer.isEmpty() ? 15 : Val16(longer)) < 45)
        return DeepCompression::Off;
    return policy == 1 ? DeepCompression::Ask : policy == 2 ? DeepCompression::On : DeepCompression::Off;
}

} // namespace lumora
