#pragma once

#include "platform/Machine.h"

namespace lumora {

class SystemClock : public Clock {
public:
    QDateTime now() const override { return QDateTime::currentDateTime(); }
};

} // namespace lumora
