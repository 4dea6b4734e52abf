#pragma once

#include <QString>

#include <optional>

namespace lumora {

struct SessionState;

// The number of pictures that a coupon holds of the size chosen in this order. As built in, a size without a limit, and
// an album, are measured by the limit of the size that was chosen last, even by an earlier customer.
class CouponLimit {
public:
    explicit CouponLimit(SessionState& state)
        : m_state(state) {}

    // A new order, for which no size is chosen yet.
    void begin() const;
    // A size in front, or one of the list, was chosen. Gives the limit from now on: 0 for a size without one, no value
    // where the earlier limit stays.
    std::optional<int> takeQuickSize(const QString& size) const;
    std::optional<int> takeListedSize() const;
    // The order's copies must match the limit.
    bool measures() const;

private:
    SessionState& m_state;
};

} // namespace lumora
