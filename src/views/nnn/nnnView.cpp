#include "views/nnn/nnnView.h"

#include "entry/details/TileMenu.h"
#include "views/kit/Cards.h"
#include "views/kit/Overlay.h"
#include "views/nnn/nnnViewAlbum.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QStackedLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

nnnView::nnnView(nnn& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    frame().steps().setStep(OrderStep::Details);
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
    frame().content()->addWidget(content, 1);
    makeBars();
    bindHidden(u"Title"_s, page.Title);
    bindHidden(u"StepLine"_s, page.StepLine);
    bindHidden(u"Label2"_s, page.Label2);
    bindHidden(u"Label3"_s, page.Label3);
    bindHidden(u"Label8"_s, page.Label8);
    bindHidden(u"Image4"_s, page.Image4);
    m_focusRequest = page.focusRequest;
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
        bind(numbered("Image1", static_cast<std::size_t>(i)), tile, m_page.Image1[static_cast<std::size_t>(i)]);
        m_tiles[static_cast<std::size_t>(i)] = tile;
    }
    return menu;
}

void nnnView::placeTiles() {
    QList<int> wanted;
    for (int i = 0; i < 10; ++i) {
        if (m_tiles[static_cast<std::size_t>(i)] && m_page.Image1[static_cast<std::size_t>(i)].visible)
            wanted += i;
    }
    if (wanted == m_placed)
        return;
    m_placed = wanted;
    for (Tile* tile : m_tiles) {
        if (tile)
            m_tileGrid->removeWidget(tile);
    }
    const int columns = wanted.size() <= 4 ? 2 : 3;
    for (int i = 0; i < wanted.size(); ++i)
        m_tileGrid->addWidget(m_tiles[static_cast<std::size_t>(wanted[i])], i / columns, i % columns);
}

QWidget* nnnView::makeDetails() {
    const Card form = makeCard("card", Pad::Wide, Space::Tight);
    form.frame->setMinimumWidth(theme().px(720));
    const auto line = [&](const QString& name, const Caption& caption, const QString& labelName,
                          const Caption& labelCaption, void (nnn::*changed)(const QString&)) {
        QLabel* title = label(labelName, labelCaption, "strong");
        QLineEdit* box = field(name, caption, toPage(changed));
        box->setMaxLength(200);
        title->setBuddy(box);
        add(*form.column, {title, box, Space::Small});
        return box;
    };
    m_name = line(u"Text2"_s, m_page.Text2, u"LabelText2"_s, m_page.LabelText2, &nnn::Text2_Change);
    m_telephone = line(u"Text3"_s, m_page.Text3, u"LabelText3"_s, m_page.LabelText3, &nnn::Text3_Change);
    m_telephone->setInputMethodHints(Qt::ImhDialableCharactersOnly);
    m_address = line(u"Text4"_s, m_page.Text4, u"LabelText4"_s, m_page.LabelText4, &nnn::Text4_Change);
    form.column->addLayout(inRow(
        Space::Normal, {checkBox(u"Check2"_s, m_page.Check2, toPage(&nnn::Check2_Click)), Item::room(),
                        button(u"Command10"_s, m_page.Command10, Role::Plain, &nnn::Command10_Click, u"memory"_s)}));
    return inMiddle(inBox(inColumn(Space::None, {form.frame, Item::room()})), 4);
}

QWidget* nnnView::makeOptions() {
    auto* sizes = inRow(Space::Wide);
    for (std::size_t i = 0; i < m_page.Option1.size(); ++i) {
        const auto paper = [](QPainter& painter, const QRectF& place, const QString& size) {
            drawPaperSample(painter, place, size);
        };
        auto* card = new DrawingCard(theme(), this, paper, {190, 200}, DrawingCard::Words::Size);
        bindChoice(numbered("Option1", i), card, m_page.Option1[i],
                   [this, i] { m_page.Option1_Click(static_cast<int>(i)); });
        sizes->addWidget(card, 2);
    }
    m_moreSizes = comboBox(u"Combo1"_s, m_page.Combo1List, m_page.Combo1, toPage(&nnn::Combo1_Click));
    m_moreSizes->setMinimumWidth(theme().px(220));
    sizes->addLayout(inColumn(Space::Normal, {Item::room(), m_moreSizes,
                                              label(u"Label4kpn"_s, m_page.Label4kpn, "muted"), Item::room()}),
                     2);
    auto* kinds = inRow(Space::Wide);
    for (std::size_t i = 0; i < m_page.Option3.size(); ++i) {
        auto* card = new DrawingCard(theme(), this,
                                     [finish = i == 0 ? PaperFinish::Matte : PaperFinish::Glossy](
                                         QPainter& painter, const QRectF& place, const QString&) {
                                         const QRectF paper = fitted(place, {3, 2});
                                         drawSamplePrint(painter, paper, finish);
                                         drawThinLine(painter, paper);
                                     },
                                     {260, 165});
        bindChoice(numbered("Option3", i), card, m_page.Option3[i],
                   [this, i] { m_page.Option3_Click(static_cast<int>(i)); });
        kinds->addWidget(card, 2);
    }
    kinds->addStretch(2);
    QWidget* step = inBox(inColumn(Space::Small, {label(u"LabelSizes"_s, m_page.LabelSizes, "large"),
                                                  {sizes, 3},
                                                  Space::Tight,
                                                  label(u"LabelKinds"_s, m_page.LabelKinds, "large"),
                                                  {kinds, 2}}));
    bind(u"Frame4"_s, new QWidget(step), m_page.Frame4);
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
        bindChoice(numbered("Image13", at), card, m_page.Image13[at], [this, i] { m_page.Image13_MouseDown(i); });
        grid->addWidget(card, i / 4, i % 4);
    }
    const Card preview = makeCard("card", Pad::Normal);
    m_sample = new BorderSample(preview.frame);
    m_sample->setMinimumSize(theme().px(240), theme().px(200));
    bind(u"Picture16"_s, m_sample, [this] { return QString::number(m_page.Picture16); });
    m_sampleName = words("strong");
    m_sampleName->setAlignment(Qt::AlignCenter);
    add(*preview.column, {{m_sample, 1}, m_sampleName});
    QWidget* step = inBox(inRow(Space::Far, {{grid, 3}, {preview.frame, 1}}));
    bind(u"Picture4"_s, new QWidget(step), m_page.Picture4);
    return step;
}

QWidget* nnnView::makeFit() {
    // Whole on the paper, or over all of it.
    const auto card = [&](const QString& name, const CheckCaption& caption, QSizeF shape, void (nnn::*clicked)()) {
        auto* made = new DrawingCard(theme(), this,
                                     [shape](QPainter& painter, const QRectF& place, const QString&) {
                                         const QRectF paper = fitted(place, {3, 2});
                                         painter.fillRect(paper, Qt::white);
                                         drawSamplePicture(painter, fitted(paper, shape));
                                         drawThinLine(painter, paper);
                                     },
                                     {320, 300});
        bindChoice(name, made, caption, toPage(clicked));
        return made;
    };
    QWidget* step =
        inBox(inRow(Space::Far, {Item::room(),
                                 {card(u"Option4"_s, m_page.Option4, {4, 3}, &nnn::Option4_Click), 2, Qt::AlignVCenter},
                                 {card(u"Option5"_s, m_page.Option5, {3, 2}, &nnn::Option5_Click), 2, Qt::AlignVCenter},
                                 Item::room()}));
    bind(u"Picture5"_s, new QWidget(step), m_page.Picture5);
    return step;
}

QWidget* nnnView::makeTerms() {
    const Card summary = makeCard("card", Pad::Wide);
    m_chosenHead = words("muted");
    m_chosen = words("large");
    add(*summary.column, {m_chosenHead, m_chosen});
    const Card terms = makeCard("card", Pad::Wide);
    terms.frame->setMinimumWidth(theme().px(640));
    m_termsHead = words("muted");
    QLayout* row = inRow(Space::Normal,
                         {checkBox(u"Check1"_s, m_page.Check1, toPage(&nnn::Check1_Click)), Item::room(),
                          button(u"Command29"_s, m_page.Command29, Role::Plain, &nnn::Command29_Click, u"document"_s)});
    const Card hint = makeCard("notice", Pad::Slim);
    m_hint = hint.frame;
    hint.column->addLayout(inRow(
        Space::Normal, {{label(u"LabelTerms"_s, m_page.LabelTerms), 1},
                        button(u"Command30"_s, m_page.Command30, Role::Quiet, &nnn::Command30_Click, u"close"_s)}));
    add(*terms.column, {m_termsHead, row, m_hint});
    return inMiddle(inBox(inColumn(Space::Wide, {summary.frame, terms.frame, Item::room()})), 4);
}

void nnnView::makeBars() {
    frame().addHeaderActions(
        {button(u"Image1(8)"_s, m_page.Image1[EnglishTile], Role::Quiet, &nnn::Image1_Click, EnglishTile, u"globe"_s),
         button(u"Image1(5)"_s, m_page.Image1[ExitTile], Role::Quiet, &nnn::Image1_Click, ExitTile, u"exit"_s)});
    m_back = button(u"Command4"_s, m_page.Command4, Role::Secondary, &nnn::Command4_Click);
    frame().addSecondaryActions(
        {m_back, button(u"Command2"_s, m_page.Command2, Role::Quiet, &nnn::Command2_Click),
         button(u"Command15"_s, m_page.Command15, Role::Secondary, &nnn::Command15_Click, u"info"_s),
         button(u"Command14"_s, m_page.Command14, Role::Secondary, &nnn::Command14_Click, u"eraser"_s)});
    m_choiceStatus = label(u"Choice"_s, m_page.Choice, "strong");
    QLabel* telephone = label(u"Label4Tel"_s, m_page.Label4Tel, "muted");
    for (QLabel* line : {m_choiceStatus, telephone})
        line->setWordWrap(false);
    frame().addStatus({m_choiceStatus, sign(u"phone"_s, IconSize::Small), telephone});
    frame().addMainActions({button(u"Command12"_s, m_page.Command12, Role::Main, &nnn::Command12_Click),
                            button(u"Command8"_s, m_page.Command8, Role::Main, &nnn::Command8_Click),
                            button(u"Command6"_s, m_page.Command6, Role::Main, &nnn::Command6_Click),
                            button(u"Command3"_s, m_page.Command3, Role::Main, &nnn::Command3_Click)});
    for (QPushButton* main : m_album->mainButtons())
        frame().addMainAction(main);

    m_clean = new Overlay(theme(), this);
    m_clean->column()->addWidget(label(u"Frame1"_s, m_page.Frame1, "large"));
    m_clean->addButtons(button(u"Command9"_s, m_page.Command9, Role::Secondary, &nnn::Command9_Click),
                        button(u"Command7"_s, m_page.Command7, Role::Main, &nnn::Command7_Click), Overlay::First::Back);
    m_clean->whenEscaped(toPage(&nnn::Command9_Click));
}

QWidget* nnnView::firstFocus() const {
    switch (m_page.step) {
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
    if (m_page.Command4.visible && m_page.Command4.enabled)
        m_page.Command4_Click();
}

void nnnView::render() {
    frame().setTitle(m_page.Title.text, m_page.StepLine.visible ? m_page.StepLine.text : QString());
    for (std::size_t i = 0; i < m_tiles.size(); ++i) {
        if (!m_tiles[i])
            continue;
        m_tiles[i]->setExplanation(m_page.Image1[i].hint);
        m_tiles[i]->setToolTip({});
        m_tiles[i]->setMarked(m_page.markedTile == static_cast<int>(i));
    }
    placeTiles();
    speak(m_name, m_page.LabelText2.text);
    speak(m_telephone, m_page.LabelText3.text);
    speak(m_address, m_page.LabelText4.text);
    speak(m_moreSizes, wording(u"גדלים נוספים"_s, u"More sizes"_s));
    if (m_address->property("wanted").toBool() != m_page.Text4Calls) {
        m_address->setProperty("wanted", m_page.Text4Calls);
        m_address->setStyleSheet(m_address->styleSheet()); // the look follows the property only when it is set anew
    }
    const int border = m_page.Picture16;
    m_sample->setCode(borderCode(std::max(border, 0)));
    m_sampleName->setText(border >= 0 && border < 10 ? m_page.Image13[static_cast<std::size_t>(border)].text
                                                     : wording(u"עדיין לא נבחרה מסגרת"_s, u"No border chosen yet"_s));
    speak(m_sample, m_sampleName->text());
    m_hint->setVisible(m_page.LabelTerms.visible);
    m_termsHead->setText(wording(u"לפני שממשיכים"_s, u"Before going on"_s));
    m_chosenHead->setText(wording(u"מה שבחרת"_s, u"What you chose"_s));
    m_chosen->setText(isolated(m_page.Choice.text));
    if (m_page.step == nnn::Step::Terms)
        m_choiceStatus->hide();
    setDirectedIcon(m_back, Way::Back);
    const bool moved = m_shownStep != m_page.step;
    m_shownStep = m_page.step;
    m_steps->setCurrentIndex(static_cast<int>(m_page.step));
    m_album->render();
    m_clean->setOpen(m_page.Frame1.visible);
    if (m_focusRequest != m_page.focusRequest) {
        m_focusRequest = m_page.focusRequest;
        if (auto* box = findChild<QWidget*>(m_page.focusBox))
            giveFocus(*box);
    } else if (moved && !m_clean->isOpen()) {
        if (QWidget* first = firstFocus())
            giveFocus(*first);
    }
}

} // namespace lumora
