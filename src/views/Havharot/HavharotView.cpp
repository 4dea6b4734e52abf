#include "views/Havharot/HavharotView.h"

#include <QScrollArea>

namespace lumora {

using namespace Qt::StringLiterals;

HavharotView::HavharotView(Havharot& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    frame().steps().setStep(OrderStep::Details);
    bindHidden(u"Title"_s, page.Title);
    QLabel* text = label(u"Label1"_s, page.Label1, "body");
    text->setAlignment(Qt::AlignTop | Qt::AlignLeading);
    auto* scroll = new QScrollArea(this);
    scroll->setWidgetResizable(true);
    scroll->setFrameShape(QFrame::NoFrame);
    scroll->setFocusPolicy(Qt::NoFocus);
    scroll->setWidget(text);
    const Card card = makeCard("card", Pad::Wide, Space::Wide);
    add(*card.column,
        {{scroll, 1},
         inRow(Space::Normal, {button(u"Command3"_s, page.Command3, Role::Plain, &Havharot::Command3_Click, u"mail"_s),
                               button(u"Command4"_s, page.Command4, Role::Plain, &Havharot::Command4_Click, u"gear"_s),
                               Item::room()})});
    frame().content()->addWidget(card.frame, 1);
    frame().addHeaderAction(button(u"Command2"_s, page.Command2, Role::Quiet, &Havharot::Command2_Click, u"exit"_s));
    m_goOn = button(u"Command1"_s, page.Command1, Role::Main, &Havharot::Command1_Click);
    frame().addMainAction(m_goOn);
    start();
}

QWidget* HavharotView::firstFocus() const {
    return m_goOn;
}

void HavharotView::render() {
    frame().setTitle(m_page.Title.text);
}

} // namespace lumora
