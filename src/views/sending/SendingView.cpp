#include "views/sending/SendingView.h"

#include "views/kit/Gauge.h"
#include "views/kit/Overlay.h"

#include <QFrame>
#include <QPushButton>
#include <QVBoxLayout>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

SendingView::SendingView(SendingPage& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page) {
    frame().steps().setStep(OrderStep::Sending);
}

SendingView::ProgressColumn SendingView::makeProgressColumn() {
    auto* box = new QWidget(this);
    auto* column = new QVBoxLayout(box);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme().px(10));
    column->addStretch(1);
    m_gauge = new Gauge(theme(), box);
    column->addWidget(m_gauge, 6, Qt::AlignCenter);
    return {box, column};
}

QFrame* SendingView::bindFailure(const SendingCard& card) {
    m_failure = card.frame;
    return m_failure;
}

QPushButton* SendingView::asMain(SendingButton action, QPushButton* button) {
    m_mainActions[action] = button;
    return button;
}

QPushButton* SendingView::newOrderButton(const Caption& caption, std::function<void()> clicked) {
    return asMain(SendingButton::NewOrder, button(caption, Role::Secondary, std::move(clicked)));
}

void SendingView::bindLists(const std::vector<std::pair<const char16_t*, const TextList*>>& lists) {
    for (const auto& [name, list] : lists) {
        if (!control(QString::fromUtf16(name)))
            bindList(QString::fromUtf16(name), *list);
    }
}

void SendingView::renderPhase() {
    const SendingControls& shown = m_page.sendingControls();
    const PhaseLook& look = m_page.look();
    window()->setWindowTitle(shown.caption.trimmed().isEmpty() ? u"Lumora"_s : shown.caption.simplified());
    frame().steps().setStep(hasArrived(look.phase) ? OrderStep::Done : OrderStep::Sending);
    frame().setTitle(shown.Label4Title.text);
    renderGauge();
    m_failure->setVisible(shown.Pic4Failure.visible);
    changeRole(m_mainActions.at(SendingButton::NewOrder), look.main == SendingButton::NewOrder ? "main" : "secondary");
    if (frontOverlay(*window()))
        return;
    // A button that hides hands the keyboard to its neighbour: the second half of a double press would stop what the
    // first half has started. Where the phase has no main action the page itself takes it.
    const auto action = m_mainActions.find(look.main);
    QWidget* main = action == m_mainActions.end() ? static_cast<QWidget*>(this) : action->second;
    if (std::exchange(m_main, main) != main)
        main->setFocus(Qt::OtherFocusReason);
}

void SendingView::renderGauge() {
    const SendingGauge gauge = m_page.gauge();
    switch (gauge.sign) {
    case SendingSign::Good:
        m_gauge->showSign(Gauge::Mood::Good);
        break;
    case SendingSign::Held:
        m_gauge->showSign(Gauge::Mood::Held);
        break;
    case SendingSign::Unclear:
        m_gauge->showSign(Gauge::Mood::Unclear);
        break;
    case SendingSign::Bad:
        m_gauge->showSign(Gauge::Mood::Bad);
        break;
    default:
        m_gauge->show(gauge.share, gauge.large, gauge.small);
        break;
    }
    m_gauge->setAccessibleName(gauge.sign == SendingSign::Percent ? gauge.large
                                                                  : m_page.sendingControls().Label4Do.text);
}

} // namespace lumora
