#include "order/OrderState.h"

#include "order/OrderChoices.h"

#include <cstdint>
#include <cstdlib>

// The state of an unfinished order, which a failing disk may give back in any form. What is taken of it writes a state
// that reads the same.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    const lumora::Result<lumora::OrderState> state = lumora::OrderState::parse(bytes);
    if (!state)
        return 0;
    const QByteArray written = state->write();
    const lumora::Result<lumora::OrderState> again = lumora::OrderState::parse(written);
    if (!again || again->write() != written)
        std::abort();
    lumora::SessionState session;
    lumora::TakeChoices(state->choices, session);
    return 0;
}
