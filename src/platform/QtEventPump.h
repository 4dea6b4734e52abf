#pragma once

#include "platform/Machine.h"

#include <QElapsedTimer>

namespace lumora {

class QtEventPump : public EventPump {
public:
    void pump() override;
    bool pumping() const override { return m_depth > 0; }

private:
    QElapsedTimer m_sinceLast; // the end of the last run of the event loop
    int m_depth = 0;
};

} // namespace lumora
