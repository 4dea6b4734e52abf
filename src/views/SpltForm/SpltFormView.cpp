#include "views/SpltForm/SpltFormView.h"

#include "common/DrivePathText.h"
#include "order/PieceName.h"

#include <QLineEdit>
#include <QListWidget>
#include <QProgressBar>

namespace lumora {

using namespace Qt::StringLiterals;

SpltFormView::SpltFormView(SpltForm& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    // No part of an order's way; its room keeps the name at its place.
    QSizePolicy room = frame().steps().sizePolicy();
    room.setRetainSizeWhenHidden(true);
    frame().steps().setSizePolicy(room);
    frame().steps().hide();
    frame().content()->addLayout(inRow(Space::Wide, {{makeCut(), 2}, {makeJoin(), 3}}), 1);
    frame().content()->addWidget(makeResult());
    makeBars();
    start();
}

QWidget* SpltFormView::firstFocus() const {
    return m_cutFolder;
}

QVBoxLayout* SpltFormView::makeList(const QString& name, const TextList& list, const QString& hebrew,
                                    const QString& english, void (SpltForm::*clicked)(int)) {
    QLabel* title = words("smallMuted");
    auto* widget = new QListWidget(this);
    widget->setTextElideMode(Qt::ElideMiddle);
    widget->setProperty("names", true);
    widget->setLayoutDirection(Qt::LeftToRight); // names of files, whose middle may be left out
    widget->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    widget->setUniformItemSizes(true);
    if (clicked) {
        // By a click, or by the keyboard's arrows.
        connect(widget, &QListWidget::itemClicked, this,
                [&page = m_page, widget, clicked](QListWidgetItem* item) { (page.*clicked)(widget->row(item)); });
        connect(widget, &QListWidget::currentRowChanged, this, [&page = m_page, clicked](int at) {
            if (at >= 0)
                (page.*clicked)(at);
        });
    } else {
        widget->setProperty("dense", true);
        widget->setSelectionMode(QAbstractItemView::NoSelection);
        widget->setFocusPolicy(Qt::NoFocus);
    }
    bindList(name, list, widget, LeafName);
    title->setBuddy(widget);
    m_titles.push_back({title, widget, hebrew, english});
    return inColumn(Space::Small, {title, {widget, 1}});
}

// The chief work of a column. The bottom bar's main action would be one too many here.
QPushButton* SpltFormView::workButton(const QString& name, const Caption& caption, void (SpltForm::*clicked)()) {
    QPushButton* made = button(name, caption, Role::Main, clicked);
    setRole(made, "done");
    return made;
}

QWidget* SpltFormView::makeCut() {
    m_cutHead = words("large");
    m_cutFolder = button(u"Command2"_s, m_page.Command2, Role::Plain, &SpltForm::Command2_Click, u"folder"_s);
    QLayout* list = makeList(u"List4files"_s, m_page.List4files, u"הקבצים לחיתוך"_s, u"Files to cut"_s);
    QLabel* sizeTitle = label(u"Label4Text2"_s, m_page.Label4Text2, "smallMuted");
    QLineEdit* edit = field(u"Text2"_s, m_page.Text2, toPage(&SpltForm::Text2_Change));
    edit->setLayoutDirection(Qt::LeftToRight);
    edit->setInputMethodHints(Qt::ImhDigitsOnly);
    edit->setFixedWidth(theme().px(150));
    sizeTitle->setBuddy(edit);
    const Card card = makeCard("card", Pad::Normal);
    add(*card.column,
        {m_cutHead,
         m_cutFolder,
         {list, 1},
         inRow(Space::Small, {{sizeTitle, 1}, edit}),
         inRow(Space::Small, {{workButton(u"Command3"_s, m_page.Command3, &SpltForm::Command3_Click), 1},
                              button(u"Command9"_s, m_page.Command9, Role::Plain, &SpltForm::Command9_Click)})});
    return card.frame;
}

QWidget* SpltFormView::makeJoin() {
    m_joinHead = words("large");
    m_counts = oneLine("smallMuted");
    QPushButton* folder =
        button(u"Command8"_s, m_page.Command8, Role::Plain, &SpltForm::Command8_Click, u"folder-plus"_s);
    QLayout* families =
        makeList(u"List4Bodedim"_s, m_page.List4Bodedim, u"משפחות"_s, u"Families"_s, &SpltForm::List4Bodedim_Click);
    m_families = m_titles.back().list;
    m_families->unsetLayoutDirection();
    m_families->setProperty("names", false);
    QLayout* family =
        makeList(u"List4Famely"_s, m_page.List4Famely, u"חלקי המשפחה שנבחרה"_s, u"Pieces of the chosen family"_s);
    QLayout* all = makeList(u"ListChalakim"_s, m_page.ListChalakim, u"כל הקבצים שנקראו"_s, u"All the files read"_s,
                            &SpltForm::ListChalakim_Click);
    m_length = oneLine("smallMuted");
    m_length->setAlignment(Qt::AlignTrailing | Qt::AlignVCenter);
    const Card card = makeCard("card", Pad::Normal);
    add(*card.column,
        {inRow(Space::Small, {{m_joinHead, 1}, m_counts}),
         folder,
         {inRow(Space::Normal, {{families, 1}, {inColumn(Space::Small, {{family, 2}, {all, 3}, m_length}), 1}}), 1},
         inRow(Space::Small, {{workButton(u"Command1"_s, m_page.Command1, &SpltForm::Command1_Click), 1},
                              {button(u"Command4"_s, m_page.Command4, Role::Plain, &SpltForm::Command4_Click), 1},
                              button(u"Command6"_s, m_page.Command6, Role::Plain, &SpltForm::Command6_Click)})});
    bindHidden(u"Command5"_s, m_page.Command5);
    bindHidden(u"Label1"_s, m_page.Label1);
    bindHidden(u"Label5"_s, m_page.Label5);
    bindHidden(u"Label8"_s, m_page.Label8);
    bindHidden(u"Label9"_s, m_page.Label9);
    return card.frame;
}

QWidget* SpltFormView::makeResult() {
    m_resultSign = new QLabel(this);
    m_resultLine = words("strong");
    m_resultWhere = words("smallMuted");
    m_progress = new QProgressBar(this);
    m_progress->setRange(0, 100);
    m_progress->setTextVisible(false);
    const Card card = makeCard("well", Pad::Slim);
    m_result = card.frame;
    m_result->setMinimumHeight(theme().px(64));
    card.column->addLayout(
        inRow(Space::Normal, {m_resultSign, {inColumn(Space::None, {m_resultLine, m_resultWhere, m_progress}), 1}}));
    bind(u"Label4Total"_s, m_resultLine, [this] { return m_page.Label4Total.text; });
    bind(u"Label4Where"_s, m_resultWhere, [this] { return m_page.Label4Where.text; });
    bindHidden(u"Label4Work"_s, m_page.Label4Work);
    return m_result;
}

void SpltFormView::makeBars() {
    frame().addSecondaryAction(button(u"Image3"_s, m_page.Image3, Role::Secondary, &SpltForm::Image3_Click));
    frame().addMainAction(
        button(u"Command15"_s, m_page.Command15, Role::Danger, &SpltForm::Command15_Click, u"stop"_s));
}

void SpltFormView::render() {
    frame().setTitle(wording(u"חיתוך קבצים לחלקים וצירופם"_s, u"Cutting files into pieces and joining them"_s));
    m_cutHead->setText(wording(u"לחתוך"_s, u"Cut"_s));
    m_joinHead->setText(wording(u"לצרף"_s, u"Join"_s));
    for (const Title& title : m_titles) {
        title.label->setText(wording(title.hebrew, title.english));
        title.list->setAccessibleName(title.label->text());
    }
    m_counts->setVisible(!m_page.Label1.text.isEmpty());
    m_counts->setText(wording(u"קבצים: %1 · משפחות: %2"_s, u"Files: %1 · families: %2"_s)
                          .arg(m_page.Label1.text, m_page.Label5.text));
    m_length->setText(m_page.Label8.text.isEmpty()
                          ? QString()
                          : isolated(wording(u"%1 בתים, כונן %2"_s, u"%1 bytes, drive %2"_s)
                                         .arg(m_page.Label8.text, fromLeft(m_page.Label9.text))));
    renderFamilies();
    renderResult();
}

// Two lines a row: the family's name, and what is known of it.
void SpltFormView::renderFamilies() {
    QStringList words;
    for (int i = 0; i < static_cast<int>(m_page.families.size()); ++i)
        words += m_page.familyWords(i);
    if (words == m_familyWords && (words.isEmpty() || m_families->item(0)->text().contains(u'\n')))
        return;
    m_familyWords = words;
    for (int i = 0; i < words.size() && i < m_families->count(); ++i) {
        const auto& family = m_page.families[static_cast<std::size_t>(i)];
        const bool good = family.fate == SpltForm::Family::Fate::Joined ||
                          (family.fate == SpltForm::Family::Fate::Listed && family.verdict == familyComplete);
        QListWidgetItem* row = m_families->item(i);
        const QString leaf = LeafName(m_page.List4Bodedim.item(i));
        const QString name = JoinedName(leaf).value_or(leaf);
        row->setText(fromLeft(name) + u'\n' + isolated(words[i]));
        row->setToolTip(m_page.List4Bodedim.item(i));
        row->setIcon(QIcon(theme().icon(good ? u"check-circle"_s : u"warning"_s, theme().px(24),
                                        good ? Theme::Colour::Good : Theme::Colour::Danger)));
    }
}

void SpltFormView::renderResult() {
    using Outcome = SpltForm::Outcome;
    const bool told = m_page.busy || m_page.outcome != Outcome::None;
    const char* role = m_page.busy || !told                ? "well"
                       : m_page.outcome == Outcome::Good   ? "success"
                       : m_page.outcome == Outcome::Partly ? "notice"
                                                           : "alarm";
    changeRole(m_result, role);
    const bool good = m_page.outcome == Outcome::Good;
    m_resultSign->setPixmap(theme().icon(m_page.busy || !told ? u"info"_s
                                         : good               ? u"check-circle"_s
                                                              : u"warning"_s,
                                         theme().px(30),
                                         m_page.busy || !told ? Theme::Colour::Primary
                                         : good               ? Theme::Colour::Good
                                                              : Theme::Colour::Danger));
    m_resultLine->setText(
        isolated(m_page.busy ? m_page.Label4Work.text
                 : told      ? m_page.Label4Total.text
                             : wording(u"בחרו תיקייה לחיתוך, או תיקייה של חלקים לצירוף. הקבצים עצמם אינם משתנים."_s,
                                       u"Choose a folder to cut, or a folder of pieces to join. "
                                       "The files themselves never change."_s)));
    m_resultWhere->setText(atLineStart(fromLeft(m_page.Label4Where.text), state().english()));
    m_resultWhere->setVisible(!m_page.busy && !m_page.Label4Where.text.isEmpty());
    m_progress->setVisible(m_page.busy);
    m_progress->setValue(m_page.percent);
}

} // namespace lumora
