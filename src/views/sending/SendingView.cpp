#include "views/sending/SendingView.h"

#include "common/DrivePath.h"
#include "views/kit/Gauge.h"
#include "views/kit/Overlay.h"
#include "views/kit/PrintFan.h"
#include "views/kit/Scroller.h"

#include <QLabel>
#include <QListWidget>
#include <QProgressBar>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int codeSide = 130; // in the page's terms, with its empty edge

} // namespace

SendingView::SendingView(SendingPage& page, const SessionState& state, const Theme& theme)
    : LeftOutView(
          page, state, theme, page.sendingControls().leftOut, [&page] { page.Command4Bli_Click(); },
          [&page] { page.Command4Hazor_Click(); },
          [&page](int index, int cell) { return page.smallLeftOut(index, cell); })
    , m_page(page)
    , m_gauge(new Gauge(theme, this))
    , m_fan(new PrintFan(theme, this)) {
    page.showPrints();
    frame().steps().setStep(OrderStep::Sending);
}

void SendingView::layOut(std::initializer_list<Item> lines, std::initializer_list<Item> troubles, QLayout* side) {
    QVBoxLayout* progress =
        inColumn(Space::Small, {Item::room(), {m_gauge, 0, Qt::AlignCenter}, m_thanks, Space::Wide});
    add(*progress, lines);
    const SendingControls& shown = m_page.sendingControls();
    const Card card = makeSignedCard("success", u"tick"_s, Theme::Colour::Good);
    add(*card.column, {label(shown.cardMayGo, "strong")});
    follow(card.frame, shown.cardMayGo);
    add(*progress, {centred(label(shown.nextSteps)), centred(label(shown.slip, "strong")), card.frame, Item::room(),
                    makeLeftOutCard()});
    add(*progress, troubles);
    // On an upright page what is ordered stands above what happens to it.
    frame().content()->addLayout(across(Space::Far, {{inBox(progress), 3}, {inBox(side), 2}}, Upright::LastOnTop), 1);
}

void SendingView::makeThanks(const Caption& prompt, const Caption& whole) {
    const SendingControls& shown = m_page.sendingControls();
    m_code = new QLabel(this);
    bind(m_code, shown.slipCode);
    m_thanks = inBox(inColumn(Space::None, {centred(label(shown.thanks, "display")),
                                            Space::Normal,
                                            centred(label(prompt, "muted")),
                                            centred(label(shown.shortNumber, "giant")),
                                            centred(orderName(whole, "smallMuted")),
                                            {m_code, 0, Qt::AlignHCenter}}));
    follow(m_thanks, shown.thanks);
}

QLayout* SendingView::makeFacts() {
    const SendingControls& shown = m_page.sendingControls();
    QGridLayout* facts = inGrid(Space::Tight);
    facts->setHorizontalSpacing(theme().size(Space::Normal));
    for (int i = 0; i < mostFacts; ++i) {
        const auto at = static_cast<std::size_t>(i);
        facts->addWidget(lineLabel(shown.factName[at], "muted"), i, 0, Qt::AlignTop);
        facts->addWidget(label(shown.fact[at], "strong"), i, 1);
    }
    facts->setColumnStretch(1, 1);
    return facts;
}

QPushButton* SendingView::makeChange() {
    return button(
        m_page.sendingControls().changeOrder, Role::Secondary, [&page = m_page] { page.changeOrder_Click(); },
        u"pictures"_s);
}

QLabel* SendingView::orderName(const Caption& caption, const char* type) {
    return label(caption, type,
                 [](QString name) { return name.isEmpty() ? name : fromLeft(name.replace(u'_', u"_\u200B"_s)); });
}

QPushButton* SendingView::asMain(SendingButton action, QPushButton* button) {
    m_mainActions[action] = button;
    return button;
}

QProgressBar* SendingView::movingBar(int full) {
    auto* made = new QProgressBar(this);
    setRole(made, "moving");
    made->setRange(0, full);
    made->setTextVisible(false);
    made->setFixedWidth(theme().size(Extent::Bar));
    return made;
}

void SendingView::addLabList(QGridLayout& to, const Caption& heading, const char16_t* name, const TextList& rows,
                             std::function<void(int)> picked) {
    const Reading shown = [](const QString& item) {
        return fromLeft(item.mid(1, 2) == u":\\"_s ? LeafName(item) : item.trimmed());
    };
    QListWidget* made = picked ? list(rows, std::move(picked), shown) : listing(rows, shown);
    setRole(made, "lab");
    made->setLayoutDirection(Qt::LeftToRight);
    made->setMinimumHeight(theme().px(LabBoxHeight));
    bindList(QString::fromUtf16(name), rows, made, shown);
    QLabel* title = lineLabel(heading, "smallMuted");
    title->setBuddy(made);
    m_headed.emplace_back(&heading, made);
    const int column = to.columnCount() - (to.count() == 0 ? 1 : 0);
    to.addWidget(title, 0, column);
    to.addWidget(made, 1, column);
    to.setColumnStretch(column, 1);
    to.setRowStretch(1, 1);
}

Overlay* SendingView::makeLabPanel(std::initializer_list<Item> parts, QPushButton* close) {
    QScrollArea* scroll =
        inScroller(inBox(inRow(Space::None, {{inColumn(Space::Normal, parts), 1}, Space::Normal})), this);
    scroll->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    auto* panel = new Overlay(theme(), this, {{scroll, 1}});
    panel->setFilling();
    panel->addButton(close);
    return panel;
}

QLayout* SendingView::makeReporting() {
    const SendingControls& shown = m_page.sendingControls();
    QPushButton* again = button(
        shown.Command4Dooach, Role::Plain, [&page = m_page] { page.Command4Dooach_Click(); }, u"resend"_s);
    return inRow(
        Space::Small,
        {again, {inColumn(Space::None, {label(shown.Label4Dooach, "small"), label(shown.Label4Hokhaha, "small")}), 1}});
}

void SendingView::bindLists(const std::vector<std::pair<const char16_t*, const TextList*>>& lists) {
    for (const auto& [name, list] : lists) {
        if (!control(QString::fromUtf16(name)))
            bindList(QString::fromUtf16(name), *list);
    }
}

void SendingView::render() {
    LeftOutView::render();
    const SendingControls& shown = m_page.sendingControls();
    const PhaseLook& look = m_page.look();
    window()->setWindowTitle(shown.caption.trimmed().isEmpty() ? u"Lumora"_s : shown.caption.simplified());
    frame().steps().setStep(hasArrived(look.phase) ? OrderStep::Done : OrderStep::Sending);
    frame().setTitle(shown.Label4Title.text);
    renderGauge();
    renderPrints();
    renderCode();
    for (const auto& [heading, list] : m_headed)
        speak(list, heading->text);
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

void SendingView::renderPrints() {
    std::vector<QImage> prints;
    for (const Bitmap& print : m_page.prints())
        prints.push_back(print.image());
    m_fan->setPrints(std::move(prints));
    m_fan->setVisible(hasOrder(m_page.phase()));
    m_fan->setAccessibleName(wording(u"התמונות הראשונות בהזמנה"_s, u"The first pictures of the order"_s));
}

// Whole pixels for each module, so that a camera reads it.
void SendingView::renderCode() {
    if (!m_page.sendingControls().slipCode.visible || !m_code->pixmap(Qt::ReturnByValue).isNull())
        return; // it does not change
    const QImage code = m_page.slipCode().image();
    if (code.isNull())
        return;
    const int side = code.width() * std::max(theme().px(codeSide) / code.width(), 2);
    m_code->setPixmap(QPixmap::fromImage(code.scaled(side, side)));
}

void SendingView::renderGauge() {
    m_gauge->setVisible(!m_page.sendingControls().thanks.visible);
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
