#pragma once

#include "session/SessionState.h"

namespace lumora {

// What the closing panel asks for: the mail address in two boxes, that of an album order in one, or, at a local
// station, none.
enum class AddressBox { None, Mail, AlbumMail };
AddressBox addressBoxOf(OrderKind kind, bool localStation);

// A coupon order must match the coupon's quantity exactly, copies included.
enum class CouponFit { Matches, TooMany, TooFew };
CouponFit checkCoupon(int couponPictures, int total);

// Deep compression of large prints, whose longer side is 45 or more.
enum class DeepCompression { Off, On, Ask };
// policy: 1 ask, 2 always; any other never, as for a paper without a size.
DeepCompression deepCompression(const QString& ppr, int policy);

} // namespace lumora
