#pragma once

#include "common/ListOutput.h"

namespace lumora {

struct SessionState;

// What a customer has chosen for an order, as the state of an unfinished order keeps it: all of the session that
// preparing the order reads besides the basket, and the pictures that were left out for their ending. Keys and values
// are in the order of docs/formats.md.
QList<ListOutputEntry> ChoicesOf(const SessionState& state);

// Takes them back. A key that is missing leaves its field, one that is not known is passed over. Of leftOut the
// pictures that were left out for their ending stay alone.
void TakeChoices(const QList<ListOutputEntry>& choices, SessionState& state);

} // namespace lumora
