#pragma once

#include "order/LeftOutBox.h"
#include "views/window/PageView.h"

namespace lumora {

// The base of the views of the pages that prepare or send an order: the box of the pictures that are not in it, and the
// card that repeats their number.
class LeftOutView : public PageView {
    Q_OBJECT
protected:
    LeftOutView(Page& page, const SessionState& state, const Theme& theme, const LeftOutControls& leftOut,
                std::function<void()> goOn, std::function<void()> back);

    QFrame* makeLeftOutCard();

    void render() override;

private:
    const LeftOutControls& m_leftOut;
    QListWidget* m_names;
    QPushButton* m_goOn;
    QPushButton* m_back;
    Overlay* m_box;
};

} // namespace lumora
