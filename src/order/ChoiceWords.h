#pragma once

#include <QString>

// What the customer has chosen, in words of the session's language.
namespace lumora {

struct SessionState;

// How the border of a code looks; empty for a code that is not known.
QString borderWords(const SessionState& state, const QString& code);

// The paper kind of an order, which may have been chosen in the other language; any other text as it is.
QString paperWord(const SessionState& state, const QString& maat);

} // namespace lumora
