#include "views/sending/SendingView.h"

#include "views/kit/Gauge.h"
#include "views/kit/Overlay.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

SendingView::SendingView(SendingPage& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page)
    , m_gauge(new Gauge(theme, this)) {
    frame().steps().setStep(OrderStep::Sending);
}

void SendingView::layOut(std::initializer_list<Item> lines, std::initializer_list<Item> troubles, QLayout* side) {
    QVBoxLayout* progress = inColumn(Space::Small, {Item::room(), {m_gauge, 6, Qt::AlignCenter}});
    add(*progress, lines);
    add(*progress, {Item::room()});
    add(*progress, troubles);
    frame().content()->addLayout(inRow(Space::Far, {{inBox(progress), 3}, {inBox(side), 2}}), 1);
}

QLabel* SendingView::orderName(const Caption& caption, const char* type) {
    return label(caption, type, [this](QString name) {
        return name.isEmpty() ? name : atLineStart(fromLeft(name.replace(u'_', u"_\u200B"_s)), state().english());
    });
}

QPushButton* SendingView::asMain(SendingButton action, QPushButton* button) {
    m_mainActions[action] = button;
    return button;
}

void SendingView::bindLists(const std::vector<std::pair<const char16_t*, const TextList*>>& lists) {
    for (const auto& [name, list] : lists) {
        if (!control(QString::fromUtf16(name)))
            bindList(QString::fromUtf16(name), *list);
    }
}

void SendingView::render() {
    const SendingControls& shown = m_page.sendingControls();
    const PhaseLook& look = m_page.look();
    window()->setWindowTitle(shown.caption.trimmed().isEmpty() ? u"Lumora"_s : shown.caption.simplified());
    frame().steps().setStep(hasArrived(look.phase) ? OrderStep::Done : OrderStep::Sending);
    frame().setTitle(shown.Label4Title.text);
    renderGauge();
    changeRole(m_mainActions.at(SendingButton::NewOrder), look.main == SendingButton::NewOrder ? "main" : "secondary");
    if (frontOverlay(*window()))
        return;
    // A button that hides passes the focus to its neighbour, which the second half of a double press would then press.
    // Without a main action the page itself takes the focus.
    const auto action = m_mainActions.find(look.main);
    QWidget* main = action == m_mainActions.end() ? static_cast<QWidget*>(this) : action->second;
    if (std::exchange(m_main, main) != main)
        main->setFocus(Qt::OtherFocusReason);
}

void SendingView::renderGauge() {
    static const std::map<SendingSign, Gauge::Mood> moods = {{SendingSign::Good, Gauge::Mood::Good},
                                                             {SendingSign::Held, Gauge::Mood::Held},
                                                             {SendingSign::Unclear, Gauge::Mood::Unclear},
                                                             {SendingSign::Bad, Gauge::Mood::Bad}};
    const SendingGauge gauge = m_page.gauge();
    if (const auto mood = moods.find(gauge.sign); mood != moods.end())
        m_gauge->showSign(mood->second);
    else
        m_gauge->show(gauge.share, gauge.large, gauge.small);
    m_gauge->setAccessibleName(gauge.sign == SendingSign::Percent ? gauge.large
                                                                  : m_page.sendingControls().Label4Do.text);
}

} // namespace lumora
