#include "views/preparation/Form2View.h"

#include "common/DrivePathText.h"

#include <QFrame>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

Form2View::Form2View(Form2& page, const SessionState& state, const Theme& theme)
    : PreparationView(page, state, theme, {u"Label6"_s, page.controls().Label6},
                      {u"Label10"_s, page.controls().Label10})
    , m_page(page) {
    bindHidden(u"Label1"_s, page.controls().Label1);
    troubleColumn()->addWidget(label(u"Label4removed"_s, page.controls().Label4removed, "strong"));
    m_removed = new QListWidget(trouble());
    m_removed->setFocusPolicy(Qt::NoFocus);
    m_removed->setMaximumHeight(theme.px(110));
    bindList(u"List4removed"_s, page.controls().List4removed, m_removed,
             [](const QString& path) { return LeafName(path); });
    troubleColumn()->addWidget(m_removed);

    addSheet(3);
    const Card listCard = addCard(4);
    m_listCard = listCard.frame;
    m_list = new QListWidget(m_listCard);
    connect(m_list, &QListWidget::itemClicked, this,
            [this](QListWidgetItem* item) { m_page.List1_Click(m_list->row(item)); });
    connect(m_list, &QListWidget::itemActivated, this,
            [this](QListWidgetItem* item) { m_page.List1_Click(m_list->row(item)); });
    bindList(u"List1"_s, page.controls().List1, m_list, [](const QString& line) { return LeafName(line); });
    listCard.column->addWidget(m_list, 1);
    listCard.column->addWidget(button(
        u"Command1"_s, page.controls().Command1, Role::Plain, [this] { m_page.Command1_Click(); }, u"trash"_s));

    frame().addHeaderAction(button(
        u"Command7"_s, page.controls().Command7, Role::Quiet, [this] { m_page.Command7_Click(); }, u"exit"_s));
    m_start = button(u"Command3"_s, page.controls().Command3, Role::Main, [this] { m_page.Command3_Click(); });
    frame().addMainAction(m_start);
    bindHidden(u"Command4"_s, page.controls().Command4);
    bindHidden(u"Command5"_s, page.controls().Command5);
    bindHidden(u"Command6"_s, page.controls().Command6);
    bindHidden(u"Command8"_s, page.controls().Command8);
    start();
}

QWidget* Form2View::firstFocus() const {
    return m_start;
}

void Form2View::render() {
    renderProgress(m_page.controls().Label1.text);
    trouble()->setVisible(m_page.isTroubleShown());
    speak(m_removed, m_page.controls().Label4removed.text);
    speak(m_list, m_page.listText());
    m_removed->setVisible(!m_page.controls().List4removed.isEmpty());
    m_listCard->setVisible(m_page.isListShown());
}

} // namespace lumora
