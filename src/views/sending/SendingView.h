#pragma once

#include "transfer/delivery/SendingPage.h"
#include "views/window/PageView.h"

#include <map>

namespace lumora {

class Gauge;

// The base of the two sending views: title, gauge, the main action of the phase and the keyboard that goes with it.
class SendingView : public PageView {
    Q_OBJECT
protected:
    SendingView(SendingPage& page, const SessionState& state, const Theme& theme);

    // The two halves of the page: how the sending stands, and what it is about. The first holds the gauge, the lines
    // below it and the cards of what went wrong.
    void layOut(std::initializer_list<Item> lines, std::initializer_list<Item> troubles, QLayout* side);
    // A label of an order's name, which keeps its own direction and may break behind each underscore.
    QLabel* orderName(const Caption& caption, const char* type);
    // The button that is the main action in the phases whose row names it.
    QPushButton* asMain(SendingButton action, QPushButton* button);
    // The lists of the rules, for scenarios and tests.
    void bindLists(const std::vector<std::pair<const char16_t*, const TextList*>>& lists);

    void render() override;

private:
    void renderGauge();

    SendingPage& m_page;
    Gauge* m_gauge;
    std::map<SendingButton, QPushButton*> m_mainActions;
    QWidget* m_main = nullptr; // what had the keyboard last
};

} // namespace lumora
