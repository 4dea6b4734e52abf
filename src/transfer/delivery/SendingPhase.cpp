#include "transfer/delivery/SendingPhase.h"

#include <array>

namespace lumora {

QString phaseName(SendingPhase phase) {
    static constexpr std::array<const char*, 17> names = {
        "preparing", "no order", "no server", "refused",      "countdown",     "waiting",
        "sending",   "checking", "reporting", "success",      "all are there", "part is there",
        "unclear",   "not all",  "stopped",   "call the lab", "number taken"};
    return QString::fromLatin1(names[static_cast<std::size_t>(phase)]);
}

} // namespace lumora
