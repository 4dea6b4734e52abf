#pragma once

#include "common/Result.h"
#include "platform/line/Encryption.h"
#include "platform/line/TimeLimits.h"

namespace lumora {

// Connects to a host and hangs up without a word: "name", "name:port" or an address with its scheme, of which the host
// counts; one with https has to prove who it is. usualPort: where neither a port nor a scheme is named.
Result<void> ReachHost(const QString& host, quint16 usualPort, const LineEncryption& encryption = {},
                       const TimeLimits& limits = {});

} // namespace lumora
