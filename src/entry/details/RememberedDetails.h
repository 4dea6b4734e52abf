#pragma once

#include "entry/details/DetailStore.h"

namespace lumora {

// Keeps or forgets a customer's details as the box "remember" says. As built in they are stored before the options
// whatever it says, and an album order stores or deletes them too, though it asks for none. On a kiosk nothing is kept.
class RememberedDetails {
public:
    RememberedDetails(const SessionState& state, const Files& files)
        : m_state(state)
        , m_store(state, files) {}

    // The details were typed.
    Result<void> typed(const DetailStore::Customer& customer, bool remember) const;
    // The order goes on to the pictures.
    Result<void> ordered(const DetailStore::Customer& customer, bool remember) const;

private:
    const SessionState& m_state;
    DetailStore m_store;
};

} // namespace lumora
