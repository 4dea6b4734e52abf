#include "views/nnn/nnnViewAlbum.h"

#include "views/kit/ChoiceCards.h"
#include "views/kit/EditableCombo.h"
#include "views/kit/Overlay.h"
#include "views/nnn/AlbumDrawing.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QStackedLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

nnnView::Album::Album(nnnView& view)
    : Maker(view.theme(), &view)
    , m_view(view)
    , m_album(view.m_page.album())
    , m_shown(m_album.controls())
    , m_theme(view.theme())
    , m_widget(new QWidget(&view))
    , m_panels(new QStackedLayout(m_widget)) {
    // In the order of AlbumPanels::Panel.
    m_panels->addWidget(makePhotographer());
    m_panels->addWidget(makeKinds());
    const auto choice = [this](int which, int share, int highest, ChoiceCards* made) {
        m_choices[static_cast<std::size_t>(which)] = made;
        made->setMaximumHeight(m_theme.px(highest));
        m_panels->addWidget(inMiddle(made, share));
    };
    using enum AlbumDrawing;
    choice(0, 12, m_theme.isTall() ? 900 : 520,
           cards(m_shown.Combo4Godel, m_theme.isTall() ? 2 : 3, {Spread}, {250, 200}, &AlbumPanels::Combo4Godel_Click));
    choice(1, 5, m_theme.isTall() ? 900 : 360,
           cards(m_shown.Combo4Cricha, m_theme.isTall() ? 1 : 2, {Brown, Cream}, {340, 320},
                 &AlbumPanels::Combo4Cricha_Click));
    choice(2, 12, m_theme.isTall() ? 900 : 320,
           cards(m_shown.Combo4Niyar, m_theme.isTall() ? 1 : 3, {Glossy, Matte, Silk}, {290, 260},
                 &AlbumPanels::Combo4Niyar_Click));
    m_panels->addWidget(makeExtras());
    m_panels->addWidget(makeBill());
    for (int i = 0; i < m_panels->count(); ++i)
        changesSight(*m_panels->widget(i));
}

QList<QPushButton*> nnnView::Album::makeMainButtons() {
    const auto next = [this](const Caption& caption, void (AlbumPanels::*pressed)()) {
        return m_view.button(caption, Role::Main, toAlbum(pressed));
    };
    return {
        next(m_shown.Command17, &AlbumPanels::Command17_Click), next(m_shown.Command16, &AlbumPanels::Command16_Click),
        next(m_shown.Command18, &AlbumPanels::Command18_Click), next(m_shown.Command19, &AlbumPanels::Command19_Click),
        next(m_shown.Command20, &AlbumPanels::Command20_Click), next(m_shown.Command21, &AlbumPanels::Command21_Click),
        next(m_shown.Command22, &AlbumPanels::Command22_Click)};
}

ChoiceCards* nnnView::Album::cards(const ComboCaption& choice, int columns, const QList<AlbumDrawing>& drawings,
                                   QSize size, void (AlbumPanels::*taken)(int)) {
    const auto make = [this, drawings, size](int row) {
        return makeAlbumCard(m_theme, &m_view, drawings[std::min<qsizetype>(row, drawings.size() - 1)], size);
    };
    return m_view.choiceCards(choice.rows, choice, columns, make, toAlbum(taken));
}

QWidget* nnnView::Album::makePhotographer() {
    auto* grid = inGrid(Space::Tight);
    grid->setHorizontalSpacing(m_theme.margin());
    const auto box = [&](int i, int line, int column, int columns) {
        const auto at = static_cast<std::size_t>(i);
        QLabel* title = m_view.label(m_shown.LabelText1[at], "strong");
        grid->addWidget(title, line, column, 1, columns);
        m_boxes[at] = m_view.field(m_shown.Text1[at],
                                   [&album = m_album, i](const QString& text) { album.Text1_Change(i, text); });
        m_boxes[at]->setMaxLength(200);
        title->setBuddy(m_boxes[at]);
        if (i != 3)
            grid->addWidget(m_boxes[at], line + 1, column, 1, columns);
        grid->setRowMinimumHeight(line + 2, m_theme.size(Space::Small));
    };
    box(0, 0, 0, 1);
    box(1, 0, 1, 1);
    box(2, 3, 0, 2);
    box(3, 6, 0, 2);
    m_boxes[1]->setInputMethodHints(Qt::ImhDialableCharactersOnly);
    m_domain =
        new EditableCombo(&m_view, toAlbum(&AlbumPanels::Combo4Mail_Click), toAlbum(&AlbumPanels::Combo4Mail_Change));
    m_view.bind(m_domain, m_shown.Combo4Mail);
    setDomainBox(*m_boxes[3], *m_domain);
    // An address runs from left to right in both languages.
    grid->addWidget(leftToRight(inRow(Space::Small, {{m_boxes[3], 3}, words("large", u"@"_s), {m_domain, 2}})), 7, 0, 1,
                    2);
    const Card card = makeCard("card", Pad::Wide);
    add(*card.column,
        {grid, inRow(Space::Normal, {checkBox(m_shown.Check5, &AlbumPanels::Check5_Click), Item::room(),
                                     m_view.button(m_shown.Command28, Role::Plain,
                                                   toAlbum(&AlbumPanels::Command28_Click), u"memory"_s)})});
    return inMiddle(inBox(inColumn(Space::None, {Item::room(m_theme.isTall() ? 1 : 0), card.frame, Item::room(2)})), 8);
}

QWidget* nnnView::Album::makeKinds() {
    auto* grid = inGrid(Space::Normal);
    using enum AlbumDrawing;
    static constexpr std::array drawings = {SmallBook, SpiralBook, Book, LargeBook, PhotoBook, LargePhotoBook};
    for (std::size_t at = 0; at < drawings.size(); ++at) {
        const int i = static_cast<int>(at);
        m_kinds[at] = makeAlbumCard(m_theme, &m_view, drawings[at], {260, 160});
        m_view.bindChoice(m_kinds[at], m_shown.SoogAlb[at], [&album = m_album, i] { album.SoogAlb_Click(i); });
        const int columns = m_theme.isTall() ? 2 : 3;
        grid->addWidget(m_kinds[at], i / columns, i % columns);
    }
    return inBox(inColumn(Space::Normal, {{grid, 1}, makeParents()}));
}

QWidget* nnnView::Album::makeParents() {
    QCheckBox* wanted = checkBox(m_shown.Check4, &AlbumPanels::Check4_Click);
    m_less = m_view.button(m_shown.Command26, Role::Plain, toAlbum(&AlbumPanels::Command26_Click));
    m_more = m_view.button(m_shown.Command27, Role::Plain, toAlbum(&AlbumPanels::Command27_Click));
    QLabel* count = m_view.label(m_shown.Label32, "title");
    count->setWordWrap(false);
    count->setAlignment(Qt::AlignCenter);
    count->setMinimumWidth(m_theme.target());
    // The minus stands left and the plus right in both languages.
    m_copies = leftToRight(inRow(Space::Normal, {m_less, count, m_more}));
    QLabel* prompt = m_view.label(m_shown.LabelParents, "muted");
    prompt->setWordWrap(false);
    m_parentSize =
        m_view.comboBox(m_shown.Combo4Horim.rows, m_shown.Combo4Horim, toAlbum(&AlbumPanels::Combo4Horim_Click));
    m_parentSize->setMinimumWidth(m_theme.size(Extent::WideField));
    const Card card = makeCard("card", Pad::Slim);
    m_parents = card.frame;
    m_parents->setMinimumHeight(m_theme.target() + 2 * m_theme.gap());
    if (m_theme.isTall())
        add(*card.column, {wanted, inRow(Space::Normal, {prompt, m_copies, Item::room(), m_parentSize})});
    else
        card.column->addLayout(inRow(Space::Normal, {wanted, Item::room(), prompt, m_copies, m_parentSize}));
    return m_parents;
}

QWidget* nnnView::Album::makeExtras() {
    using enum AlbumDrawing;
    m_choices[3] = cards(m_shown.Combo4Tosefet, m_theme.isTall() ? 2 : 4, {Nothing, Canvas, Plate, Perspex}, {215, 210},
                         &AlbumPanels::Combo4Tosefet_Click);
    const Card card = makeCard("card", Pad::Wide);
    auto* grid = inGrid(Space::Small);
    const int columns = m_theme.isTall() ? 2 : 3;
    for (int i = 0; i < 6; ++i) {
        const auto at = static_cast<std::size_t>(i);
        grid->addWidget(
            m_view.checkBox(m_shown.Check3[at], [&album = m_album, i](bool on) { album.Check3_Click(i, on); }),
            i / columns, i % columns);
    }
    add(*card.column, {m_view.label(m_shown.LabelCheck3, "large"), grid});
    return inBox(inColumn(Space::Normal, {{m_choices[3], 1}, card.frame}));
}

QWidget* nnnView::Album::makeBill() {
    const Card bill = makeCard("card", Pad::Wide);
    m_bill = words("strong");
    m_billExtras = words("body");
    m_billParents = words("body");
    add(*bill.column, {m_view.label(m_shown.Pic4Bil, "large"),
                       across(Space::Far, {{m_bill, 1}, {m_billExtras, 1}, {m_billParents, 1}})});
    const Card terms = makeCard("card", Pad::Wide);
    terms.column->addLayout(
        inRow(Space::Normal, {checkBox(m_shown.Check6, &AlbumPanels::Check6_Click), Item::room(),
                              m_view.button(m_shown.Command25, Role::Plain, &nnn::Command29_Click, u"document"_s)}));
    return inMiddle(
        inBox(inColumn(Space::Normal, {Item::room(m_theme.isTall() ? 1 : 0), bill.frame, terms.frame, Item::room(2)})),
        12);
}

QCheckBox* nnnView::Album::checkBox(const CheckCaption& caption, void (AlbumPanels::*clicked)(bool)) {
    return m_view.checkBox(caption, toAlbum(clicked));
}

QWidget* nnnView::Album::firstFocus() const {
    switch (m_album.panel()) {
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
        m_view.speak(m_boxes[i], m_shown.LabelText1[i].text);
    m_view.speak(m_domain, m_shown.LabelCombo4Mail.text);
    using enum EditableCombo::Says;
    m_domain->display(m_shown.Combo4Mail.rows.items(), m_shown.Combo4Mail.rows.currentIndex(), m_shown.Combo4Mail.text,
                      m_album.promptStands() ? Prompt : Choice);
    for (std::size_t i = 0; i < m_kinds.size(); ++i) {
        const AlbumControls::Shade shade = m_shown.SoogAlb[i].shade;
        m_kinds[i]->setRibbon({shade.red, shade.green, shade.blue});
    }
    m_view.speak(m_less, m_shown.Command26.hint);
    m_view.speak(m_more, m_shown.Command27.hint);
    m_view.speak(m_parentSize, m_shown.LabelCombo4Horim.text);
    m_copies->setVisible(m_shown.Command27.visible);
    // Each line is aligned to the side where reading begins, whatever its letters are.
    const bool leftwards = m_view.layoutDirection() == Qt::RightToLeft;
    for (QLabel* part : {m_bill, m_billExtras, m_billParents})
        part->setAlignment(Qt::AlignAbsolute | Qt::AlignTop | (leftwards ? Qt::AlignRight : Qt::AlignLeft));
    m_bill->setText(isolated(m_shown.Pic4BilLines.join(u'\n')));
    m_billExtras->setText(isolated(m_shown.Pic4BilExtras.join(u'\n')));
    m_billParents->setText(isolated(m_shown.Pic4BilParents.join(u'\n')));
    const bool moved = m_shownPanel != m_album.panel();
    m_shownPanel = m_album.panel();
    m_panels->setCurrentIndex(static_cast<int>(m_album.panel()));
    // A panel slides in from the side where reading ends.
    const int side = leftwards ? -1 : 1;
    m_panels->currentWidget()->move(side * m_theme.px(m_shown.panelShift), 0);
    m_parents->move(side * m_theme.px(m_shown.parentsShift), m_parents->y());
    if (moved && m_view.m_page.step() == nnn::Step::Album) {
        if (QWidget* first = firstFocus())
            giveFocus(*first);
    }
}

} // namespace lumora
