#pragma once

#include <QString>

namespace lumora {

struct OrderCompleteness;
struct Platform;
struct SessionState;

// Asked before a sending begins, also by mail: an order without a picture to print does not leave, and one that lacks
// pictures of its log leaves only if the customer says so. As built in, every order leaves.
class CompletenessGuard {
public:
    CompletenessGuard(const SessionState& state, const Platform& platform)
        : m_state(state)
        , m_platform(platform) {}

    // Shows a message or a question, whose loop may close the page.
    bool maySend(const OrderCompleteness& counts) const;
    // What an order lacks that does not leave, or not before a question.
    QString whatIsMissing(const OrderCompleteness& counts) const;

private:
    bool askForFewer(const OrderCompleteness& counts) const;

    const SessionState& m_state;
    const Platform& m_platform;
};

} // namespace lumora
