#pragma once

#include <Poco/Timespan.h>

namespace lumora {

// How long a line may be silent.
struct TimeLimits {
    Poco::Timespan connect = Poco::Timespan(30, 0);
    Poco::Timespan silence = Poco::Timespan(60, 0); // no byte and no reply
};

} // namespace lumora
