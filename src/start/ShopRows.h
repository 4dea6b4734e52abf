#pragma once

#include <QStringList>

namespace lumora {

struct Deployment;
struct SessionState;

// The rows of the delivery question; row 0 is the first shop in both languages. As built in, the English rows say "by
// postmail" and "at stor", and the customer who takes the first gets the code of a shop.
class ShopRows {
public:
    ShopRows(const SessionState& state, const Deployment& deployment)
        : m_state(state)
        , m_deployment(deployment) {}

    QStringList texts() const;

private:
    const SessionState& m_state;
    const Deployment& m_deployment;
};

} // namespace lumora
