#include "views/SpltForm/SpltFormView.h"

#include "common/DrivePathText.h"
#include "order/PieceName.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QProgressBar>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

SpltFormView::SpltFormView(SpltForm& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page) {
    // No part of an order's way; its room keeps the name at its place.
    QSizePolicy room = frame().steps().sizePolicy();
    room.setRetainSizeWhenHidden(true);
    frame().steps().setSizePolicy(room);
    frame().steps().hide();
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(20));
    row->addWidget(makeCut(), 2);
    row->addWidget(makeJoin(), 3);
    frame().content()->setSpacing(theme.px(12));
    frame().content()->addLayout(row, 1);
    frame().content()->addWidget(makeResult());
    makeBars();
    start();
}

QWidget* SpltFormView::firstFocus() const {
    return m_cutFolder;
}

QListWidget* SpltFormView::makeList(QVBoxLayout& column, const QString& name, const TextList& list,
                                    const QString& hebrew, const QString& english, int stretch,
                                    void (SpltForm::*clicked)(int)) {
    auto* title = makeLabel(this, "smallMuted");
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
    column.addWidget(title);
    column.addWidget(widget, stretch);
    m_titles.push_back({title, widget, hebrew, english});
    return widget;
}

// The chief work of a column. The bottom bar's main action would be one too many here.
QPushButton* SpltFormView::workButton(const QString& name, const Caption& caption, std::function<void()> clicked) {
    auto* made = button(name, caption, Role::Main, std::move(clicked));
    setRole(made, "done");
    return made;
}

QWidget* SpltFormView::makeCut() {
    auto* card = new QFrame(this);
    setRole(card, "card");
    auto* column = new QVBoxLayout(card);
    column->setContentsMargins(theme().px(18), theme().px(14), theme().px(18), theme().px(16));
    column->setSpacing(theme().px(8));
    m_cutHead = makeLabel(card, "large");
    column->addWidget(m_cutHead);
    m_cutFolder = button(
        u"Command2"_s, m_page.Command2, Role::Plain, [this] { m_page.Command2_Click(); }, u"folder"_s);
    column->addWidget(m_cutFolder);
    makeList(*column, u"List4files"_s, m_page.List4files, u"הקבצים לחיתוך"_s, u"Files to cut"_s, 1);
    auto* size = new QHBoxLayout;
    size->setSpacing(theme().px(10));
    auto* sizeTitle = label(u"Label4Text2"_s, m_page.Label4Text2, "smallMuted");
    size->addWidget(sizeTitle, 1);
    auto* edit = field(u"Text2"_s, m_page.Text2, [this](const QString& text) { m_page.Text2_Change(text); });
    edit->setLayoutDirection(Qt::LeftToRight);
    edit->setInputMethodHints(Qt::ImhDigitsOnly);
    edit->setFixedWidth(theme().px(150));
    sizeTitle->setBuddy(edit);
    size->addWidget(edit);
    column->addLayout(size);
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(10));
    row->addWidget(workButton(u"Command3"_s, m_page.Command3, [this] { m_page.Command3_Click(); }), 1);
    row->addWidget(button(u"Command9"_s, m_page.Command9, Role::Plain, [this] { m_page.Command9_Click(); }));
    column->addLayout(row);
    return card;
}

QWidget* SpltFormView::makeJoin() {
    auto* card = new QFrame(this);
    setRole(card, "card");
    auto* column = new QVBoxLayout(card);
    column->setContentsMargins(theme().px(18), theme().px(14), theme().px(18), theme().px(16));
    column->setSpacing(theme().px(8));
    auto* head = new QHBoxLayout;
    m_joinHead = makeLabel(card, "large");
    head->addWidget(m_joinHead, 1);
    m_counts = makeLabel(card, "smallMuted");
    m_counts->setWordWrap(false);
    head->addWidget(m_counts);
    column->addLayout(head);
    column->addWidget(button(
        u"Command8"_s, m_page.Command8, Role::Plain, [this] { m_page.Command8_Click(); }, u"folder-plus"_s));

    auto* lists = new QHBoxLayout;
    lists->setSpacing(theme().px(12));
    auto* left = new QVBoxLayout;
    left->setSpacing(theme().px(6));
    m_families = makeList(*left, u"List4Bodedim"_s, m_page.List4Bodedim, u"משפחות"_s, u"Families"_s, 1,
                          &SpltForm::List4Bodedim_Click);
    m_families->unsetLayoutDirection();
    m_families->setProperty("names", false);
    lists->addLayout(left, 1);
    auto* right = new QVBoxLayout;
    right->setSpacing(theme().px(6));
    makeList(*right, u"List4Famely"_s, m_page.List4Famely, u"חלקי המשפחה שנבחרה"_s, u"Pieces of the chosen family"_s,
             2);
    makeList(*right, u"ListChalakim"_s, m_page.ListChalakim, u"כל הקבצים שנקראו"_s, u"All the files read"_s, 3,
             &SpltForm::ListChalakim_Click);
    lists->addLayout(right, 1);
    m_length = makeLabel(card, "smallMuted");
    m_length->setWordWrap(false);
    m_length->setAlignment(Qt::AlignTrailing | Qt::AlignVCenter);
    right->addWidget(m_length);
    column->addLayout(lists, 1);

    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(10));
    row->addWidget(workButton(u"Command1"_s, m_page.Command1, [this] { m_page.Command1_Click(); }), 1);
    row->addWidget(button(u"Command4"_s, m_page.Command4, Role::Plain, [this] { m_page.Command4_Click(); }), 1);
    row->addWidget(button(u"Command6"_s, m_page.Command6, Role::Plain, [this] { m_page.Command6_Click(); }));
    column->addLayout(row);
    bindHidden(u"Command5"_s, m_page.Command5);
    bindHidden(u"Label1"_s, m_page.Label1);
    bindHidden(u"Label5"_s, m_page.Label5);
    bindHidden(u"Label8"_s, m_page.Label8);
    bindHidden(u"Label9"_s, m_page.Label9);
    return card;
}

QWidget* SpltFormView::makeResult() {
    m_result = new QFrame(this);
    auto* row = new QHBoxLayout(m_result);
    row->setContentsMargins(theme().px(18), theme().px(8), theme().px(18), theme().px(8));
    row->setSpacing(theme().px(14));
    m_resultSign = new QLabel(m_result);
    row->addWidget(m_resultSign);
    auto* words = new QVBoxLayout;
    words->setSpacing(theme().px(2));
    m_resultLine = makeLabel(m_result, "strong");
    words->addWidget(m_resultLine);
    m_resultWhere = makeLabel(m_result, "smallMuted");
    words->addWidget(m_resultWhere);
    m_progress = new QProgressBar(m_result);
    m_progress->setRange(0, 100);
    m_progress->setTextVisible(false);
    words->addWidget(m_progress);
    row->addLayout(words, 1);
    m_result->setMinimumHeight(theme().px(64));
    bind(u"Label4Total"_s, m_resultLine, [this] { return m_page.Label4Total.text; });
    bind(u"Label4Where"_s, m_resultWhere, [this] { return m_page.Label4Where.text; });
    bindHidden(u"Label4Work"_s, m_page.Label4Work);
    return m_result;
}

void SpltFormView::makeBars() {
    frame().addSecondaryAction(button(u"Image3"_s, m_page.Image3, Role::Secondary, [this] { m_page.Image3_Click(); }));
    frame().addMainAction(button(
        u"Command15"_s, m_page.Command15, Role::Danger, [this] { m_page.Command15_Click(); }, u"stop"_s));
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
