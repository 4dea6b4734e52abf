#include "transfer/delivery/LineTrouble.h"

namespace lumora {

int LineErrorNumber(Failure::Kind kind) {
    switch (kind) {
    case Failure::Kind::Refused:
    case Failure::Kind::AccessDenied:
        return 12003;
    case Failure::Kind::TimedOut:
        return 12002;
    case Failure::Kind::Disconnected:
        return 12030;
    default:
        return 12000;
    }
}

} // namespace lumora
