#include "selection/FinishRule.h"

#include "common/PaperSize.h"

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
    const std::optional<PaperSize> paper = PaperSize::ofText(ppr);
    if (!paper || paper->longSide < 45)
        return DeepCompression::Off;
    return policy == 1 ? DeepCompression::Ask : policy == 2 ? DeepCompression::On : DeepCompression::Off;
}

} // namespace lumora
