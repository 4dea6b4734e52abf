#pragma once

#include "session/SessionState.h"

#include <optional>

namespace lumora {

class Files;
class OrderFolder;

// The sender that an order was made for: its state tells, else its sheet, which is a print file (".jpp") for FTP and
// stands under ".jpg" alone for HTTP. No value where neither is there.
std::optional<Sender> SenderMadeFor(const Files& files, const OrderFolder& folder);

// True when the lab has given all that the sender needs to reach its server.
bool SenderSetUp(const ClientProfile& profile, Sender sender);

// The sender that a finished order is sent again by: as built in that of the session, else the one that the order was
// made for where that is set up, else the one that is.
Sender SenderForResend(const SessionState& state, const OrderFolder& folder, const Files& files);

} // namespace lumora
