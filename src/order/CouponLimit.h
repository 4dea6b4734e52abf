#pragma once

#include <QString>

#include <optional>

namespace lumora {

struct SessionState;

// The number of pictures that a coupon holds of the size chosen in this order. As built in, a size without a limit, and
// an album, are measured by the limit of the size that was chosen last, be it by an earlier customer.
class CouponLimit {
public:
    explicit CouponLimit(SessionState& state)
        : m_state(state) {}

    // A new order, for which no size is chosen yet.
    void begin() const;
    // A size that is placed in front, or one of the list, was chosen. The limit from now on, 0 for a size without a
    // coupon; no value where the one before goes on to hold.
    std::optional<int> takeQuickSize(const QString& size) const;
    std::optional<int> takeListedSize() const;
    // The order's copies must match the limit.
    bool measures() const;

private:
    SessionState& m_state;
};

} // namespace lumora
