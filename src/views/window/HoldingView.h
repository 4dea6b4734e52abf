#pragma once

#include "views/kit/HoldButton.h"
#include "views/window/PageView.h"

namespace lumora {

// The base of the view of a page with buttons that work as long as they are held.
template <class P>
class HoldingView : public ViewOf<P> {
protected:
    using ViewOf<P>::ViewOf;

    // What such a button calls on the page. A button that is hidden after its page has gone calls nothing.
    HoldButton::Handlers held(std::function<void()> down, std::function<void()> up) const {
        const auto whilePageIsThere = [this](std::function<void()> handler) {
            return [this, handler = std::move(handler)] {
                if (!this->isDetached())
                    handler();
            };
        };
        return {std::move(down), whilePageIsThere(std::move(up)), whilePageIsThere(this->toPage(&P::stopHolds))};
    }
};

} // namespace lumora
