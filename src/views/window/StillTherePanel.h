#pragma once

#include "views/kit/Overlay.h"

namespace lumora {

class Gauge;
struct SessionState;

// "Are you still there?", and how long an answer is waited for.
class StillTherePanel : public Overlay {
    Q_OBJECT
public:
    StillTherePanel(const Theme& theme, QWidget* parent, const SessionState& state);

    // share: of the time that is left, 0 to 1.
    void tell(int secondsLeft, double share);

Q_SIGNALS:
    void answered();

private:
    const SessionState& m_state;
    Gauge* m_gauge;
};

} // namespace lumora
