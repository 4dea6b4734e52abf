#include "views/preparation/B3View.h"

#include "views/kit/CardButtons.h"

#include <QListWidget>

namespace lumora {

using namespace Qt::StringLiterals;

B3View::B3View(B3& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme, page.controls().Label4Title, page.controls().Label1, page.controls().Label2) {
    m_picture = pictureBox();
    bind(u"Picture3"_s, m_picture, [this] { return c.Label4Picture.text; });
    const Card picture = makeCard("card", Pad::Slim);
    picture.column->addWidget(m_picture, 1);
    m_pictureCard = picture.frame;
    // The picture in work is the marked one.
    m_list = listing(c.List2, [](const QString& name) { return fromLeft(name.trimmed()); });
    m_list->setAttribute(Qt::WA_TransparentForMouseEvents);
    const Card names = makeCard("card", Pad::Slim);
    names.column->addWidget(m_list, 1);
    m_listCard = names.frame;
    add(*side(), {{m_pictureCard, 3}, {sheet(), 3}, {m_listCard, 3}});

    frame().addHeaderActions({button(c.Command7, Role::Quiet, &B3::Command7_Click, u"exit"_s),
                              button(c.Command2, Role::Quiet, &B3::Command2_Click, u"exit"_s)});
    m_start = button(c.Command5, Role::Main, &B3::Command5_Click);
    frame().addMainAction(m_start);
    start();
}

bool B3View::leave() {
    m_page.Command7_Click();
    return true;
}

void B3View::render() {
    PreparationView::render();
    m_picture->setPicture(c.Picture3.image());
    m_pictureCard->setVisible(m_page.isPrintShown());
    speak(m_picture, c.Label4Picture.text.isEmpty() ? c.Label4Progress.text : c.Label4Picture.text);
    speak(m_list, m_page.listText());
    m_listCard->setVisible(!c.List2.isEmpty());
    if (auto* inWork = m_list->currentItem())
        m_list->scrollToItem(inWork);
}

} // namespace lumora
