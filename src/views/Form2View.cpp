#include "views/Form2View.h"

#include "common/DrivePathText.h"
#include "views/Cards.h"
#include "views/Gauge.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

Form2View::Form2View(Form2& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page) {
    frame().steps().setStep(OrderStep::Preparing);
    bindHidden(u"Label1"_s, page.Label1);

    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(28));
    auto* column = new QVBoxLayout;
    column->setSpacing(theme.px(12));
    column->addStretch(1);
    m_gauge = new Gauge(theme, this);
    column->addWidget(m_gauge, 6, Qt::AlignCenter);
    auto* progress = label(u"Label4Progress"_s, page.Label4Progress, "title");
    progress->setAlignment(Qt::AlignCenter);
    column->addWidget(progress);
    auto* picture = label(u"Label4Picture"_s, page.Label4Picture, "muted");
    picture->setAlignment(Qt::AlignCenter);
    column->addWidget(picture);
    m_trouble = new QFrame(this);
    setRole(m_trouble, "notice");
    auto* trouble = new QVBoxLayout(m_trouble);
    trouble->setContentsMargins(theme.px(18), theme.px(12), theme.px(18), theme.px(12));
    trouble->addWidget(label(u"Label4fail"_s, page.Label4fail, "strong"));
    trouble->addWidget(label(u"Label4removed"_s, page.Label4removed, "strong"));
    m_removed = new QListWidget(m_trouble);
    m_removed->setFocusPolicy(Qt::NoFocus);
    m_removed->setMaximumHeight(theme.px(110));
    bindList(u"List4removed"_s, page.List4removed, m_removed, [](const QString& path) { return LeafName(path); });
    trouble->addWidget(m_removed);
    column->addWidget(m_trouble);
    column->addStretch(1);
    auto* keep = new QFrame(this);
    setRole(keep, "card");
    auto* keepRow = new QHBoxLayout(keep);
    keepRow->setContentsMargins(theme.px(20), theme.px(14), theme.px(20), theme.px(14));
    keepRow->setSpacing(theme.px(16));
    auto* sign = new QLabel(keep);
    sign->setPixmap(theme.icon(u"info"_s, theme.px(34), Theme::Colour::Primary));
    keepRow->addWidget(sign);
    auto* words = new QVBoxLayout;
    words->setSpacing(0);
    words->addWidget(label(u"Label6"_s, page.Label6));
    words->addWidget(label(u"Label10"_s, page.Label10, "strong"));
    keepRow->addLayout(words, 1);
    column->addWidget(keep);
    row->addLayout(column, 3);

    auto* side = new QVBoxLayout;
    side->setSpacing(theme.px(12));
    m_sheetCard = new QFrame(this);
    setRole(m_sheetCard, "card");
    auto* sheet = new QVBoxLayout(m_sheetCard);
    sheet->setContentsMargins(theme.px(16), theme.px(12), theme.px(16), theme.px(16));
    sheet->addWidget(label(u"Picture5Title"_s, page.Picture5, "smallMuted"));
    m_sheet = new PictureBox(theme, m_sheetCard);
    m_sheet->setMinimumHeight(theme.px(150));
    bind(u"Picture5"_s, m_sheet, page.Picture5);
    sheet->addWidget(m_sheet, 1);
    side->addWidget(m_sheetCard, 3);
    m_listCard = new QFrame(this);
    setRole(m_listCard, "card");
    auto* listColumn = new QVBoxLayout(m_listCard);
    listColumn->setContentsMargins(theme.px(16), theme.px(12), theme.px(16), theme.px(16));
    m_list = new QListWidget(m_listCard);
    connect(m_list, &QListWidget::itemClicked, this,
            [this](QListWidgetItem* item) { m_page.List1_Click(m_list->row(item)); });
    connect(m_list, &QListWidget::itemActivated, this,
            [this](QListWidgetItem* item) { m_page.List1_Click(m_list->row(item)); });
    bindList(u"List1"_s, page.List1, m_list, [](const QString& line) { return LeafName(line); });
    listColumn->addWidget(m_list, 1);
    listColumn->addWidget(button(
        u"Command1"_s, page.Command1, Role::Plain, [this] { m_page.Command1_Click(); }, u"trash"_s));
    side->addWidget(m_listCard, 4);
    row->addLayout(side, 2);
    frame().content()->addLayout(row, 1);

    frame().addHeaderAction(button(
        u"Command7"_s, page.Command7, Role::Quiet, [this] { m_page.Command7_Click(); }, u"exit"_s));
    m_start = button(u"Command3"_s, page.Command3, Role::Main, [this] { m_page.Command3_Click(); });
    frame().addMainAction(m_start);
    m_total = makeLabel(this, "large");
    m_total->setWordWrap(false);
    frame().addStatus(m_total);
    bind(u"Label5"_s, m_total, [this] { return m_page.Label5.text; });
    bindHidden(u"Label16"_s, page.Label16);
    bindHidden(u"Label17"_s, page.Label17);
    bindHidden(u"Command4"_s, page.Command4);
    bindHidden(u"Command5"_s, page.Command5);
    bindHidden(u"Command6"_s, page.Command6);
    bindHidden(u"Command8"_s, page.Command8);
    bindList(u"List4fail"_s, page.List4fail);
    start();
}

QWidget* Form2View::firstFocus() const {
    return m_start;
}

void Form2View::render() {
    frame().setTitle(m_page.Label1.text);
    const int all = m_page.progressMaximum;
    const double share = all > 0 ? static_cast<double>(m_page.progressValue) / all : 0;
    m_gauge->show(share, QString::number(m_page.progressValue),
                  all > 0 ? wording(u"מתוך %1"_s, u"of %1"_s).arg(all) : QString());
    m_gauge->setAccessibleName(m_page.Label4Progress.text.isEmpty() ? m_page.Label1.text : m_page.Label4Progress.text);
    m_total->setVisible(!m_page.Label5.text.isEmpty());
    m_total->setText(wording(u"תמונות להדפסה: %1"_s, u"Prints: %1"_s).arg(m_page.Label5.text));
    m_sheet->setPicture(m_page.Picture5Image.image());
    m_sheetCard->setVisible(m_page.Picture5.visible && !m_page.Picture5Image.isNull());
    m_trouble->setVisible(m_page.Label4fail.visible || m_page.Label4removed.visible);
    speak(m_removed, m_page.Label4removed.text);
    speak(m_list, wording(u"התמונות שבהזמנה"_s, u"The pictures of the order"_s));
    speak(m_sheet, m_page.Picture5.text);
    m_removed->setVisible(!m_page.List4removed.isEmpty());
    m_listCard->setVisible(!m_page.preparing && !m_page.List1.isEmpty());
    if (m_page.preparing)
        m_start->hide();
}

} // namespace lumora
