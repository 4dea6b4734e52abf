#pragma once

#include "transfer/delivery/SendingPage.h"
#include "views/window/LeftOutView.h"

#include <map>

class QGridLayout;
class QProgressBar;

namespace lumora {

class Gauge;
class Overlay;
class PrintFan;

// The base of the two sending views: title, gauge, the main action of the phase and the keyboard that goes with it.
class SendingView : public LeftOutView {
    Q_OBJECT
protected:
    SendingView(SendingPage& page, const SessionState& state, const Theme& theme);

    // The two halves of the page: how the sending stands, and what it is about. The first holds the gauge or the
    // thank-you, the lines below and the cards of what went wrong.
    void layOut(std::initializer_list<Item> lines, std::initializer_list<Item> troubles, QLayout* side);
    // Takes the place of the gauge once the order has arrived. prompt and whole: of the order's number.
    void makeThanks(const Caption& prompt, const Caption& whole);
    // The first prints, and below them what is in the order.
    PrintFan* printFan() const { return m_fan; }
    QLayout* makeFacts();
    QPushButton* makeChange();
    // A label of an order's name, which keeps its own direction and may break behind each underscore.
    QLabel* orderName(const Caption& caption, const char* type);
    // The button that is the main action in the phases whose row names it.
    QPushButton* asMain(SendingButton action, QPushButton* button);
    // A thin bar that moves and tells no number. full: its width in the page's terms.
    QProgressBar* movingBar(int full);
    // A list of the lab's own area as the next column, below its heading. Names run from left to right.
    void addLabList(QGridLayout& to, const Caption& heading, const char16_t* name, const TextList& rows,
                    std::function<void(int)> picked = {});
    // The lab's own area: a panel over the page, which scrolls where it is higher than the window.
    Overlay* makeLabPanel(std::initializer_list<Item> parts, QPushButton* close);
    // The least height of a list or an answer there, before the theme's factor.
    static constexpr int LabBoxHeight = 110;
    // What the lab's own area tells of arrival and report.
    QLayout* makeReporting();
    // The lists of the rules, for scenarios and tests.
    void bindLists(const std::vector<std::pair<const char16_t*, const TextList*>>& lists);

    void render() override;

private:
    void renderGauge();
    void renderPrints();
    void renderCode();

    SendingPage& m_page;
    Gauge* m_gauge;
    QWidget* m_thanks = nullptr;
    PrintFan* m_fan;
    QLabel* m_code = nullptr;
    std::map<SendingButton, QPushButton*> m_mainActions;
    std::vector<std::pair<const Caption*, QListWidget*>> m_headed;
    QWidget* m_main = nullptr; // what had the keyboard last
};

} // namespace lumora
