#pragma once

#include <QString>

namespace lumora {

struct SessionState;

// A coupon order that is delivered to the home needs an address, which only the note can carry. As built in, it leaves
// without one.
class HomeAddress {
public:
    explicit HomeAddress(const SessionState& state)
        : m_state(state) {}

    bool isMissing(const QString& note) const;

private:
    const SessionState& m_state;
};

} // namespace lumora
