#include "views/nnn/nnnViewAlbum.h"

#include "views/kit/ChoiceCards.h"
#include "views/kit/EditableCombo.h"
#include "views/kit/Overlay.h"
#include "views/nnn/AlbumCard.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QStackedLayout>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

using Drawing = AlbumCard::Drawing;

QString numbered(const char* name, int index) {
    return u"%1(%2)"_s.arg(QLatin1StringView(name)).arg(index);
}

// A panel of the width that suits it, in the middle.
QWidget* centred(QWidget* inside, int share) {
    auto* panel = new QWidget;
    auto* row = new QHBoxLayout(panel);
    row->setContentsMargins(0, 0, 0, 0);
    row->addStretch(1);
    row->addWidget(inside, share);
    row->addStretch(1);
    return panel;
}

QFrame* makeCard(const Theme& theme) {
    auto* card = new QFrame;
    setRole(card, "card");
    auto* column = new QVBoxLayout(card);
    column->setContentsMargins(theme.px(28), theme.px(20), theme.px(28), theme.px(20));
    column->setSpacing(theme.px(8));
    return card;
}

QVBoxLayout* columnOf(QFrame* card) {
    return static_cast<QVBoxLayout*>(card->layout());
}

} // namespace

nnnView::Album::Album(nnnView& view)
    : m_view(view)
    , m_album(view.m_page.album)
    , m_theme(view.theme())
    , m_widget(new QWidget(&view))
    , m_panels(new QStackedLayout(m_widget)) {
    // In the order of AlbumPanels::Panel.
    m_panels->addWidget(makePhotographer());
    m_panels->addWidget(makeKinds());
    m_panels->addWidget(
        makeChoice(m_choices[0] = cards(u"Combo4Godel"_s, m_album.Combo4Godel, 3, {int(Drawing::Spread)}, {250, 200},
                                        &AlbumPanels::Combo4Godel_Click),
                   12, 520));
    m_panels->addWidget(makeChoice(m_choices[1] = cards(u"Combo4Cricha"_s, m_album.Combo4Cricha, 2,
                                                        {int(Drawing::Brown), int(Drawing::Cream)}, {340, 320},
                                                        &AlbumPanels::Combo4Cricha_Click),
                                   5, 360));
    m_panels->addWidget(makeChoice(m_choices[2] = cards(u"Combo4Niyar"_s, m_album.Combo4Niyar, 3,
                                                        {int(Drawing::Glossy), int(Drawing::Matte), int(Drawing::Silk)},
                                                        {290, 260}, &AlbumPanels::Combo4Niyar_Click),
                                   12, 320));
    m_panels->addWidget(makeExtras());
    m_panels->addWidget(makeBill());
    addNext(u"Command17"_s, m_album.Command17, &AlbumPanels::Command17_Click);
    addNext(u"Command16"_s, m_album.Command16, &AlbumPanels::Command16_Click);
    addNext(u"Command18"_s, m_album.Command18, &AlbumPanels::Command18_Click);
    addNext(u"Command19"_s, m_album.Command19, &AlbumPanels::Command19_Click);
    addNext(u"Command20"_s, m_album.Command20, &AlbumPanels::Command20_Click);
    addNext(u"Command21"_s, m_album.Command21, &AlbumPanels::Command21_Click);
    addNext(u"Command22"_s, m_album.Command22, &AlbumPanels::Command22_Click);
    for (int i = 0; i < 6; ++i)
        m_view.bindHidden(numbered("Label28", i), m_album.Label28[static_cast<std::size_t>(i)]);
    m_view.bindHidden(u"Pic4Alboom"_s, m_album.Pic4Alboom);
    m_view.bindHidden(u"Label17"_s, m_album.Label17);
    m_view.bindHidden(u"Label36"_s, m_album.Label36);
    m_view.bindHidden(u"Command23"_s, m_album.Command23);
    m_view.bindHidden(u"Command24"_s, m_view.m_page.Command24);
}

void nnnView::Album::addNext(const QString& name, const Caption& caption, void (AlbumPanels::*pressed)()) {
    m_mainButtons += m_view.button(name, caption, Role::Main, [&album = m_album, pressed] { (album.*pressed)(); });
}

ChoiceCards* nnnView::Album::cards(const QString& name, const AlbumPanels::Choice& choice, int columns,
                                   std::initializer_list<int> drawings, QSize size, void (AlbumPanels::*taken)(int)) {
    const QList<int> drawn(drawings);
    const auto make = [this, drawn, size](int row) -> CardButton* {
        const int last = static_cast<int>(drawn.size()) - 1;
        auto* card = new AlbumCard(m_theme, &m_view, static_cast<Drawing>(drawn[std::min(row, last)]));
        card->setCardSize(size.width(), size.height());
        return card;
    };
    return m_view.choiceCards(name, choice.list, choice.box, columns, make,
                              [&album = m_album, taken](int row) { (album.*taken)(row); });
}

QWidget* nnnView::Album::makeChoice(ChoiceCards* choice, int share, int highest) {
    choice->setMaximumHeight(m_theme.px(highest));
    return centred(choice, share);
}

QWidget* nnnView::Album::makePhotographer() {
    QFrame* card = makeCard(m_theme);
    auto* grid = new QGridLayout;
    grid->setHorizontalSpacing(m_theme.px(24));
    grid->setVerticalSpacing(m_theme.px(4));
    const auto box = [&](int i, int line, int column, int columns) {
        const auto at = static_cast<std::size_t>(i);
        auto* title = m_view.label(numbered("LabelText1", i), m_album.LabelText1[at], "strong");
        grid->addWidget(title, line, column, 1, columns);
        m_boxes[at] = m_view.field(numbered("Text1", i), m_album.Text1[at],
                                   [&album = m_album, i](const QString& text) { album.Text1_Change(i, text); });
        m_boxes[at]->setMaxLength(200);
        title->setBuddy(m_boxes[at]);
        if (i != 3)
            grid->addWidget(m_boxes[at], line + 1, column, 1, columns);
        grid->setRowMinimumHeight(line + 2, m_theme.px(8));
    };
    box(0, 0, 0, 1);
    box(1, 0, 1, 1);
    box(2, 3, 0, 2);
    box(3, 6, 0, 2);
    m_boxes[1]->setInputMethodHints(Qt::ImhDialableCharactersOnly);
    m_boxes[3]->setInputMethodHints(Qt::ImhEmailCharactersOnly);
    // An address runs from left to right in both languages.
    auto* address = new QWidget(card);
    address->setLayoutDirection(Qt::LeftToRight);
    auto* addressRow = new QHBoxLayout(address);
    addressRow->setContentsMargins(0, 0, 0, 0);
    addressRow->setSpacing(m_theme.px(8));
    addressRow->addWidget(m_boxes[3], 3);
    auto* at = makeLabel(address, "large");
    at->setText(u"@"_s);
    addressRow->addWidget(at);
    m_domain = new EditableCombo(
        address, [&album = m_album](int row) { album.Combo4Mail_Click(row); },
        [&album = m_album](const QString& text) { album.Combo4Mail_Change(text); });
    m_view.bind(u"Combo4Mail"_s, m_domain, m_album.Combo4Mail.box);
    addressRow->addWidget(m_domain, 2);
    grid->addWidget(address, 7, 0, 1, 2);
    columnOf(card)->addLayout(grid);
    auto* row = new QHBoxLayout;
    row->addWidget(
        m_view.checkBox(u"Check5"_s, m_album.Check5, [&album = m_album](bool on) { album.Check5_Click(on); }));
    row->addStretch(1);
    row->addWidget(m_view.button(
        u"Command28"_s, m_album.Command28, Role::Plain, [&album = m_album] { album.Command28_Click(); }, u"memory"_s));
    columnOf(card)->addLayout(row);
    auto* column = new QWidget;
    auto* inside = new QVBoxLayout(column);
    inside->setContentsMargins(0, 0, 0, 0);
    inside->addWidget(card);
    inside->addStretch(1);
    return centred(column, 8);
}

QWidget* nnnView::Album::makeKinds() {
    auto* panel = new QWidget;
    auto* column = new QVBoxLayout(panel);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(m_theme.px(14));
    auto* grid = new QGridLayout;
    grid->setSpacing(m_theme.px(14));
    static constexpr std::array drawings = {Drawing::SmallBook, Drawing::SpiralBook, Drawing::Book,
                                            Drawing::LargeBook, Drawing::PhotoBook,  Drawing::LargePhotoBook};
    for (int i = 0; i < 6; ++i) {
        const auto at = static_cast<std::size_t>(i);
        auto* card = new AlbumCard(m_theme, &m_view, drawings[at]);
        card->setCardSize(260, 160);
        m_view.bindChoice(numbered("SoogAlb", i), card, m_album.SoogAlb[at],
                          [&album = m_album, i] { album.SoogAlb_Click(i); });
        m_kinds[at] = card;
        grid->addWidget(card, i / 3, i % 3);
    }
    column->addLayout(grid, 1);
    column->addWidget(makeParents());
    return panel;
}

QWidget* nnnView::Album::makeParents() {
    QFrame* card = makeCard(m_theme);
    columnOf(card)->setContentsMargins(m_theme.px(24), m_theme.px(10), m_theme.px(24), m_theme.px(10));
    m_parents = card;
    auto* row = new QHBoxLayout;
    row->setSpacing(m_theme.px(14));
    row->addWidget(
        m_view.checkBox(u"Check4"_s, m_album.Check4, [&album = m_album](bool on) { album.Check4_Click(on); }));
    row->addStretch(1);
    m_copies = new QWidget(card);
    // Less to the left and more to the right, in both languages.
    m_copies->setLayoutDirection(Qt::LeftToRight);
    auto* copies = new QHBoxLayout(m_copies);
    copies->setContentsMargins(0, 0, 0, 0);
    m_less =
        m_view.button(u"Command26"_s, m_album.Command26, Role::Plain, [&album = m_album] { album.Command26_Click(); });
    m_more =
        m_view.button(u"Command27"_s, m_album.Command27, Role::Plain, [&album = m_album] { album.Command27_Click(); });
    auto* count = m_view.label(u"Label32"_s, m_album.Label32, "title");
    count->setWordWrap(false);
    count->setAlignment(Qt::AlignCenter);
    count->setMinimumWidth(m_theme.px(36));
    copies->addWidget(m_less);
    copies->addWidget(count);
    copies->addWidget(m_more);
    auto* prompt = m_view.label(u"LabelParents"_s, m_album.LabelParents, "muted");
    prompt->setWordWrap(false);
    row->addWidget(prompt);
    row->addWidget(m_copies);
    m_parentSize = m_view.comboBox(u"Combo4Horim"_s, m_album.Combo4Horim.list, m_album.Combo4Horim.box,
                                   [&album = m_album](int at) { album.Combo4Horim_Click(at); });
    m_parentSize->setMinimumWidth(m_theme.px(240));
    row->addWidget(m_parentSize);
    columnOf(card)->addLayout(row);
    card->setMinimumHeight(m_theme.target() + m_theme.px(24));
    return card;
}

QWidget* nnnView::Album::makeExtras() {
    auto* panel = new QWidget;
    auto* column = new QVBoxLayout(panel);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(m_theme.px(14));
    m_choices[3] = cards(u"Combo4Tosefet"_s, m_album.Combo4Tosefet, 4,
                         {int(Drawing::Nothing), int(Drawing::Canvas), int(Drawing::Plate), int(Drawing::Perspex)},
                         {215, 210}, &AlbumPanels::Combo4Tosefet_Click);
    column->addWidget(m_choices[3], 1);
    QFrame* card = makeCard(m_theme);
    columnOf(card)->addWidget(m_view.label(u"LabelCheck3"_s, m_album.LabelCheck3, "large"));
    auto* grid = new QGridLayout;
    grid->setSpacing(m_theme.px(6));
    for (int i = 0; i < 6; ++i)
        grid->addWidget(m_view.checkBox(numbered("Check3", i), m_album.Check3[static_cast<std::size_t>(i)],
                                        [&album = m_album, i](bool on) { album.Check3_Click(i, on); }),
                        i / 3, i % 3);
    columnOf(card)->addLayout(grid);
    column->addWidget(card);
    return panel;
}

QWidget* nnnView::Album::makeBill() {
    auto* inside = new QWidget;
    auto* column = new QVBoxLayout(inside);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(m_theme.px(14));
    QFrame* bill = makeCard(m_theme);
    auto* parts = new QHBoxLayout;
    parts->setSpacing(m_theme.px(32));
    for (QLabel** part : {&m_bill, &m_billExtras, &m_billParents}) {
        *part = makeLabel(bill, part == &m_bill ? "strong" : "body");
        parts->addWidget(*part, 1);
    }
    columnOf(bill)->addWidget(m_view.label(u"Pic4Bil"_s, m_album.Pic4Bil, "large"));
    columnOf(bill)->addLayout(parts);
    column->addWidget(bill);
    QFrame* terms = makeCard(m_theme);
    auto* row = new QHBoxLayout;
    row->addWidget(
        m_view.checkBox(u"Check6"_s, m_album.Check6, [&album = m_album](bool on) { album.Check6_Click(on); }));
    row->addStretch(1);
    row->addWidget(m_view.button(
        u"Command25"_s, m_album.Command25, Role::Plain, [&page = m_view.m_page] { page.Command29_Click(); },
        u"document"_s));
    columnOf(terms)->addLayout(row);
    column->addWidget(terms);
    column->addStretch(1);
    return centred(inside, 12);
}

QWidget* nnnView::Album::firstFocus() const {
    switch (m_album.panel) {
    case AlbumPanels::Panel::Photographer:
        return m_boxes[0];
    case AlbumPanels::Panel::Kind:
        return m_kinds[0];
    case AlbumPanels::Panel::Size:
        return m_choices[0];
    case AlbumPanels::Panel::Cover:
        return m_choices[1];
    case AlbumPanels::Panel::Paper:
        return m_choices[2];
    case AlbumPanels::Panel::Extras:
        return m_choices[3];
    case AlbumPanels::Panel::Bill:
        return m_view.findChild<QWidget*>(u"Check6"_s);
    }
    return nullptr;
}

void nnnView::Album::render() {
    for (std::size_t i = 0; i < m_boxes.size(); ++i)
        m_view.speak(m_boxes[i], m_album.LabelText1[i].text);
    m_view.speak(m_domain, m_view.wording(u"ספק הדואר, אחרי השטרודל"_s, u"Mail provider, behind the at sign"_s));
    m_domain->display(m_album.Combo4Mail.list.items(), m_album.Combo4Mail.list.currentIndex(),
                      m_album.Combo4Mail.box.text);
    for (std::size_t i = 0; i < m_kinds.size(); ++i) {
        const AlbumPanels::Shade shade = m_album.SoogAlb[i].shade;
        m_kinds[i]->setRibbon({shade.red, shade.green, shade.blue});
    }
    m_view.speak(m_less, m_album.Command26.hint);
    m_view.speak(m_more, m_album.Command27.hint);
    m_view.speak(m_parentSize, albumPrompt(AlbumChoice::ParentSize, m_view.state().english()));
    m_copies->setVisible(m_album.Command27.visible);
    // Each line at the side where the reading begins, whatever its own letters are.
    const bool leftwards = m_view.layoutDirection() == Qt::RightToLeft;
    for (QLabel* part : {m_bill, m_billExtras, m_billParents})
        part->setAlignment(Qt::AlignAbsolute | Qt::AlignTop | (leftwards ? Qt::AlignRight : Qt::AlignLeft));
    m_bill->setText(isolated(m_album.Pic4BilLines.join(u'\n')));
    m_billExtras->setText(isolated(m_album.Pic4BilExtras.join(u'\n')));
    m_billParents->setText(isolated(m_album.Pic4BilParents.join(u'\n')));
    const bool moved = m_shown != m_album.panel;
    m_shown = m_album.panel;
    m_panels->setCurrentIndex(static_cast<int>(m_album.panel));
    // What slides comes from where the reading goes on.
    const int side = leftwards ? -1 : 1;
    m_panels->currentWidget()->move(side * m_theme.px(m_album.panelShift), 0);
    m_parents->move(side * m_theme.px(m_album.parentsShift), m_parents->y());
    if (moved && m_view.m_page.step == nnn::Step::Album) {
        if (QWidget* first = firstFocus())
            giveFocus(*first);
    }
}

} // namespace lumora
