#include "views/nnn/nnnView.h"

#include "common/PaperSize.h"
#include "entry/details/TileMenu.h"
#include "views/kit/CardButtons.h"
#include "views/kit/Overlay.h"
#include "views/nnn/PaperBesideHand.h"
#include "views/nnn/nnnViewAlbum.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QStackedLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Empty for a text that is no size.
QSizeF lyingPaper(const QString& text) {
    const PaperSize sides = PaperSize::ofText(text.trimmed()).value_or(PaperSize());
    return QSizeF(std::max(sides.shortSide, sides.longSide), std::min(sides.shortSide, sides.longSide));
}

} // namespace

nnnView::nnnView(nnn& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    frame().steps().setStep(OrderStep::Details);
    // The tab order is the order in which the controls are made.
    makeHeader();
    auto* content = new QWidget(this);
    m_steps = new QStackedLayout(content);
    // In the order of nnn::Step.
    m_steps->addWidget(makeMenu());
    m_steps->addWidget(makeDetails());
    m_steps->addWidget(makeOptions());
    m_steps->addWidget(makeBorders());
    m_steps->addWidget(makeFit());
    m_steps->addWidget(makeTerms());
    m_album = std::make_unique<Album>(*this);
    m_steps->addWidget(m_album->widget());
    for (int i = 0; i < m_steps->count(); ++i)
        changesSight(*m_steps->widget(i));
    frame().content()->addWidget(content, 1);
    makeBars();
    m_focusRequest = page.focus().request;
    start();
}

nnnView::~nnnView() = default;

QWidget* nnnView::makeMenu() {
    m_tileGrid = inGrid(Space::Wide);
    QWidget* menu = inBox(m_tileGrid);
    static constexpr std::array<const char*, 10> icons = {"printer", "bolt", "layers", "arrow-left", "mail",
                                                          "exit",    "book", "resend", "globe",      "info"};
    for (int i = 0; i < 10; ++i) {
        if (i == ExitTile || i == EnglishTile)
            continue; // leaving and the language stand in the header
        auto* tile = new Tile(theme(), this, QString::fromLatin1(icons[static_cast<std::size_t>(i)]));
        connect(tile, &QAbstractButton::clicked, this, [this, i] { m_page.Image1_Click(i); });
        bind(tile, c.Image1[static_cast<std::size_t>(i)]);
        m_tiles[static_cast<std::size_t>(i)] = tile;
    }
    return menu;
}

void nnnView::placeTiles() {
    QList<int> wanted;
    for (int i = 0; i < 10; ++i) {
        if (m_tiles[static_cast<std::size_t>(i)] && c.Image1[static_cast<std::size_t>(i)].visible)
            wanted += i;
    }
    if (wanted == m_placed)
        return;
    m_placed = wanted;
    for (Tile* tile : m_tiles) {
        if (tile)
            m_tileGrid->removeWidget(tile);
    }
    const int columns = theme().isTall() ? (wanted.size() <= 5 ? 1 : 2) : wanted.size() <= 4 ? 2 : 3;
    for (int i = 0; i < wanted.size(); ++i)
        m_tileGrid->addWidget(m_tiles[static_cast<std::size_t>(wanted[i])], i / columns, i % columns);
}

QWidget* nnnView::makeDetails() {
    const Card form = makeCard("card", Pad::Wide, Space::Tight);
    form.frame->setMinimumWidth(theme().size(Extent::Form));
    const auto line = [&](const Caption& caption, const Caption& head, void (nnn::*changed)(const QString&)) {
        QLabel* title = label(head, "strong");
        QLineEdit* box = field(caption, toPage(changed));
        box->setMaxLength(200);
        title->setBuddy(box);
        add(*form.column, {title, box, Space::Small});
        return box;
    };
    m_name = line(c.Text2, c.LabelText2, &nnn::Text2_Change);
    m_telephone = line(c.Text3, c.LabelText3, &nnn::Text3_Change);
    m_telephone->setInputMethodHints(Qt::ImhDialableCharactersOnly);
    m_address = line(c.Text4, c.LabelText4, &nnn::Text4_Change);
    form.column->addLayout(
        inRow(Space::Normal, {checkBox(c.Check2, toPage(&nnn::Check2_Click)), Item::room(),
                              button(c.Command10, Role::Plain, &nnn::Command10_Click, u"memory"_s)}));
    return inMiddle(inBox(inColumn(Space::None, {Item::room(theme().isTall() ? 1 : 0), form.frame, Item::room(2)})), 4);
}

QWidget* nnnView::makeOptions() {
    auto* sizes = inRow(Space::Wide);
    for (std::size_t i = 0; i < c.Option1.size(); ++i) {
        const auto paper = [this, i](QPainter& painter, const QRectF& place, const QString&) {
            QSizeF largest;
            for (const CheckCaption& size : c.Option1)
                largest = size.visible ? largest.expandedTo(lyingPaper(size.text)) : largest;
            if (const QSizeF own = lyingPaper(c.Option1[i].text); !own.isEmpty())
                drawPaperBesideHand(painter, place, own, largest);
        };
        auto* card = new DrawingCard(theme(), this, paper, {190, 200}, DrawingCard::Words::Size);
        m_sizes[i] = card;
        bindChoice(card, c.Option1[i], [this, i] { m_page.Option1_Click(static_cast<int>(i)); });
        sizes->addWidget(card, 2);
    }
    m_moreSizes = comboBox(c.Combo1.rows, c.Combo1, toPage(&nnn::Combo1_Click));
    m_moreSizes->setMinimumWidth(theme().size(Extent::WideField));
    QLabel* coupon = label(c.Label4kpn, "muted");
    if (!theme().isTall())
        sizes->addLayout(inColumn(Space::Normal, {Item::room(), m_moreSizes, coupon, Item::room()}), 2);
    auto* kinds = inRow(Space::Wide);
    for (std::size_t i = 0; i < c.Option3.size(); ++i) {
        auto* card = new DrawingCard(theme(), this,
                                     [finish = i == 0 ? PaperFinish::Matte : PaperFinish::Glossy](
                                         QPainter& painter, const QRectF& place, const QString&) {
                                         const QRectF paper = fitted(place, {3, 2});
                                         drawSamplePrint(painter, paper, finish);
                                         drawThinLine(painter, paper);
                                     },
                                     {260, 165});
        bindChoice(card, c.Option3[i], [this, i] { m_page.Option3_Click(static_cast<int>(i)); });
        kinds->addWidget(card, 2);
    }
    if (!theme().isTall())
        kinds->addStretch(2);
    QVBoxLayout* column = inColumn(Space::Small, {label(c.LabelSizes, "large"), {sizes, 3}});
    if (theme().isTall())
        column->addLayout(inRow(Space::Wide, {m_moreSizes, {coupon, 1}}));
    add(*column, {Space::Tight, label(c.LabelKinds, "large"), {kinds, 2}});
    QWidget* step = inBox(column);
    bind(new QWidget(step), c.Frame4);
    return step;
}

QWidget* nnnView::makeBorders() {
    auto* grid = inGrid(Space::Normal);
    for (int i = 0; i < 10; ++i) {
        const auto at = static_cast<std::size_t>(i);
        auto* card = new DrawingCard(
            theme(), this,
            [code = borderCode(i)](QPainter& painter, const QRectF& place, const QString&) {
                drawBorderSample(painter, place, code);
            },
            {150, 140}, DrawingCard::Words::Small);
        bindChoice(card, c.Image13[at], [this, i] { m_page.Image13_MouseDown(i); });
        const int columns = theme().isTall() ? 3 : 4;
        grid->addWidget(card, i / columns, i % columns);
    }
    const Card preview = makeCard("card", Pad::Normal);
    m_sample = new BorderSample(preview.frame);
    m_sample->setMinimumSize(theme().size(Extent::WideField), theme().size(Extent::Field));
    bind(u"Picture16"_s, m_sample, [this] { return QString::number(c.Picture16); });
    add(*preview.column, {{m_sample, 1}, centred(label(c.LabelPicture16, "strong"))});
    QWidget* step = inBox(across(Space::Far, {{grid, 3}, {preview.frame, 1}}, Upright::LastOnTop));
    bind(new QWidget(step), c.Picture4);
    return step;
}

QWidget* nnnView::makeFit() {
    // Fit shows the whole picture on the paper; fill covers the whole paper.
    const auto card = [&](const CheckCaption& caption, QSizeF shape, void (nnn::*clicked)()) {
        auto* made = new DrawingCard(theme(), this,
                                     [shape](QPainter& painter, const QRectF& place, const QString&) {
                                         const QRectF paper = fitted(place, {3, 2});
                                         painter.fillRect(paper, Qt::white);
                                         drawSamplePicture(painter, fitted(paper, shape));
                                         drawThinLine(painter, paper);
                                     },
                                     {320, 300});
        bindChoice(made, caption, toPage(clicked));
        return made;
    };
    const Qt::Alignment middle = theme().isTall() ? Qt::Alignment() : Qt::AlignVCenter;
    QWidget* step = inBox(across(Space::Far, {Item::room(),
                                              {card(c.Option4, {4, 3}, &nnn::Option4_Click), 2, middle},
                                              {card(c.Option5, {3, 2}, &nnn::Option5_Click), 2, middle},
                                              Item::room()}));
    bind(new QWidget(step), c.Picture5);
    return step;
}

QWidget* nnnView::makeTerms() {
    const Card summary = makeCard("card", Pad::Wide);
    m_chosen = words("large");
    add(*summary.column, {label(c.LabelChoice, "muted"), m_chosen});
    const Card terms = makeCard("card", Pad::Wide);
    terms.frame->setMinimumWidth(theme().size(Extent::Form));
    follow(terms.frame, c.Check1);
    QLayout* row = inRow(Space::Normal, {checkBox(c.Check1, toPage(&nnn::Check1_Click)), Item::room(),
                                         button(c.Command29, Role::Plain, &nnn::Command29_Click, u"document"_s)});
    const Card hint = makeCard("notice", Pad::Slim);
    m_hint = hint.frame;
    hint.column->addLayout(inRow(Space::Normal, {{label(c.LabelTerms), 1},
                                                 button(c.Command30, Role::Quiet, &nnn::Command30_Click, u"close"_s)}));
    add(*terms.column, {label(c.LabelCheck1, "muted"), row, m_hint});
    return inMiddle(
        inBox(inColumn(Space::Wide, {Item::room(theme().isTall() ? 1 : 0), summary.frame, terms.frame, Item::room(2)})),
        4);
}

void nnnView::makeHeader() {
    QPushButton* hebrew = button(c.Command4Ivrit, Role::Quiet, &nnn::Command4Ivrit_Click, u"globe"_s);
    hebrew->setProperty("letterOfAnyLanguage", true);
    frame().addHeaderActions({button(c.Image1[EnglishTile], Role::Quiet, &nnn::Image1_Click, EnglishTile, u"globe"_s),
                              button(c.Command4Anglit, Role::Quiet, &nnn::Command4Anglit_Click, u"globe"_s), hebrew,
                              button(c.Image1[ExitTile], Role::Quiet, &nnn::Image1_Click, ExitTile, u"exit"_s)});
}

void nnnView::makeBars() {
    m_back = button(c.Command4, Role::Secondary, &nnn::Command4_Click);
    frame().addSecondaryActions({m_back, button(c.Command2, Role::Quiet, &nnn::Command2_Click),
                                 button(c.Command15, Role::Secondary, &nnn::Command15_Click, u"info"_s),
                                 button(c.Command14, Role::Secondary, &nnn::Command14_Click, u"eraser"_s)});
    frame().addStatus({label(c.Choice, "strong"), sign(u"phone"_s, IconSize::Small), lineLabel(c.Label4Tel, "muted")});
    frame().addMainActions(
        {button(c.Command12, Role::Main, &nnn::Command12_Click), button(c.Command8, Role::Main, &nnn::Command8_Click),
         button(c.Command6, Role::Main, &nnn::Command6_Click), button(c.Command3, Role::Main, &nnn::Command3_Click)});
    for (QPushButton* main : m_album->makeMainButtons())
        frame().addMainAction(main);

    m_clean = new Overlay(theme(), this, {label(c.Frame1, "large")});
    m_clean->addButtons(button(c.Command9, Role::Secondary, &nnn::Command9_Click),
                        button(c.Command7, Role::Main, &nnn::Command7_Click), Overlay::First::Back);
    m_clean->whenEscaped(toPage(&nnn::Command9_Click));
}

QWidget* nnnView::firstFocus() const {
    switch (m_page.step()) {
    case nnn::Step::Menu:
        return m_placed.isEmpty() ? nullptr
                                  : static_cast<QWidget*>(m_tiles[static_cast<std::size_t>(m_placed.first())]);
    case nnn::Step::Details:
        return m_name;
    case nnn::Step::Options:
        return findChild<QWidget*>(u"Option1(0)"_s);
    case nnn::Step::Border:
        return findChild<QWidget*>(u"Image13(0)"_s);
    case nnn::Step::Fit:
        return findChild<QWidget*>(u"Option4"_s);
    case nnn::Step::Terms:
        return findChild<QWidget*>(u"Check1"_s);
    case nnn::Step::Album:
        return m_album->firstFocus();
    }
    return nullptr;
}

void nnnView::escape() {
    m_page.Command4_Click();
}

bool nnnView::leave() {
    m_page.Image1_Click(ExitTile);
    return true;
}

void nnnView::render() {
    frame().setTitle(c.Title.text);
    frame().steps().setStep(OrderStep::Details, c.stepShare);
    for (std::size_t i = 0; i < m_tiles.size(); ++i) {
        if (!m_tiles[i])
            continue;
        m_tiles[i]->setExplanation(c.Image1[i].hint);
        m_tiles[i]->setToolTip({});
        m_tiles[i]->setMarked(c.markedTile == static_cast<int>(i));
    }
    placeTiles();
    for (std::size_t i = 0; i < m_sizes.size(); ++i) {
        // The card draws its words from left to right.
        m_sizes[i]->setText(state().english() ? c.Option1[i].hint
                                              : QChar(0x2067) + isolated(c.Option1[i].hint) + QChar(0x2069));
        m_sizes[i]->setToolTip({});
        speak(m_sizes[i], c.Option1[i].hint);
    }
    speak(m_name, c.LabelText2.text);
    speak(m_telephone, c.LabelText3.text);
    speak(m_address, c.LabelText4.text);
    speak(m_moreSizes, c.LabelCombo1.text);
    changeLook(m_address, "wanted", c.Text4Calls);
    m_sample->setCode(borderCode(std::max(c.Picture16, 0)));
    speak(m_sample, c.LabelPicture16.text);
    m_hint->setVisible(c.LabelTerms.visible);
    m_chosen->setText(isolated(c.Choice.text));
    setDirectedIcon(m_back, Way::Back);
    const bool moved = m_shownStep != m_page.step();
    m_shownStep = m_page.step();
    m_steps->setCurrentIndex(static_cast<int>(m_page.step()));
    m_album->render();
    m_clean->setOpen(c.Frame1.visible);
    if (m_focusRequest != m_page.focus().request) {
        m_focusRequest = m_page.focus().request;
        if (auto* box = findChild<QWidget*>(m_page.focus().control))
            giveFocus(*box);
    } else if (moved && !m_clean->isOpen()) {
        if (QWidget* first = firstFocus())
            giveFocus(*first);
    }
}

} // namespace lumora
