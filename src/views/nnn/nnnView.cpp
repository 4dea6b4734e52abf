#include "views/nnn/nnnView.h"

#include "entry/details/TileMenu.h"
#include "views/kit/Cards.h"
#include "views/kit/Overlay.h"
#include "views/nnn/nnnViewAlbum.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QStackedLayout>
#include <QVBoxLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

nnnView::nnnView(nnn& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page) {
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
    auto* menu = new QWidget(this);
    m_tileGrid = new QGridLayout(menu);
    m_tileGrid->setContentsMargins(0, 0, 0, 0);
    m_tileGrid->setSpacing(theme().px(18));
    static constexpr std::array<const char*, 10> icons = {"printer", "bolt", "layers", "arrow-left", "mail",
                                                          "exit",    "book", "resend", "globe",      "info"};
    for (int i = 0; i < 10; ++i) {
        if (i == ExitTile || i == EnglishTile)
            continue; // leaving and the language stand in the header
        auto* tile = new Tile(theme(), this, QString::fromLatin1(icons[static_cast<std::size_t>(i)]));
        connect(tile, &QAbstractButton::clicked, this, [this, i] { m_page.Image1_Click(i); });
        bind(u"Image1(%1)"_s.arg(i), tile, m_page.Image1[static_cast<std::size_t>(i)]);
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
    auto* step = new QWidget(this);
    auto* outer = new QHBoxLayout(step);
    outer->setContentsMargins(0, 0, 0, 0);
    outer->addStretch(1);
    auto* card = new QFrame(step);
    setRole(card, "card");
    card->setMinimumWidth(theme().px(720));
    auto* form = new QVBoxLayout(card);
    form->setContentsMargins(theme().px(32), theme().px(24), theme().px(32), theme().px(24));
    form->setSpacing(theme().px(6));
    const auto line = [&](const QString& name, const Caption& caption, const QString& labelName,
                          const Caption& labelCaption, void (nnn::*changed)(const QString&)) {
        auto* title = label(labelName, labelCaption, "strong");
        form->addWidget(title);
        auto* box = field(name, caption, [&page = m_page, changed](const QString& text) { (page.*changed)(text); });
        box->setMaxLength(200);
        title->setBuddy(box);
        form->addWidget(box);
        form->addSpacing(theme().px(10));
        return box;
    };
    m_name = line(u"Text2"_s, m_page.Text2, u"LabelText2"_s, m_page.LabelText2, &nnn::Text2_Change);
    m_telephone = line(u"Text3"_s, m_page.Text3, u"LabelText3"_s, m_page.LabelText3, &nnn::Text3_Change);
    m_telephone->setInputMethodHints(Qt::ImhDialableCharactersOnly);
    m_address = line(u"Text4"_s, m_page.Text4, u"LabelText4"_s, m_page.LabelText4, &nnn::Text4_Change);
    auto* row = new QHBoxLayout;
    row->addWidget(checkBox(u"Check2"_s, m_page.Check2, [this](bool on) { m_page.Check2_Click(on); }));
    row->addStretch(1);
    row->addWidget(button(
        u"Command10"_s, m_page.Command10, Role::Plain, [this] { m_page.Command10_Click(); }, u"memory"_s));
    form->addLayout(row);
    auto* centred = new QVBoxLayout;
    centred->addWidget(card);
    centred->addStretch(1);
    outer->addLayout(centred, 4);
    outer->addStretch(1);
    return step;
}

QWidget* nnnView::makeOptions() {
    auto* step = new QWidget(this);
    auto* column = new QVBoxLayout(step);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme().px(10));
    column->addWidget(label(u"LabelSizes"_s, m_page.LabelSizes, "large"));
    auto* sizes = new QHBoxLayout;
    sizes->setSpacing(theme().px(16));
    for (std::size_t i = 0; i < m_page.Option1.size(); ++i) {
        auto* card = new PaperCard(theme(), this);
        card->setCardSize(190, 200);
        bindChoice(u"Option1(%1)"_s.arg(i), card, m_page.Option1[i],
                   [this, i] { m_page.Option1_Click(static_cast<int>(i)); });
        sizes->addWidget(card, 2);
    }
    auto* more = new QVBoxLayout;
    more->addStretch(1);
    m_moreSizes =
        comboBox(u"Combo1"_s, m_page.Combo1List, m_page.Combo1, [this](int row) { m_page.Combo1_Click(row); });
    m_moreSizes->setMinimumWidth(theme().px(220));
    more->addWidget(m_moreSizes);
    m_coupon = label(u"Label4kpn"_s, m_page.Label4kpn, "muted");
    more->addWidget(m_coupon);
    more->addStretch(1);
    sizes->addLayout(more, 2);
    column->addLayout(sizes, 3);
    column->addSpacing(theme().px(6));
    column->addWidget(label(u"LabelKinds"_s, m_page.LabelKinds, "large"));
    auto* kinds = new QHBoxLayout;
    kinds->setSpacing(theme().px(16));
    for (std::size_t i = 0; i < m_page.Option3.size(); ++i) {
        auto* card =
            new DrawingCard(theme(), this, i == 0 ? DrawingCard::Drawing::Matte : DrawingCard::Drawing::Glossy);
        card->setCardSize(260, 165);
        bindChoice(u"Option3(%1)"_s.arg(i), card, m_page.Option3[i],
                   [this, i] { m_page.Option3_Click(static_cast<int>(i)); });
        kinds->addWidget(card, 2);
    }
    kinds->addStretch(2);
    column->addLayout(kinds, 2);
    bind(u"Frame4"_s, new QWidget(step), m_page.Frame4);
    return step;
}

QWidget* nnnView::makeBorders() {
    auto* step = new QWidget(this);
    auto* row = new QHBoxLayout(step);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme().px(24));
    auto* grid = new QGridLayout;
    grid->setSpacing(theme().px(12));
    for (int i = 0; i < 10; ++i) {
        const auto at = static_cast<std::size_t>(i);
        auto* card = new BorderCard(theme(), this, borderCode(i));
        bindChoice(u"Image13(%1)"_s.arg(i), card, m_page.Image13[at], [this, i] { m_page.Image13_MouseDown(i); });
        grid->addWidget(card, i / 4, i % 4);
    }
    row->addLayout(grid, 3);
    auto* preview = new QFrame(step);
    setRole(preview, "card");
    auto* previewColumn = new QVBoxLayout(preview);
    previewColumn->setContentsMargins(theme().px(16), theme().px(16), theme().px(16), theme().px(16));
    m_sample = new BorderSample(preview);
    m_sample->setMinimumSize(theme().px(240), theme().px(200));
    bind(u"Picture16"_s, m_sample, [this] { return QString::number(m_page.Picture16); });
    previewColumn->addWidget(m_sample, 1);
    m_sampleName = makeLabel(preview, "strong");
    m_sampleName->setAlignment(Qt::AlignCenter);
    previewColumn->addWidget(m_sampleName);
    row->addWidget(preview, 1);
    bind(u"Picture4"_s, new QWidget(step), m_page.Picture4);
    return step;
}

QWidget* nnnView::makeFit() {
    auto* step = new QWidget(this);
    auto* row = new QHBoxLayout(step);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme().px(24));
    row->addStretch(1);
    auto* fit = new DrawingCard(theme(), this, DrawingCard::Drawing::Fit);
    fit->setCardSize(320, 300);
    bindChoice(u"Option4"_s, fit, m_page.Option4, [this] { m_page.Option4_Click(); });
    auto* fill = new DrawingCard(theme(), this, DrawingCard::Drawing::Fill);
    fill->setCardSize(320, 300);
    bindChoice(u"Option5"_s, fill, m_page.Option5, [this] { m_page.Option5_Click(); });
    row->addWidget(fit, 2, Qt::AlignVCenter);
    row->addWidget(fill, 2, Qt::AlignVCenter);
    row->addStretch(1);
    bind(u"Picture5"_s, new QWidget(step), m_page.Picture5);
    return step;
}

QWidget* nnnView::makeTerms() {
    auto* step = new QWidget(this);
    auto* outer = new QHBoxLayout(step);
    outer->setContentsMargins(0, 0, 0, 0);
    outer->addStretch(1);
    auto* column = new QVBoxLayout;
    column->setSpacing(theme().px(16));
    auto* summary = new QFrame(step);
    setRole(summary, "card");
    auto* summaryColumn = new QVBoxLayout(summary);
    summaryColumn->setContentsMargins(theme().px(32), theme().px(22), theme().px(32), theme().px(22));
    m_chosenHead = makeLabel(summary, "muted");
    summaryColumn->addWidget(m_chosenHead);
    m_chosen = makeLabel(summary, "large");
    summaryColumn->addWidget(m_chosen);
    column->addWidget(summary);
    auto* terms = new QFrame(step);
    setRole(terms, "card");
    terms->setMinimumWidth(theme().px(640));
    auto* termsColumn = new QVBoxLayout(terms);
    termsColumn->setContentsMargins(theme().px(32), theme().px(22), theme().px(32), theme().px(22));
    termsColumn->setSpacing(theme().px(10));
    m_termsHead = makeLabel(terms, "muted");
    termsColumn->addWidget(m_termsHead);
    auto* row = new QHBoxLayout;
    row->addWidget(checkBox(u"Check1"_s, m_page.Check1, [this](bool on) { m_page.Check1_Click(on); }));
    row->addStretch(1);
    row->addWidget(button(
        u"Command29"_s, m_page.Command29, Role::Plain, [this] { m_page.Command29_Click(); }, u"document"_s));
    termsColumn->addLayout(row);
    m_hint = new QFrame(terms);
    setRole(m_hint, "notice");
    auto* hintRow = new QHBoxLayout(m_hint);
    hintRow->setContentsMargins(theme().px(16), theme().px(10), theme().px(16), theme().px(10));
    hintRow->addWidget(label(u"LabelTerms"_s, m_page.LabelTerms), 1);
    hintRow->addWidget(button(
        u"Command30"_s, m_page.Command30, Role::Quiet, [this] { m_page.Command30_Click(); }, u"close"_s));
    termsColumn->addWidget(m_hint);
    column->addWidget(terms);
    column->addStretch(1);
    outer->addLayout(column, 4);
    outer->addStretch(1);
    return step;
}

void nnnView::makeBars() {
    frame().addHeaderAction(button(
        u"Image1(8)"_s, m_page.Image1[EnglishTile], Role::Quiet, [this] { m_page.Image1_Click(EnglishTile); },
        u"globe"_s));
    frame().addHeaderAction(button(
        u"Image1(5)"_s, m_page.Image1[ExitTile], Role::Quiet, [this] { m_page.Image1_Click(ExitTile); }, u"exit"_s));

    m_back = button(u"Command4"_s, m_page.Command4, Role::Secondary, [this] { m_page.Command4_Click(); });
    frame().addSecondaryAction(m_back);
    frame().addSecondaryAction(
        button(u"Command2"_s, m_page.Command2, Role::Quiet, [this] { m_page.Command2_Click(); }));
    frame().addSecondaryAction(button(
        u"Command15"_s, m_page.Command15, Role::Secondary, [this] { m_page.Command15_Click(); }, u"info"_s));
    frame().addSecondaryAction(button(
        u"Command14"_s, m_page.Command14, Role::Secondary, [this] { m_page.Command14_Click(); }, u"eraser"_s));
    m_choiceStatus = label(u"Choice"_s, m_page.Choice, "strong");
    m_choiceStatus->setWordWrap(false);
    frame().addStatus(m_choiceStatus);
    auto* phone = new QLabel(this);
    phone->setPixmap(theme().icon(u"phone"_s, theme().px(22), Theme::Colour::Primary));
    frame().addStatus(phone);
    auto* telephone = label(u"Label4Tel"_s, m_page.Label4Tel, "muted");
    telephone->setWordWrap(false);
    frame().addStatus(telephone);

    m_toOptions = button(u"Command12"_s, m_page.Command12, Role::Main, [this] { m_page.Command12_Click(); });
    m_toBorders = button(u"Command8"_s, m_page.Command8, Role::Main, [this] { m_page.Command8_Click(); });
    m_fromBorder = button(u"Command6"_s, m_page.Command6, Role::Main, [this] { m_page.Command6_Click(); });
    m_finish = button(u"Command3"_s, m_page.Command3, Role::Main, [this] { m_page.Command3_Click(); });
    for (QPushButton* main : QList{m_toOptions, m_toBorders, m_fromBorder, m_finish} + m_album->mainButtons())
        frame().addMainAction(main);

    m_clean = new Overlay(theme(), this);
    m_clean->column()->addWidget(label(u"Frame1"_s, m_page.Frame1, "large"));
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().gap());
    auto* keep = button(u"Command9"_s, m_page.Command9, Role::Secondary, [this] { m_page.Command9_Click(); });
    row->addWidget(keep);
    row->addStretch(1);
    row->addWidget(button(u"Command7"_s, m_page.Command7, Role::Main, [this] { m_page.Command7_Click(); }));
    m_clean->column()->addLayout(row);
    m_clean->setFirstFocus(keep);
    connect(m_clean, &Overlay::escaped, this, [this] { m_page.Command9_Click(); });
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
