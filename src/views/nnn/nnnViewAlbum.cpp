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
    , m_album(view.m_page.album)
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
    choice(0, 12, 520,
           cards(u"Combo4Godel"_s, m_album.Combo4Godel, 3, {Spread}, {250, 200}, &AlbumPanels::Combo4Godel_Click));
    choice(1, 5, 360,
           cards(u"Combo4Cricha"_s, m_album.Combo4Cricha, 2, {Brown, Cream}, {340, 320},
                 &AlbumPanels::Combo4Cricha_Click));
    choice(2, 12, 320,
           cards(u"Combo4Niyar"_s, m_album.Combo4Niyar, 3, {Glossy, Matte, Silk}, {290, 260},
                 &AlbumPanels::Combo4Niyar_Click));
    m_panels->addWidget(makeExtras());
    m_panels->addWidget(makeBill());
    addNext(u"Command17"_s, m_album.Command17, &AlbumPanels::Command17_Click);
    addNext(u"Command16"_s, m_album.Command16, &AlbumPanels::Command16_Click);
    addNext(u"Command18"_s, m_album.Command18, &AlbumPanels::Command18_Click);
    addNext(u"Command19"_s, m_album.Command19, &AlbumPanels::Command19_Click);
    addNext(u"Command20"_s, m_album.Command20, &AlbumPanels::Command20_Click);
    addNext(u"Command21"_s, m_album.Command21, &AlbumPanels::Command21_Click);
    addNext(u"Command22"_s, m_album.Command22, &AlbumPanels::Command22_Click);
    for (std::size_t i = 0; i < 6; ++i)
        m_view.bindHidden(numbered("Label28", i), m_album.Label28[i]);
    m_view.bindHidden(u"Pic4Alboom"_s, m_album.Pic4Alboom);
    m_view.bindHidden(u"Label17"_s, m_album.Label17);
    m_view.bindHidden(u"Label36"_s, m_album.Label36);
    m_view.bindHidden(u"Command23"_s, m_album.Command23);
    m_view.bindHidden(u"Command24"_s, m_view.m_page.Command24);
}

void nnnView::Album::addNext(const QString& name, const Caption& caption, void (AlbumPanels::*pressed)()) {
    m_mainButtons += m_view.button(name, caption, Role::Main, toAlbum(pressed));
}

ChoiceCards* nnnView::Album::cards(const QString& name, const AlbumPanels::Choice& choice, int columns,
                                   const QList<AlbumDrawing>& drawings, QSize size, void (AlbumPanels::*taken)(int)) {
    const auto make = [this, drawings, size](int row) {
        return makeAlbumCard(m_theme, &m_view, drawings[std::min<qsizetype>(row, drawings.size() - 1)], size);
    };
    return m_view.choiceCards(name, choice.list, choice.box, columns, make, toAlbum(taken));
}

QWidget* nnnView::Album::makePhotographer() {
    auto* grid = inGrid(Space::Tight);
    grid->setHorizontalSpacing(m_theme.margin());
    const auto box = [&](int i, int line, int column, int columns) {
        const auto at = static_cast<std::size_t>(i);
        QLabel* title = m_view.label(numbered("LabelText1", at), m_album.LabelText1[at], "strong");
        grid->addWidget(title, line, column, 1, columns);
        m_boxes[at] = m_view.field(numbered("Text1", at), m_album.Text1[at],
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
    m_boxes[3]->setInputMethodHints(Qt::ImhEmailCharactersOnly);
    m_domain =
        new EditableCombo(&m_view, toAlbum(&AlbumPanels::Combo4Mail_Click), toAlbum(&AlbumPanels::Combo4Mail_Change));
    m_view.bind(u"Combo4Mail"_s, m_domain, m_album.Combo4Mail.box);
    // An address runs from left to right in both languages.
    grid->addWidget(leftToRight(inRow(Space::Small, {{m_boxes[3], 3}, words("large", u"@"_s), {m_domain, 2}})), 7, 0, 1,
                    2);
    const Card card = makeCard("card", Pad::Wide);
    add(*card.column,
        {grid, inRow(Space::Normal, {checkBox(u"Check5"_s, m_album.Check5, &AlbumPanels::Check5_Click), Item::room(),
                                     m_view.button(u"Command28"_s, m_album.Command28, Role::Plain,
                                                   toAlbum(&AlbumPanels::Command28_Click), u"memory"_s)})});
    return inMiddle(inBox(inColumn(Space::None, {card.frame, Item::room()})), 8);
}

QWidget* nnnView::Album::makeKinds() {
    auto* grid = inGrid(Space::Normal);
    using enum AlbumDrawing;
    static constexpr std::array drawings = {SmallBook, SpiralBook, Book, LargeBook, PhotoBook, LargePhotoBook};
    for (std::size_t at = 0; at < drawings.size(); ++at) {
        const int i = static_cast<int>(at);
        m_kinds[at] = makeAlbumCard(m_theme, &m_view, drawings[at], {260, 160});
        m_view.bindChoice(numbered("SoogAlb", at), m_kinds[at], m_album.SoogAlb[at],
                          [&album = m_album, i] { album.SoogAlb_Click(i); });
        grid->addWidget(m_kinds[at], i / 3, i % 3);
    }
    return inBox(inColumn(Space::Normal, {{grid, 1}, makeParents()}));
}

QWidget* nnnView::Album::makeParents() {
    QCheckBox* wanted = checkBox(u"Check4"_s, m_album.Check4, &AlbumPanels::Check4_Click);
    m_less = m_view.button(u"Command26"_s, m_album.Command26, Role::Plain, toAlbum(&AlbumPanels::Command26_Click));
    m_more = m_view.button(u"Command27"_s, m_album.Command27, Role::Plain, toAlbum(&AlbumPanels::Command27_Click));
    QLabel* count = m_view.label(u"Label32"_s, m_album.Label32, "title");
    count->setWordWrap(false);
    count->setAlignment(Qt::AlignCenter);
    count->setMinimumWidth(m_theme.px(36));
    // Less to the left and more to the right, in both languages.
    m_copies = leftToRight(inRow(Space::Normal, {m_less, count, m_more}));
    QLabel* prompt = m_view.label(u"LabelParents"_s, m_album.LabelParents, "muted");
    prompt->setWordWrap(false);
    m_parentSize = m_view.comboBox(u"Combo4Horim"_s, m_album.Combo4Horim.list, m_album.Combo4Horim.box,
                                   toAlbum(&AlbumPanels::Combo4Horim_Click));
    m_parentSize->setMinimumWidth(m_theme.px(240));
    const Card card = makeCard("card", Pad::Slim);
    m_parents = card.frame;
    m_parents->setMinimumHeight(m_theme.target() + 2 * m_theme.gap());
    card.column->addLayout(inRow(Space::Normal, {wanted, Item::room(), prompt, m_copies, m_parentSize}));
    return m_parents;
}

QWidget* nnnView::Album::makeExtras() {
    using enum AlbumDrawing;
    m_choices[3] = cards(u"Combo4Tosefet"_s, m_album.Combo4Tosefet, 4, {Nothing, Canvas, Plate, Perspex}, {215, 210},
                         &AlbumPanels::Combo4Tosefet_Click);
    const Card card = makeCard("card", Pad::Wide);
    auto* grid = inGrid(Space::Small);
    for (int i = 0; i < 6; ++i) {
        const auto at = static_cast<std::size_t>(i);
        grid->addWidget(m_view.checkBox(numbered("Check3", at), m_album.Check3[at],
                                        [&album = m_album, i](bool on) { album.Check3_Click(i, on); }),
                        i / 3, i % 3);
    }
    add(*card.column, {m_view.label(u"LabelCheck3"_s, m_album.LabelCheck3, "large"), grid});
    return inBox(inColumn(Space::Normal, {{m_choices[3], 1}, card.frame}));
}

QWidget* nnnView::Album::makeBill() {
    const Card bill = makeCard("card", Pad::Wide);
    m_bill = words("strong");
    m_billExtras = words("body");
    m_billParents = words("body");
    add(*bill.column, {m_view.label(u"Pic4Bil"_s, m_album.Pic4Bil, "large"),
                       inRow(Space::Far, {{m_bill, 1}, {m_billExtras, 1}, {m_billParents, 1}})});
    const Card terms = makeCard("card", Pad::Wide);
    terms.column->addLayout(
        inRow(Space::Normal,
              {checkBox(u"Check6"_s, m_album.Check6, &AlbumPanels::Check6_Click), Item::room(),
               m_view.button(u"Command25"_s, m_album.Command25, Role::Plain, &nnn::Command29_Click, u"document"_s)}));
    return inMiddle(inBox(inColumn(Space::Normal, {bill.frame, terms.frame, Item::room()})), 12);
}

QCheckBox* nnnView::Album::checkBox(const QString& name, const CheckCaption& caption,
                                    void (AlbumPanels::*clicked)(bool)) {
    return m_view.checkBox(name, caption, toAlbum(clicked));
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
