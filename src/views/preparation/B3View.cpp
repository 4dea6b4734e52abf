#include "views/preparation/B3View.h"

#include "views/kit/Cards.h"

#include <QFrame>
#include <QListWidget>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

B3View::B3View(B3& page, const SessionState& state, const Theme& theme)
    : PreparationView(page, state, theme, {u"Label1"_s, page.controls().Label1}, {u"Label2"_s, page.controls().Label2})
    , m_page(page) {
    bindHidden(u"Label4Title"_s, page.controls().Label4Title);
    const Card pictureCard = addCard(3);
    m_pictureCard = pictureCard.frame;
    m_picture = new PictureBox(theme, m_pictureCard);
    m_picture->setMinimumHeight(theme.px(150));
    bind(u"Picture3"_s, m_picture, [this] { return m_page.controls().Label4Picture.text; });
    pictureCard.column->addWidget(m_picture, 1);
    addSheet(3);
    const Card listCard = addCard(3);
    m_listCard = listCard.frame;
    // To look at: the picture in work is the marked one.
    m_list = new QListWidget(m_listCard);
    m_list->setFocusPolicy(Qt::NoFocus);
    m_list->setSelectionMode(QAbstractItemView::SingleSelection);
    m_list->setAttribute(Qt::WA_TransparentForMouseEvents);
    bindList(u"List2"_s, page.controls().List2, m_list);
    listCard.column->addWidget(m_list, 1);
    bindList(u"List1"_s, page.controls().List1);

    frame().addHeaderAction(button(
        u"Command7"_s, page.controls().Command7, Role::Quiet, [this] { m_page.Command7_Click(); }, u"exit"_s));
    frame().addHeaderAction(button(
        u"Command2"_s, page.controls().Command2, Role::Quiet, [this] { m_page.Command2_Click(); }, u"exit"_s));
    m_start = button(u"Command5"_s, page.controls().Command5, Role::Main, [this] { m_page.Command5_Click(); });
    frame().addMainAction(m_start);
    bindHidden(u"Command1"_s, page.controls().Command1);
    start();
}

QWidget* B3View::firstFocus() const {
    return m_start;
}

void B3View::render() {
    renderProgress(m_page.controls().Label4Title.text);
    m_picture->setPicture(m_page.controls().Picture3.image());
    m_pictureCard->setVisible(m_page.isPrintShown());
    speak(m_picture, m_page.controls().Label4Picture.text.isEmpty() ? m_page.controls().Label4Progress.text
                                                                    : m_page.controls().Label4Picture.text);
    speak(m_list, m_page.listText());
    m_listCard->setVisible(!m_page.controls().List2.isEmpty());
    if (auto* inWork = m_list->currentItem())
        m_list->scrollToItem(inWork);
}

} // namespace lumora
