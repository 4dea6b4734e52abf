#include "views/SpltForm/SpltFormView.h"

#include "common/DrivePath.h"

#include <QLineEdit>
#include <QListWidget>
#include <QProgressBar>

namespace lumora {

using namespace Qt::StringLiterals;

SpltFormView::SpltFormView(SpltForm& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    // The page is no step of an order; the hidden step bar keeps its room, so that the product's name stays in its
    // place.
    keepPlaceWhenHidden(frame().steps());
    frame().steps().hide();
    frame().content()->addLayout(inRow(Space::Wide, {{makeCut(), 2}, {makeJoin(), 3}}), 1);
    frame().content()->addWidget(makeResult());
    makeBars();
    start();
}

QWidget* SpltFormView::firstFocus() const {
    return m_cutFolder;
}

QVBoxLayout* SpltFormView::makeList(const TextList& rows, const Caption& caption, void (SpltForm::*clicked)(int)) {
    QLabel* title = label(caption, "smallMuted");
    const auto shown = [](const QString& path) { return fromLeft(LeafName(path)); };
    QListWidget* made = clicked ? list(rows, clicked, shown) : listing(rows, shown);
    made->setProperty("names", true);
    made->setLayoutDirection(Qt::LeftToRight); // names of files, whose middle may be left out
    made->setUniformItemSizes(true);
    if (clicked) {
        connect(made, &QListWidget::currentRowChanged, this, [choose = toPage(clicked)](int at) {
            if (at >= 0)
                choose(at); // by the keyboard's arrows
        });
    } else {
        made->setProperty("dense", true);
        made->setSelectionMode(QAbstractItemView::NoSelection);
    }
    title->setBuddy(made);
    m_titles.emplace_back(&caption, made);
    return inColumn(Space::Small, {title, {made, 1}});
}

// The main button of a column; this page has no main action in its bottom bar.
QPushButton* SpltFormView::workButton(const Caption& caption, void (SpltForm::*clicked)()) {
    QPushButton* made = button(caption, Role::Main, clicked);
    setRole(made, "done");
    return made;
}

QWidget* SpltFormView::makeCut() {
    m_cutFolder = button(c.Command2, Role::Plain, &SpltForm::Command2_Click, u"folder"_s);
    QLayout* list = makeList(c.List4files, c.Label4files);
    QLabel* sizeTitle = label(c.Label4Text2, "smallMuted");
    QLineEdit* edit = field(c.Text2, toPage(&SpltForm::Text2_Change));
    edit->setLayoutDirection(Qt::LeftToRight);
    edit->setInputMethodHints(Qt::ImhDigitsOnly);
    edit->setFixedWidth(theme().size(Extent::Field));
    sizeTitle->setBuddy(edit);
    const Card card = makeCard("card", Pad::Normal);
    add(*card.column, {label(c.Label4Cut, "large"),
                       m_cutFolder,
                       {list, 1},
                       inRow(Space::Small, {{sizeTitle, 1}, edit}),
                       inRow(Space::Small, {{workButton(c.Command3, &SpltForm::Command3_Click), 1},
                                            button(c.Command9, Role::Plain, &SpltForm::Command9_Click)})});
    return card.frame;
}

QWidget* SpltFormView::makeJoin() {
    QPushButton* folder = button(c.Command8, Role::Plain, &SpltForm::Command8_Click, u"folder-plus"_s);
    QLayout* families = makeList(c.List4Bodedim, c.Label4Bodedim, &SpltForm::List4Bodedim_Click);
    m_families = m_titles.back().second;
    m_families->unsetLayoutDirection();
    m_families->setProperty("names", false);
    QLayout* family = makeList(c.List4Famely, c.Label4Famely);
    QLayout* all = makeList(c.ListChalakim, c.Label4Chalakim, &SpltForm::ListChalakim_Click);
    QLabel* length = lineLabel(c.Label4Length, "smallMuted");
    length->setAlignment(Qt::AlignTrailing | Qt::AlignVCenter);
    keepPlaceWhenHidden(*length);
    const Card card = makeCard("card", Pad::Normal);
    add(*card.column,
        {inRow(Space::Small, {{label(c.Label4Join, "large"), 1}, lineLabel(c.Label4Counts, "smallMuted")}),
         folder,
         {inRow(Space::Normal, {{families, 1}, {inColumn(Space::Small, {{family, 2}, {all, 3}, length}), 1}}), 1},
         inRow(Space::Small, {{workButton(c.Command1, &SpltForm::Command1_Click), 1},
                              {button(c.Command4, Role::Plain, &SpltForm::Command4_Click), 1},
                              button(c.Command6, Role::Plain, &SpltForm::Command6_Click)})});
    return card.frame;
}

QWidget* SpltFormView::makeResult() {
    m_resultSign = new QLabel(this);
    QLabel* where =
        label(c.Label4Where, "smallMuted", [](const QString& path) { return path.isEmpty() ? path : fromLeft(path); });
    m_progress = new QProgressBar(this);
    m_progress->setRange(0, 100);
    m_progress->setTextVisible(false);
    const Card card = makeCard("well", Pad::Slim);
    m_result = card.frame;
    m_result->setMinimumHeight(theme().px(64));
    card.column->addLayout(
        inRow(Space::Normal, {m_resultSign,
                              {inColumn(Space::None, {label(c.Label4Idle, "strong"), label(c.Label4Work, "strong"),
                                                      label(c.Label4Total, "strong"), where, m_progress}),
                               1}}));
    return m_result;
}

void SpltFormView::makeBars() {
    frame().addSecondaryAction(button(c.Image3, Role::Secondary, &SpltForm::Image3_Click));
    frame().addMainAction(button(c.Command15, Role::Danger, &SpltForm::Command15_Click, u"stop"_s));
}

void SpltFormView::render() {
    frame().setTitle(c.Title.text);
    for (const auto& [title, list] : m_titles)
        list->setAccessibleName(title->text);
    renderFamilies();
    renderResult();
}

// Two lines a row: the family's name, and what is known of it.
void SpltFormView::renderFamilies() {
    QStringList words;
    for (int i = 0; i < c.List4Bodedim.count(); ++i)
        words += m_page.familyRow(i).words;
    if (words == m_familyWords && (words.isEmpty() || m_families->item(0)->text().contains(u'\n')))
        return;
    m_familyWords = words;
    for (int i = 0; i < words.size() && i < m_families->count(); ++i) {
        const SpltForm::FamilyRow family = m_page.familyRow(i);
        QListWidgetItem* row = m_families->item(i);
        row->setText(fromLeft(family.name) + u'\n' + isolated(family.words));
        row->setToolTip(c.List4Bodedim.item(i));
        setIcon(row, family.good ? u"check-circle"_s : u"warning"_s,
                family.good ? Theme::Colour::Good : Theme::Colour::Danger);
    }
}

void SpltFormView::renderResult() {
    const struct {
        const char* role;
        QString icon;
        QColor colour;
    } looks[] = {{"well", u"info"_s, Theme::Colour::Primary}, // by SpltForm::Phase
                 {"well", u"info"_s, Theme::Colour::Primary},
                 {"success", u"check-circle"_s, Theme::Colour::Good},
                 {"notice", u"warning"_s, Theme::Colour::Danger},
                 {"alarm", u"warning"_s, Theme::Colour::Danger}};
    const auto& look = looks[static_cast<int>(m_page.phase())];
    changeRole(m_result, look.role);
    m_resultSign->setPixmap(theme().icon(look.icon, theme().size(IconSize::Line), look.colour));
    m_progress->setVisible(m_page.phase() == SpltForm::Phase::Working);
    m_progress->setValue(m_page.percent());
}

} // namespace lumora
