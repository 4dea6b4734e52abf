#pragma once

#include "transfer/delivery/SendingPage.h"
#include "views/sending/SendingCards.h"
#include "views/window/PageView.h"

#include <map>

class QFrame;
class QPushButton;

namespace lumora {

class Gauge;

// The base of the two sending views: title, gauge, the main action of the phase and the keyboard that goes with it.
class SendingView : public PageView {
    Q_OBJECT
protected:
    SendingView(SendingPage& page, const SessionState& state, const Theme& theme);

    // The half of the progress, with the gauge on top; what follows is added to the column.
    struct ProgressColumn {
        QWidget* box;
        QVBoxLayout* column;
    };
    ProgressColumn makeProgressColumn();
    // The card that tells of a failure in the end.
    QFrame* bindFailure(const SendingCard& card);
    // The button that is the main action in the phases whose row names it.
    QPushButton* asMain(SendingButton action, QPushButton* button);
    QPushButton* newOrderButton(const Caption& caption, std::function<void()> clicked);
    // The lists of the rules, for scenarios and tests.
    void bindLists(const std::vector<std::pair<const char16_t*, const TextList*>>& lists);

    void renderPhase();

private:
    void renderGauge();

    SendingPage& m_page;
    Gauge* m_gauge = nullptr;
    QFrame* m_failure = nullptr;
    std::map<SendingButton, QPushButton*> m_mainActions;
    QWidget* m_main = nullptr; // what had the keyboard last
};

} // namespace lumora
